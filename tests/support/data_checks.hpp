// SPDX-License-Identifier: Apache-2.0
// What rows expect of the data that a callback gets.
#pragma once

#include <gtest/gtest.h>

#include <cstdint>

namespace test {

// A number behind a pointer.
template <std::int32_t Number>
void points_to(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_EQ(*static_cast<std::int32_t *>(data), Number);
}

} // namespace test
