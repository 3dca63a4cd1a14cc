// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

Action prepare_ptt_talk(Arguments &arguments);

} // namespace imsctl
