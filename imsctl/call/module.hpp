// SPDX-License-Identifier: Apache-2.0
// Voice and video calls.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module call_module();

// Its tables, one a file.
std::span<const Verb> call_verbs();
std::span<const Verb> media_verbs();
std::span<const Verb> conference_verbs();
std::span<const Verb> access_verbs();
std::span<const EventRow> call_events();

} // namespace imsctl
