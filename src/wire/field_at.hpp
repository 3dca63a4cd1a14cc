// SPDX-License-Identifier: Apache-2.0
// A field of a record by its offset, for the code that runs over tables of fields.
#pragma once

#include <cstddef>

namespace ims {

template <typename T>
T &at(void *record, std::size_t offset) noexcept {
    return *reinterpret_cast<T *>(static_cast<std::byte *>(record) + offset);
}

template <typename T>
const T &at(const void *record, std::size_t offset) noexcept {
    return *reinterpret_cast<const T *>(static_cast<const std::byte *>(record) + offset);
}

} // namespace ims
