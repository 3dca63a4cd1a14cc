// SPDX-License-Identifier: Apache-2.0
// Settings sets to and from files.
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

Action prepare_export(Arguments &arguments);
Action prepare_import(Arguments &arguments);

} // namespace imsctl
