// SPDX-License-Identifier: Apache-2.0
// The push-to-talk module's requests, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

// Calls and the floor.
std::vector<RequestRow> poc_call_rows();
// Recording, messages, file transfer, keep-alive.
std::vector<RequestRow> poc_message_rows();

// All of them.
inline std::vector<RequestRow> poc_request_rows() {
    return requests_of({.unit = "ims_poc.cpp", .interface = "org.kelvo.ims.Poc"},
                       joined({poc_call_rows(), poc_message_rows()}));
}

} // namespace test
