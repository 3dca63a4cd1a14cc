// SPDX-License-Identifier: Apache-2.0
#include "imsctl/call/session_value.hpp"

namespace imsctl {

Action on_session(const SessionChoice &session, const Argument<std::int32_t> &value,
                  PairRequest request, const Decode &decode) {
    return [=](Invocation &run) {
        const ims_call_pair_info_s pair{session.resolve(run.client()), *value};
        run.request(session_id_field(pair.session_id), with_record(request, pair), decode);
    };
}

} // namespace imsctl
