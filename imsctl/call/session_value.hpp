// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "imsctl/line/requests.hpp"

namespace imsctl {

using PairRequest = int (*)(ims_h, const ims_call_pair_info_s *, ims_response_cb, void *);

// About a session, with one value.
Action on_session(const SessionChoice &session, const Argument<std::int32_t> &value,
                  PairRequest request, const Decode &decode = nullptr);

} // namespace imsctl
