// SPDX-License-Identifier: Apache-2.0
#include "command_line.hpp"

#include <clocale>

int main(int argc, char **argv) {
    std::setlocale(LC_ALL, "");
    const std::span<const char *const> words(argv, static_cast<std::size_t>(argc));
    return imsctl::run(words.empty() ? words : words.subspan(1), stdout, stderr);
}
