// SPDX-License-Identifier: Apache-2.0
// The keys of the settings and profile dictionaries as the service knows them, in wire order:
// stated here once more, so that the library's own table has something to be held against.
#pragma once

#include <cstddef>
#include <span>

namespace test {

struct KeyRow {
    const char *key;
    char type; // 'i', 's', 'b'; 't' is read as "s" into a timer, and written as "i"
    std::size_t offset;
};

std::span<const KeyRow> settings_keys();
std::span<const KeyRow> profile_keys();

} // namespace test
