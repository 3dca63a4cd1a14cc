// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstddef>
#include <tuple>
#include <type_traits>
#include <utility>

// The members of a record, in their order, without naming them.
namespace sim {

namespace members {

// Stands for a member of any type where only the number of members is asked for.
struct Anything {
    template <typename T>
    operator T() const;
};

template <std::size_t>
using One = Anything;

template <typename Record, std::size_t... kIndices>
constexpr bool can_have(std::index_sequence<kIndices...>) {
    return requires {
        Record{One<kIndices>()...};
    };
}

inline constexpr std::size_t kMost = 14;

template <typename Record, std::size_t kCount = kMost>
constexpr std::size_t count() {
    static_assert(!can_have<Record>(std::make_index_sequence<kMost + 1>()), "a longer record");
    if constexpr (can_have<Record>(std::make_index_sequence<kCount>()))
        return kCount;
    else
        return count<Record, kCount - 1>();
}

} // namespace members

template <typename... Ts>
constexpr auto members_of(std::tuple<Ts...> &tuple) {
    return std::apply([](auto &...members) { return std::tie(members...); }, tuple);
}
template <typename... Ts>
constexpr auto members_of(const std::tuple<Ts...> &tuple) {
    return std::apply([](auto &...members) { return std::tie(members...); }, tuple);
}

// References to them; an array's members are its elements.
template <typename Record>
requires std::is_aggregate_v<Record>
constexpr auto members_of(Record &record) {
    constexpr std::size_t kCount = members::count<std::remove_const_t<Record>>();
    if constexpr (kCount == 0) {
        return std::tie();
    } else if constexpr (kCount == 1) {
        auto &[a] = record;
        return std::tie(a);
    } else if constexpr (kCount == 2) {
        auto &[a, b] = record;
        return std::tie(a, b);
    } else if constexpr (kCount == 3) {
        auto &[a, b, c] = record;
        return std::tie(a, b, c);
    } else if constexpr (kCount == 4) {
        auto &[a, b, c, d] = record;
        return std::tie(a, b, c, d);
    } else if constexpr (kCount == 5) {
        auto &[a, b, c, d, e] = record;
        return std::tie(a, b, c, d, e);
    } else if constexpr (kCount == 6) {
        auto &[a, b, c, d, e, f] = record;
        return std::tie(a, b, c, d, e, f);
    } else if constexpr (kCount == 7) {
        auto &[a, b, c, d, e, f, g] = record;
        return std::tie(a, b, c, d, e, f, g);
    } else if constexpr (kCount == 8) {
        auto &[a, b, c, d, e, f, g, h] = record;
        return std::tie(a, b, c, d, e, f, g, h);
    } else if constexpr (kCount == 9) {
        auto &[a, b, c, d, e, f, g, h, i] = record;
        return std::tie(a, b, c, d, e, f, g, h, i);
    } else if constexpr (kCount == 10) {
        auto &[a, b, c, d, e, f, g, h, i, j] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j);
    } else if constexpr (kCount == 11) {
        auto &[a, b, c, d, e, f, g, h, i, j, k] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j, k);
    } else if constexpr (kCount == 12) {
        auto &[a, b, c, d, e, f, g, h, i, j, k, l] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j, k, l);
    } else if constexpr (kCount == 13) {
        auto &[a, b, c, d, e, f, g, h, i, j, k, l, m] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j, k, l, m);
    } else {
        auto &[a, b, c, d, e, f, g, h, i, j, k, l, m, n] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j, k, l, m, n);
    }
}

} // namespace sim
