// SPDX-License-Identifier: Apache-2.0
// A caller's record between bytes that nobody may touch.
#pragma once

#include <algorithm>
#include <cstring>
#include <iterator>
#include <string>

namespace test {

template <typename Record>
struct Guarded {
    // Every byte of the record too, so that nothing uninitialised decides a test.
    explicit Guarded(unsigned char fill = 0x5A) {
        std::memset(before, kGuard, sizeof before);
        std::memset(static_cast<void *>(&record), fill, sizeof record);
        std::memset(after, kGuard, sizeof after);
    }

    bool is_intact() const {
        const auto untouched = [](unsigned char byte) { return byte == kGuard; };
        return std::all_of(std::begin(before), std::end(before), untouched) &&
               std::all_of(std::begin(after), std::end(after), untouched);
    }

    // The record's bytes, for "nothing was written".
    std::string image() const { return {reinterpret_cast<const char *>(&record), sizeof record}; }

    static constexpr unsigned char kGuard = 0xA5;

    unsigned char before[64];
    Record record;
    unsigned char after[64];
};

} // namespace test
