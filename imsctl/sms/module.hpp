// SPDX-License-Identifier: Apache-2.0
// Short messages.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module sms_module();

// Its tables, one a file.
std::span<const Verb> sms_verbs();
std::span<const EventRow> sms_events();

} // namespace imsctl
