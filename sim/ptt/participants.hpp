// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/answers.hpp"
#include "sim/ptt/model.hpp"

namespace sim {

// A push-to-talk call as those who ask about its participants are told of it.
ParticipantInfo participant_info(const PttRunningCall &call);

} // namespace sim
