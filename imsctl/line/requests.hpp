// SPDX-License-Identifier: Apache-2.0
// The shapes that most requests and replies have.
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

using PlainRequest = int (*)(ims_h, ims_response_cb, void *);
using NumberRequest = int (*)(ims_h, std::int32_t, ims_response_cb, void *);

// Without arguments.
Action plain(PlainRequest request, const Decode &decode = nullptr);

// About a session, and nothing else.
Action on_session(Arguments &arguments, const Fitting &fitting, NumberRequest request,
                  const Decode &decode = nullptr);

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

// What a callback's data points to, as a field of this name; nothing when it is NULL.
Decode number_as(std::string_view name);
Decode flag_as(std::string_view name);

// Here the number stands in the pointer's place.
Decode number_in_place_as(std::string_view name);

} // namespace imsctl
