// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/fields.hpp"

#include <fmt/format.h>
#include <fmt/ranges.h>
#include <glib.h>
#include <memory>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

template <class... Handlers>
struct Overloaded : Handlers... {
    using Handlers::operator()...;
};
template <class... Handlers>
Overloaded(Handlers...) -> Overloaded<Handlers...>;

std::string base64(const Bytes &bytes) {
    const std::unique_ptr<gchar, decltype(&g_free)> text(
        g_base64_encode(bytes.data(), bytes.size()), g_free);
    return text.get();
}

// Separators would break the line, and format characters could reorder what is shown.
bool is_printable(gunichar character) {
    const GUnicodeType type = g_unichar_type(character);
    return g_unichar_isprint(character) && type != G_UNICODE_LINE_SEPARATOR &&
           type != G_UNICODE_PARAGRAPH_SEPARATOR;
}

std::string escape_character(gunichar character, std::string_view encoded) {
    switch (character) {
    case '\n':
        return "\\n";
    case '\r':
        return "\\r";
    case '\t':
        return "\\t";
    case '\\':
        return "\\\\";
    case '"':
        return "\\\"";
    default:
        break;
    }
    if (is_printable(character))
        return std::string(encoded);
    return character < 0x80 ? fmt::format("\\x{:02x}", character)
                            : fmt::format("\\u{{{:x}}}", character);
}

std::string quote_all(const Texts &texts) {
    std::vector<std::string> parts;
    for (const auto &text : texts)
        parts.push_back(text ? quote(*text) : "-");
    return fmt::format("[{}]", fmt::join(parts, ","));
}

std::string list_all(const std::vector<Fields> &entries) {
    std::vector<std::string> parts;
    parts.reserve(entries.size());
    for (const Fields &fields : entries)
        parts.push_back(fmt::format("{{{}}}", to_text(fields)));
    return fmt::format("[{}]", fmt::join(parts, ","));
}

Json object_of(const Fields &fields) {
    Json object = Json::object();
    add_json(object, fields);
    return object;
}

} // namespace

bool Nested::operator==(const Nested &other) const {
    return fields == other.fields;
}
bool NestedList::operator==(const NestedList &other) const {
    return entries == other.entries;
}
bool Field::operator==(const Field &other) const {
    return name == other.name && value == other.value;
}

std::string escape(std::string_view text) {
    std::string result;
    while (!text.empty()) {
        const gunichar character =
            g_utf8_get_char_validated(text.data(), static_cast<gssize>(text.size()));
        // Zero, too, is reported as invalid here: it ends a text.
        const bool valid = character != static_cast<gunichar>(-1) &&
                           character != static_cast<gunichar>(-2) && character != 0;
        const std::size_t length =
            valid ? static_cast<std::size_t>(g_unichar_to_utf8(character, nullptr)) : 1;
        result += valid ? escape_character(character, text.substr(0, length))
                        : fmt::format("\\x{:02x}", static_cast<std::uint8_t>(text.front()));
        text.remove_prefix(length);
    }
    return result;
}

std::string quote(std::string_view text) {
    return fmt::format("\"{}\"", escape(text));
}

std::string to_text(const Value &value) {
    return std::visit(
        Overloaded{
            [](std::monostate) -> std::string { return "-"; },
            [](bool flag) -> std::string { return flag ? "true" : "false"; },
            [](std::int64_t number) { return fmt::to_string(number); },
            [](std::uint8_t character) {
                const char byte = static_cast<char>(character);
                return fmt::format("'{}'", escape({&byte, 1}));
            },
            [](const std::string &text) { return quote(text); },
            [](const Bytes &bytes) {
                return quote({reinterpret_cast<const char *>(bytes.data()), bytes.size()});
            },
            [](const Binary &binary) { return fmt::format("{:02x}", fmt::join(binary.bytes, "")); },
            [](const Numbers &numbers) { return fmt::format("[{}]", fmt::join(numbers, ",")); },
            [](const Texts &texts) { return quote_all(texts); },
            [](const Nested &record) { return fmt::format("{{{}}}", to_text(record.fields)); },
            [](const NestedList &list) { return list_all(list.entries); },
        },
        value);
}

std::string to_text(const Fields &fields) {
    std::vector<std::string> parts;
    for (const Field &field : fields)
        parts.push_back(fmt::format("{}={}", field.name, to_text(field.value)));
    return fmt::format("{}", fmt::join(parts, " "));
}

Json to_json(const Value &value) {
    return std::visit(Overloaded{
                          [](std::monostate) -> Json { return nullptr; },
                          [](const Bytes &bytes) -> Json { return base64(bytes); },
                          [](const Binary &binary) -> Json { return base64(binary.bytes); },
                          [](const Texts &texts) -> Json {
                              Json array = Json::array();
                              for (const auto &text : texts)
                                  array.push_back(text ? Json(*text) : Json(nullptr));
                              return array;
                          },
                          [](const Nested &record) -> Json { return object_of(record.fields); },
                          [](const NestedList &list) -> Json {
                              Json array = Json::array();
                              for (const Fields &fields : list.entries)
                                  array.push_back(object_of(fields));
                              return array;
                          },
                          [](const auto &plain) -> Json { return plain; },
                      },
                      value);
}

void add_json(Json &object, const Fields &fields) {
    for (const Field &field : fields)
        object[std::string(field.name)] = to_json(field.value);
}

std::string dump(const Json &json) {
    return json.dump(-1, ' ', false, Json::error_handler_t::replace);
}

} // namespace imsctl
