// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

// What may follow the set or profile behind a verb: keys, with "=" where a value belongs.
std::vector<std::string> key_completions(std::string_view group, std::string_view verb);

} // namespace imsctl
