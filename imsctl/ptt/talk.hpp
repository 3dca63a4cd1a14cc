// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

// Asks for the floor, or gives it back.
using FloorRequest = int (*)(ims_h, const ims_poc_floor_s *, ims_response_cb, void *);

Action prepare_ptt_talk(Arguments &arguments);

} // namespace imsctl
