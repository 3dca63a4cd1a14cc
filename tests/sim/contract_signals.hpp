// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>
#include <string_view>

namespace sim::test {

// The type that the contract's files give to a signal; empty when they have no such signal.
std::string contract_type_of_signal(std::string_view member);

} // namespace sim::test
