// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "imsctl/line/verbs.hpp"

namespace imsctl {

Action prepare_ptt_file_send(Arguments &arguments);

// The reply to a request about a file transfer.
Fields decode_transfer_result(void *data);

} // namespace imsctl
