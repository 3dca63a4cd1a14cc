// SPDX-License-Identifier: Apache-2.0
// The shapes that most requests have, as actions; and what their replies carry.
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

using PlainRequest = int (*)(ims_h, ims_response_cb, void *);
using NumberRequest = int (*)(ims_h, std::int32_t, ims_response_cb, void *);
using PairRequest = int (*)(ims_h, const ims_call_pair_info_s *, ims_response_cb, void *);

// Without arguments.
Action plain(PlainRequest request, Decode decode = nullptr);

// About a session, and nothing else.
Action on_session(Arguments &arguments, const Fitting &fitting, NumberRequest request,
                  Decode decode = nullptr);

// About a session, with one value.
Action on_session(SessionChoice session, Argument<std::int32_t> value, PairRequest request,
                  Decode decode = nullptr);

// With one value that is no session.
Action with_number(Argument<std::int32_t> value, NumberRequest request);

// A record handed to the request that takes it.
template <class Record>
Start with_record(int (*request)(ims_h, const Record *, ims_response_cb, void *),
                  const Record &record) {
    return [request, &record](ims_h handle, ims_response_cb callback, void *user_data) {
        return request(handle, &record, callback, user_data);
    };
}

Fields session_id_field(std::int32_t session_id);

// What a callback's data points to; nothing when it is NULL.
Fields decode_session_id(void *data);
Fields decode_max_volume(void *data);
Fields decode_zoom(void *data);
Fields decode_muted(void *data);
Fields decode_in_epdg_call(void *data);

// Here the number stands in the pointer's place.
Fields decode_session_id_in_place(void *data);
Fields decode_value_in_place(void *data);

// The text in it is taken over and released.
Fields decode_change_result(void *data);
Fields decode_tty_mode(void *data);

} // namespace imsctl
