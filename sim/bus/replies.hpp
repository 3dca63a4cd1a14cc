// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/bus/wire.hpp"

#include <vector>

// The shapes that replies have.
namespace sim {

// The commonest: the result alone.
inline Answer<Variant> result_of(const Status &status) {
    return status ? Answer<Variant>(wire::pack(Result::kOk)) : status.refusal();
}

template <typename T>
Answer<Variant> result_with(const Answer<T> &answer) {
    return answer ? Answer<Variant>(wire::pack(Result::kOk, *answer)) : answer.refusal();
}

// The result, how many entries there are, and a dictionary for each.
template <typename T, typename Fill>
Variant list_of(const std::vector<T> &entries, Fill fill) {
    return wire::pack(Result::kOk, static_cast<std::uint32_t>(entries.size()),
                      wire::dictionaries(entries, fill));
}

} // namespace sim
