// SPDX-License-Identifier: Apache-2.0
// Supplementary services.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module ss_module();

// Its tables, one a file.
std::span<const Verb> ss_verbs();

} // namespace imsctl
