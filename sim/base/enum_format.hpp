// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <type_traits>

namespace sim {

// Texts show an enumerator's number, which is what an application sees.
template <typename T>
requires std::is_enum_v<T>
constexpr auto format_as(T value) {
    return static_cast<std::underlying_type_t<T>>(value);
}

} // namespace sim
