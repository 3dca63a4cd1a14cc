// SPDX-License-Identifier: Apache-2.0
// Video telephony.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module vt_module();

// Its tables, one a file.
std::span<const Verb> vt_verbs();

} // namespace imsctl
