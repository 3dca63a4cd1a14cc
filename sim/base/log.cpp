// SPDX-License-Identifier: Apache-2.0
#include "sim/base/log.hpp"

#include <algorithm>
#include <cstdio>
#include <poll.h>
#include <string>
#include <unistd.h>
#include <utility>

namespace sim {

namespace {

// The longest of what applications send is of use to nobody here. However it is spelled, a line
// still fits into a page, which a pipe that has room takes at once.
constexpr std::size_t kLongestLine = 900;

constexpr int kPatienceMilliseconds = 1000;

// Whoever reads standard error. When that is a pipe which nobody empties, the service goes on
// without its log: it waits a moment, and from then on until there is room again, not at all.
class Reader {
  public:
    bool keeps_up() {
        pollfd room{STDERR_FILENO, POLLOUT, 0};
        if (poll(&room, 1, lost_ == 0 ? kPatienceMilliseconds : 0) != 0)
            return true; // an error too: the attempt will tell
        ++lost_;
        return false;
    }
    std::size_t take_lost() { return std::exchange(lost_, 0); }

  private:
    std::size_t lost_ = 0;
};

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
    const auto stamped = [&](std::string_view text) {
        return fmt::format("ims-sim: {:8.3f} {}\n", elapsed.count(), text);
    };
    static Reader reader;
    if (!reader.keeps_up())
        return;
    std::string lines;
    if (const auto lost = reader.take_lost())
        lines = stamped(fmt::format("{} lines are lost: nobody has read them", lost));
    lines += stamped(printable(line));
    // One write keeps them whole beside what other processes print.
    std::fwrite(lines.data(), 1, lines.size(), stderr);
    std::fflush(stderr);
}

} // namespace sim
