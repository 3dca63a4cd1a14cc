// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/values.hpp"

#include "imsctl/output/values.hpp"

#include <fmt/format.h>
#include <fmt/ranges.h>
#include <glib.h>
#include <limits>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

bool is_secret(std::string_view key) {
    return key.find("password") != std::string_view::npos;
}

Value checked_text(const std::string &text) {
    // The records' texts end at a zero, and the bus carries UTF-8 only.
    if (text.find('\0') != std::string::npos)
        throw WrongValue("a text cannot hold a zero character");
    if (!g_utf8_validate(text.data(), static_cast<gssize>(text.size()), nullptr))
        throw WrongValue("this is not valid UTF-8"); // The value itself may be a secret.
    return text;
}

bool fits(const Json &json) {
    using Limits = std::numeric_limits<std::int32_t>;
    if (json.is_number_unsigned())
        return json.get<std::uint64_t>() <= static_cast<std::uint64_t>(Limits::max());
    return json.is_number_integer() && json.get<std::int64_t>() >= Limits::min() &&
           json.get<std::int64_t>() <= Limits::max();
}

WrongValue no_number(const std::string &shown) {
    return WrongValue(fmt::format("{} is not a whole number of 32 bits", shown));
}

WrongValue no_flag(const std::string &shown) {
    return WrongValue(fmt::format("{} is neither true nor false", shown));
}

// A list or an object is named, not repeated.
std::string shown_json(const Json &json) {
    if (json.is_structured())
        return fmt::format("an {}", json.type_name());
    return json.is_string() ? quote(json.get<std::string>()) : dump(json);
}

} // namespace

std::string_view to_string(KeyType type) {
    switch (type) {
    case KeyType::kNumber:
        return "number";
    case KeyType::kFlag:
        return "boolean";
    case KeyType::kText:
        return "text";
    }
    return "unknown";
}

Value value_from_text(KeyType type, const std::string &text) {
    switch (type) {
    case KeyType::kNumber:
        if (const auto number = parse_number(text))
            return std::int64_t{*number};
        throw no_number(quote(text));
    case KeyType::kFlag:
        if (text == "true" || text == "false")
            return text == "true";
        throw no_flag(quote(text));
    case KeyType::kText:
        break;
    }
    return checked_text(text);
}

Value value_from_json(KeyType type, const Json &json) {
    switch (type) {
    case KeyType::kNumber:
        if (fits(json))
            return json.get<std::int64_t>();
        throw no_number(shown_json(json));
    case KeyType::kFlag:
        if (json.is_boolean())
            return json.get<bool>();
        throw no_flag(shown_json(json));
    case KeyType::kText:
        break;
    }
    if (!json.is_string()) // The value itself may be a secret.
        throw WrongValue(fmt::format("this is not a text but of type {}", json.type_name()));
    return checked_text(json.get<std::string>());
}

Value empty_value(KeyType type) {
    switch (type) {
    case KeyType::kNumber:
        return std::int64_t{0};
    case KeyType::kFlag:
        return false;
    case KeyType::kText:
        break;
    }
    return std::string();
}

std::string Shown::value(std::string_view key, const Value &value) const {
    const auto *text = std::get_if<std::string>(&value);
    const bool hidden = !with_secrets_ && is_secret(key) && text != nullptr && !text->empty();
    return hidden ? "********" : to_text(value);
}

std::string Shown::fields(const Fields &fields) const {
    std::vector<std::string> lines;
    for (const Field &field : fields)
        lines.push_back(fmt::format("{}={}", field.name, value(field.name, field.value)));
    return fmt::format("{}", fmt::join(lines, "\n"));
}

std::string Shown::changes(const Changes &changes, std::string_view separator) const {
    std::vector<std::string> lines;
    for (const Change &change : changes)
        lines.push_back(fmt::format("{}: {} {} {}", change.key, value(change.key, change.from),
                                    separator, value(change.key, change.to)));
    return fmt::format("{}", fmt::join(lines, "\n"));
}

Json to_json(const Changes &changes, const char *from, const char *to) {
    Json object = Json::object();
    for (const Change &change : changes)
        object[std::string(change.key)] = {{from, to_json(change.from)}, {to, to_json(change.to)}};
    return object;
}

} // namespace imsctl
