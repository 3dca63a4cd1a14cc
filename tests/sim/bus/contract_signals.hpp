// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"

namespace sim::test {

// The contract's files have a signal of this name and type.
void expect_as_in_contract(const Signal &signal);

} // namespace sim::test
