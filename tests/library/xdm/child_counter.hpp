// SPDX-License-Identifier: Apache-2.0
// Counts how often a child of a D-Bus value is taken out: the work of reading, without a clock.
#pragma once

#include <cstddef>

namespace test {

std::size_t children_taken();

} // namespace test
