// SPDX-License-Identifier: Apache-2.0
// Group documents.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module group_module();

// Its tables, one a file.
std::span<const Verb> group_verbs();
std::span<const Verb> group_set_verbs();

} // namespace imsctl
