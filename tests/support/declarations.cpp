// SPDX-License-Identifier: Apache-2.0
#include "tests/support/declarations.hpp"

#include "tests/support/files.hpp"

#include <stdexcept>
#include <string_view>

namespace test {

std::set<std::string> declared_functions(const std::string &header) {
    const std::string text = content_of(std::string{IMS_TEST_INCLUDE_DIR} + "/" + header);
    if (text.empty())
        throw std::runtime_error("no header " + header);
    constexpr std::string_view mark = "\nIMS_API ";
    std::set<std::string> names;
    for (auto at = text.find(mark); at != std::string::npos; at = text.find(mark, at + 1)) {
        const auto end = text.find('(', at);
        const auto before = text.find_last_of(" *\n", end);
        names.insert(text.substr(before + 1, end - before - 1));
    }
    return names;
}

} // namespace test
