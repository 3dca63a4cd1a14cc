// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/ptt/values.hpp"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string_view>

// The sets of four integers: what they may hold and what follows from them.
namespace sim {

constexpr FourIntegers or_usual(const FourIntegers &media) {
    return media == FourIntegers{} ? kUsualMedia : media;
}

constexpr FourIntegers common_media(const FourIntegers &a, const FourIntegers &b) {
    FourIntegers common{};
    for (std::size_t i = 0; i < common.size(); ++i)
        common[i] = a[i] & b[i];
    return common;
}

inline std::optional<Refusal> bad_media(const FourIntegers &media) {
    for (const std::int32_t medium : media)
        if (medium != 0 && medium != 1)
            return refuse(Result::kInvalidArgument,
                          "a media set holds 0 or 1 for voice, video, messages and files, not {}",
                          medium);
    return std::nullopt;
}

inline std::optional<Refusal> bad_seconds(std::int32_t seconds, std::string_view what) {
    if (seconds >= 0 && seconds <= kPttLongestTime)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "{} is 0 to {} seconds, not {}", what, kPttLongestTime,
                  seconds);
}

inline std::optional<Refusal> bad_priority(std::int32_t priority) {
    if (priority >= 0 && priority <= kPttTopPriority)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "a priority is 0 to {}, not {}", kPttTopPriority,
                  priority);
}

inline std::optional<Refusal> bad_terms(const FourIntegers &terms) {
    if (auto refusal = bad_priority(terms[kPttPriority]))
        return refusal;
    if (terms[kPttDoNotWait] != 0 && terms[kPttDoNotWait] != 1)
        return refuse(Result::kInvalidArgument,
                      "the second of the floor terms is 0 (wait for the floor) or 1 (do not), "
                      "not {}",
                      terms[kPttDoNotWait]);
    return bad_seconds(terms[kPttTalkTime], "the longest talk time");
}

inline std::chrono::seconds seconds_or(std::int32_t seconds, std::int32_t usual) {
    return std::chrono::seconds(seconds == 0 ? usual : seconds);
}

} // namespace sim
