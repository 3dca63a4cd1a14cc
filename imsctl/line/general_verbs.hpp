// SPDX-License-Identifier: Apache-2.0
// What is not a request: watching, and shell completion.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Module general_module();

} // namespace imsctl
