// SPDX-License-Identifier: Apache-2.0
// Text as JSON, for files that people write.
#pragma once

#include "imsctl/output/fields.hpp"

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

namespace imsctl {

// Adds to `problems` what is wrong with the text: keys that an object has twice, and where it is
// not JSON.
Json parse_json(const std::string &text, std::vector<std::string> &problems);

} // namespace imsctl
