// SPDX-License-Identifier: Apache-2.0
// Records in which every field has a value of its own, and the dictionaries that they are on the
// wire.
#pragma once

#include "ims.h"
#include "tests/library/settings/keys.hpp"
#include "tests/support/variant.hpp"

#include <cstdint>
#include <string>

namespace test {

// What the key at this position (from 1) holds.
std::int32_t sample_number(std::size_t position);
const char *sample_text(std::size_t position);
bool sample_flag(std::size_t position);

// The fields of a record by their place, whatever their names are.
template <typename T>
T &field_at(void *record, std::size_t offset) {
    return *reinterpret_cast<T *>(static_cast<char *>(record) + offset);
}

// Fills a record that lies zeroed; the texts are not to be freed.
void fill(void *record, std::span<const KeyRow> keys);

// What the service sends for one key.
Variant sent_value(const KeyRow &row, std::size_t position);

// What the service is sent: the text of "(a{sv})", in wire order.
enum class Direction { kUpdate, kAdd };
std::string written_settings(Direction direction);
std::string written_profile();

} // namespace test
