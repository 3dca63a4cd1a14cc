// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tools/imsctl/verbs.hpp"

namespace imsctl {

Action prepare_sms_send(Arguments &arguments);

} // namespace imsctl
