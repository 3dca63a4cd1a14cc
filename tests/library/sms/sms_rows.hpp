// SPDX-License-Identifier: Apache-2.0
// The short-message module's requests, one row each.
#pragma once

#include "tests/support/request_row.hpp"

#include <vector>

namespace test {

std::vector<RequestRow> sms_request_rows();

} // namespace test
