// SPDX-License-Identifier: Apache-2.0
#include "imsctl/registration/summaries.hpp"

#include "imsctl/output/values.hpp"

#include <fmt/format.h>
#include <fmt/ranges.h>

namespace imsctl {
namespace {

constexpr NamedValue kNetworks[] = {{"no network", 0}, {"LTE", 1}};
constexpr NamedValue kUnregisteredReasons[] = {
    {"asked for", 0}, {"under way", 1}, {"flight mode", 2}};
constexpr NamedValue kFeatures[] = {{"voice", 1}, {"video", 2}, {"short messages", 4}, {"USSD", 8}};
constexpr NamedValue kLoginStates[] = {{"logged out", 0}, {"logging in", 1}, {"logged in", 2}};
constexpr std::int64_t kLoggedOut = 0;

// The stand-in's names reach as far as 32 bits do; unsigned values above are shown as they are.
std::string named(NamedValues names, std::int64_t value) {
    for (const NamedValue &each : names)
        if (each.value == value)
            return std::string(each.name);
    return fmt::to_string(value);
}

std::string named(NamedValues names, const Fields &fields, std::string_view name) {
    return named(names, get<std::int64_t>(fields, name));
}

std::string features(std::int64_t bits) {
    std::vector<std::string> parts;
    for (const NamedValue &each : kFeatures) {
        if ((bits & each.value) == 0)
            continue;
        parts.emplace_back(each.name);
        bits &= ~std::int64_t{each.value};
    }
    if (bits != 0)
        parts.push_back(fmt::to_string(bits));
    return parts.empty() ? "nothing" : fmt::format("{}", fmt::join(parts, ", "));
}

} // namespace

std::string summarise_registration(const Fields &fields) {
    if (!get<bool>(fields, "registered"))
        return fmt::format("not registered: {}", named(kUnregisteredReasons, fields, "value_3"));
    return fmt::format("registered over {} for {}", named(kNetworks, fields, "value_1"),
                       features(get<std::int64_t>(fields, "value_2")));
}

std::string summarise_emergency_registration(const Fields &fields) {
    if (!get<bool>(fields, "registered"))
        return fmt::format("not registered for emergency calls: {}",
                           named(kUnregisteredReasons, fields, "value_2"));
    return fmt::format("registered for emergency calls over {}",
                       named(kNetworks, fields, "value_1"));
}

std::string summarise_login(const Fields &fields) {
    std::string state = named(kLoginStates, fields, "value_1");
    if (get<std::int64_t>(fields, "value_1") == kLoggedOut)
        return fmt::format("{}: {}", state, named(kUnregisteredReasons, fields, "value_3"));
    return state;
}

} // namespace imsctl
