// SPDX-License-Identifier: Apache-2.0
#include "sim/base/number_plan.hpp"

#include <algorithm>
#include <array>

namespace sim {

namespace {

constexpr std::array<std::string_view, 2> kEmergencyNumbers = {"112", "911"};
constexpr std::size_t kMaxDigits = 20;

constexpr std::string_view kDigits = "0123456789";
constexpr std::string_view kSeparators = " -.()";

} // namespace

bool is_emergency(std::string_view number) {
    return std::ranges::any_of(kEmergencyNumbers,
                               [&](std::string_view one) { return same_number(one, number); });
}

Answer<std::string> parse_number(std::string_view text) {
    std::string_view rest = text;
    if (rest.starts_with("tel:"))
        rest.remove_prefix(4);
    else if (rest.starts_with("sip:")) {
        rest.remove_prefix(4);
        const auto at = rest.find('@');
        if (at == std::string_view::npos || at + 1 == rest.size())
            return refuse(Result::kInvalidArgument, "\"{}\" lacks the host: write sip:NUMBER@HOST",
                          text);
        rest = rest.substr(0, at);
    }
    rest = rest.substr(0, rest.find(';'));

    std::string number;
    for (const char letter : rest) {
        if (kDigits.find(letter) != std::string_view::npos || (letter == '+' && number.empty()))
            number += letter;
        else if (letter == '*' || letter == '#')
            return refuse(Result::kInvalidArgument,
                          "\"{}\" is a service code, not a number: send it with SendUssd", text);
        else if (kSeparators.find(letter) == std::string_view::npos)
            return refuse(Result::kInvalidArgument,
                          "\"{}\" is no number: write digits with an optional leading +, "
                          "tel:NUMBER or sip:NUMBER@HOST",
                          text);
    }
    const auto digits = number.size() - (number.starts_with('+') ? 1 : 0);
    if (digits == 0)
        return refuse(Result::kInvalidArgument, "the called number \"{}\" has no digits", text);
    if (digits > kMaxDigits)
        return refuse(Result::kInvalidArgument, "\"{}\" has {} digits; {} are the most", text,
                      digits, kMaxDigits);
    return number;
}

std::string to_uri(std::string_view number) {
    return fmt::format("tel:{}", number);
}

bool same_number(std::string_view a, std::string_view b) {
    const auto bare = [](std::string_view number) {
        return number.substr(number.starts_with('+') ? 1 : 0);
    };
    return bare(a) == bare(b);
}

bool same_user(std::string_view a, std::string_view b) {
    if (a == b)
        return true;
    const auto number = parse_number(a);
    const auto other = parse_number(b);
    return number && other && same_number(*number, *other);
}

std::string NumberPlan::default_slot_number(int slot) {
    return fmt::format("+155501{:02}", slot);
}

const std::string &NumberPlan::number_of(int slot) const {
    return slot_numbers_[slot];
}

std::optional<int> NumberPlan::slot_of(std::string_view number) const {
    for (int slot = 0; slot < slots(); ++slot)
        if (same_number(number_of(slot), number))
            return slot;
    return std::nullopt;
}

} // namespace sim
