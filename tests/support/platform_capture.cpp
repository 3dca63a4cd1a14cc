// SPDX-License-Identifier: Apache-2.0
// Compiled into each test executable, so that these definitions stand in front of any provider.
#include "tests/support/platform_capture.hpp"

#include "platform.h"

#include <gtest/gtest.h>

#include <cstdarg>
#include <cstdio>
#include <cstring>
#include <mutex>
#include <utility>

namespace test {
namespace {

std::mutex capture_mutex;
Gate current_gate = Gate::kOn;
int queries_seen = 0;
std::vector<LogLine> captured_lines;

// "file: function(line) > message"
bool split_prefix(const std::string &text, LogLine &line) {
    const auto colon = text.find(": ");
    const auto open = text.find('(', colon);
    const auto close = text.find(") > ", open);
    if (colon == 0 || close == std::string::npos)
        return false;
    const std::string digits = text.substr(open + 1, close - open - 1);
    line.file = text.substr(0, colon);
    line.function = text.substr(colon + 2, open - colon - 2);
    line.message = text.substr(close + 4);
    // Bare names: a function's signature or a path would show here.
    if (digits.empty() || digits.find_first_not_of("0123456789") != std::string::npos ||
        line.file.find_first_of(" /") != std::string::npos || line.function.empty() ||
        line.function.find_first_of(" :<") != std::string::npos)
        return false;
    line.line = std::stoi(digits);
    return true;
}

} // namespace

void set_gate(Gate gate) {
    const std::lock_guard lock{capture_mutex};
    current_gate = gate;
}

int gate_queries() {
    const std::lock_guard lock{capture_mutex};
    return queries_seen;
}

std::ostream &operator<<(std::ostream &out, const LogLine &line) {
    return out << "[" << line.log_id << " " << line.priority << " " << line.tag << "] " << line.file
               << ": " << line.function << "(" << line.line << ") > " << line.message;
}

std::vector<LogLine> take_log() {
    const std::lock_guard lock{capture_mutex};
    return std::exchange(captured_lines, {});
}

void reset_platform() {
    const std::lock_guard lock{capture_mutex};
    current_gate = Gate::kOn;
    queries_seen = 0;
    captured_lines.clear();
}

} // namespace test

extern "C" [[gnu::visibility("default")]] int system_info_get_custom_bool(const char *key,
                                                                          bool *value) {
    const std::lock_guard lock{test::capture_mutex};
    EXPECT_STREQ(key, "kelvo.org/feature/network.telephony.ims");
    ++test::queries_seen;
    if (test::current_gate == test::Gate::kFailing)
        return -5;
    *value = test::current_gate == test::Gate::kOn;
    return 0;
}

extern "C" [[gnu::visibility("default")]] int
__dlog_print(int log_id, int priority, const char *tag, const char *format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    std::va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, arguments);
    va_end(arguments);
    std::string text(static_cast<std::size_t>(length) + 1, '\0');
    std::vsnprintf(text.data(), text.size(), format, again);
    va_end(again);
    text.pop_back();

    test::LogLine line{log_id, priority, tag, {}, {}, -1, {}};
    if (!test::split_prefix(text, line))
        ADD_FAILURE() << "a log line without its prefix: " << text;
    const std::lock_guard lock{test::capture_mutex};
    test::captured_lines.push_back(std::move(line));
    return length;
}
