// SPDX-License-Identifier: Apache-2.0
// The push-to-talk module's requests, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

inline constexpr Module kPoc{"ims_poc.cpp", "org.kelvo.ims.Poc"};

// Calls and the floor.
std::vector<RequestRow> poc_call_rows();
// Recording, messages, file transfer, keep-alive.
std::vector<RequestRow> poc_message_rows();

} // namespace test
