// SPDX-License-Identifier: Apache-2.0
// All modules that there are.
#pragma once

#include "imsctl/line/modules.hpp"

namespace imsctl {

Catalogue all_modules();

} // namespace imsctl
