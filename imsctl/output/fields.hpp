// SPDX-License-Identifier: Apache-2.0
// Named, typed values: what an event, an outcome or an error is made of before it becomes text or
// JSON.
#pragma once

#include <cstdint>
#include <nlohmann/json_fwd.hpp>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace imsctl {

using Bytes = std::vector<std::uint8_t>;
using Numbers = std::vector<std::int32_t>;
using Texts = std::vector<std::optional<std::string>>;

// Bytes that are no text: people see them in hexadecimal.
struct Binary {
    Bytes bytes;
    bool operator==(const Binary &) const = default;
};

struct Field;
using Fields = std::vector<Field>;

// A record inside a record, and a list of records.
struct Nested {
    Fields fields;
    bool operator==(const Nested &other) const;
};
struct NestedList {
    std::vector<Fields> entries;
    bool operator==(const NestedList &other) const;
};

// monostate stands for a text, or a record, that the service left out.
using Value = std::variant<std::monostate, bool, std::int64_t, std::uint8_t, std::string, Bytes,
                           Binary, Numbers, Texts, Nested, NestedList>;

struct Field {
    std::string_view name; // from a table: lives as long as the program
    Value value;

    bool operator==(const Field &other) const;
};

// The value of a field that is there. Throws when it is not, or has another type.
template <class Type>
const Type &get(const Fields &fields, std::string_view name) {
    for (const Field &field : fields)
        if (field.name == name)
            return std::get<Type>(field.value);
    throw std::logic_error("no such field");
}

// Keys stay in the order in which they were added.
using Json = nlohmann::ordered_json;

// Makes bytes safe for a terminal: what is not printable UTF-8 becomes an escape sequence.
std::string escape(std::string_view text);

// Escaped and in double quotes.
std::string quote(std::string_view text);

// "a=1 b=true c=\"text\" d={e=2}"
std::string to_text(const Value &value);
std::string to_text(const Fields &fields);

// Bytes become base64 text.
Json to_json(const Value &value);
void add_json(Json &object, const Fields &fields);

// One line; a text that is not UTF-8 keeps what can be kept.
std::string dump(const Json &json);

} // namespace imsctl
