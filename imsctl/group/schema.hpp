// SPDX-License-Identifier: Apache-2.0
// The JSON schema of the group documents that imsctl takes and shows.
#pragma once

#include "imsctl/output/fields.hpp"

namespace imsctl {

Json group_schema();

} // namespace imsctl
