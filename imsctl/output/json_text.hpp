// SPDX-License-Identifier: Apache-2.0
// Text as JSON, for files that people write.
#pragma once

#include "imsctl/output/fields.hpp"

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace imsctl {

struct JsonText {
    Json value;
    // What is wrong with the text: keys that an object has twice, and where it is not JSON.
    std::vector<std::string> problems;
};

JsonText parse_json(const std::string &text);

} // namespace imsctl
