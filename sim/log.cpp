// SPDX-License-Identifier: Apache-2.0
#include "sim/log.hpp"

#include <algorithm>
#include <cstdio>
#include <string>

namespace sim {

namespace {

// The longest of what applications send is of use to nobody here.
constexpr std::size_t kLongestLine = 2000;

bool continues_letter(char byte) {
    return (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
}

} // namespace

std::string printable(std::string_view text) {
    std::size_t length = std::min(text.size(), kLongestLine);
    while (length > 0 && length < text.size() && continues_letter(text[length]))
        --length;
    std::string shown;
    for (const char byte : text.substr(0, length)) {
        const auto code = static_cast<unsigned char>(byte);
        if (code < 0x20 || code == 0x7F)
            shown += fmt::format("\\x{:02x}", code);
        else
            shown += byte;
    }
    if (length < text.size())
        shown += fmt::format("... ({} bytes)", text.size());
    return shown;
}

void Log::write(std::string_view line) const {
    const std::chrono::duration<double> elapsed = std::chrono::steady_clock::now() - start_;
    const auto whole = fmt::format("ims-sim: {:8.3f} {}\n", elapsed.count(), printable(line));
    // One write a line keeps it whole beside what other processes print.
    std::fwrite(whole.data(), 1, whole.size(), stderr);
    std::fflush(stderr);
}

} // namespace sim
