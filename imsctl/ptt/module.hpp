// SPDX-License-Identifier: Apache-2.0
// Push-to-talk.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module ptt_module();

// Its tables, one a file.
std::span<const Verb> ptt_call_verbs();
std::span<const Verb> ptt_floor_verbs();
std::span<const Verb> ptt_content_verbs();
std::span<const EventRow> ptt_events();

} // namespace imsctl
