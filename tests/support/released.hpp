// SPDX-License-Identifier: Apache-2.0
// Memory that the library has released. Only AddressSanitizer can tell; without it nothing is
// checked.
#pragma once

#include <gtest/gtest.h>

extern "C" int __asan_address_is_poisoned(const volatile void *address) __attribute__((weak));

namespace test {

inline void expect_released(const void *address) {
    ASSERT_NE(address, nullptr);
    if (__asan_address_is_poisoned) {
        EXPECT_TRUE(__asan_address_is_poisoned(address));
    }
}

} // namespace test
