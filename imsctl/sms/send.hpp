// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

Action prepare_sms_send(Arguments &arguments);

} // namespace imsctl
