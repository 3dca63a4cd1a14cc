// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <chrono>
#include <fmt/format.h>
#include <string>
#include <string_view>
#include <utility>

namespace sim {

enum class LogLevel { kQuiet, kNormal, kVerbose };

// What applications send may hold line ends, commands to a terminal and megabytes. This is one line
// of a bearable length, whatever it was.
std::string printable(std::string_view text);

// Lines on standard error, each with the seconds since the start.
class Log {
  public:
    explicit Log(LogLevel level) : level_(level), start_(std::chrono::steady_clock::now()) {}

    bool verbose() const { return level_ == LogLevel::kVerbose; }

    // What keeps the stand-in from working.
    template <typename... Args>
    void failure(fmt::format_string<Args...> text, Args &&...args) const {
        write(fmt::format(text, std::forward<Args>(args)...));
    }
    // What an application got wrong, and what the one who started the stand-in waits for.
    template <typename... Args>
    void note(fmt::format_string<Args...> text, Args &&...args) const {
        if (level_ >= LogLevel::kNormal)
            write(fmt::format(text, std::forward<Args>(args)...));
    }
    // Everything else.
    template <typename... Args>
    void trace(fmt::format_string<Args...> text, Args &&...args) const {
        if (verbose())
            write(fmt::format(text, std::forward<Args>(args)...));
    }

  private:
    void write(std::string_view line) const;

    LogLevel level_;
    std::chrono::steady_clock::time_point start_;
};

} // namespace sim
