// SPDX-License-Identifier: Apache-2.0
// The values of keys: what may be given for them, and how they are shown.
#pragma once

#include "imsctl/output/fields.hpp"
#include "imsctl/settings/keys.hpp"

#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

// "number", "boolean", "text"
std::string_view to_string(KeyType type);

struct WrongValue : std::runtime_error {
    using runtime_error::runtime_error;
};

// Throw WrongValue.
Value value_from_text(KeyType type, const std::string &text);
Value value_from_json(KeyType type, const Json &json);

// 0, false, ""
Value empty_value(KeyType type);

struct Change {
    std::string_view key;
    Value from;
    Value to;
};
using Changes = std::vector<Change>;

// How values appear in text. JSON is never masked: programs would write the mask back.
class Shown {
  public:
    explicit Shown(bool with_secrets) : with_secrets_(with_secrets) {}

    std::string value(std::string_view key, const Value &value) const;

    // "key=value" lines.
    std::string fields(const Fields &fields) const;

    // "key: from -> to" lines, with any separator.
    std::string changes(const Changes &changes, std::string_view separator) const;

  private:
    bool with_secrets_;
};

// {"key":{"from":...,"to":...},...}, with any names for the two.
Json to_json(const Changes &changes, const char *from, const char *to);

} // namespace imsctl
