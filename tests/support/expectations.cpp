// SPDX-License-Identifier: Apache-2.0
#include "tests/support/expectations.hpp"

#include "ims.h"
#include "tests/support/bus_observer.hpp"
#include "tests/support/platform_capture.hpp"
#include "tests/support/with_peer.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <optional>

namespace test {
namespace {

constexpr int kErrorPriority = 6;
constexpr int kWarningPriority = 5;
constexpr int kSystemLog = 2;
constexpr const char *kTag = "MEGORE";

// No message: any that says something.
void expect_one_line_of(int priority, const std::string &unit, const std::string &function,
                        const std::optional<std::string> &message) {
    const std::vector<LogLine> lines = take_log();
    ASSERT_EQ(lines.size(), 1U) << ::testing::PrintToString(lines);
    EXPECT_GT(lines[0].line, 0);
    EXPECT_NE(lines[0].message, "");
    EXPECT_EQ(lines[0], (LogLine{kSystemLog, priority, kTag, unit, function, lines[0].line,
                                 message.value_or(lines[0].message)}));
}

} // namespace

void check_gate(const std::string &unit, const std::string &function, int (*call_with_nothing)()) {
    set_gate(Gate::kOff);
    EXPECT_EQ(call_with_nothing(), IMS_ERROR_NOT_SUPPORTED);
    set_gate(Gate::kFailing);
    EXPECT_EQ(call_with_nothing(), IMS_ERROR_OPERATION_FAILED);
    EXPECT_EQ(gate_queries(), 2);

    const std::vector<LogLine> lines = take_log();
    ASSERT_EQ(lines.size(), 2U);
    LogLine expected{kSystemLog,    kErrorPriority,           kTag, unit, function,
                     lines[0].line, "IMS feature is disabled"};
    EXPECT_GT(expected.line, 0);
    EXPECT_EQ(lines[0], expected);
    expected.message = "Error - Feature getting from System Info";
    EXPECT_EQ(lines[1], expected);
}

void expect_one_line(const std::string &unit, const std::string &function,
                     const std::string &message) {
    expect_one_line_of(kErrorPriority, unit, function, message);
}

void expect_one_line(const std::string &unit, const std::string &function) {
    expect_one_line_of(kErrorPriority, unit, function, std::nullopt);
}

void expect_one_warning(const std::string &unit, const std::string &function,
                        const std::string &message) {
    expect_one_line_of(kWarningPriority, unit, function, message);
}

void expect_sent(const Call &call, const std::string &type, const std::string &value) {
    EXPECT_EQ(call.destination, kServiceName);
    EXPECT_EQ(call.path, kPath);
    const Variant expected = parse(type, value);
    if (!expected) {
        EXPECT_FALSE(call.has_signature);
        EXPECT_EQ(call.signature, "");
        return;
    }
    EXPECT_EQ("(" + call.signature + ")", g_variant_get_type_string(expected.get()));
    EXPECT_EQ(to_text(call.body.get()), to_text(expected.get()));
}

void expect_call_arguments(bool synchronous, const std::string &interface,
                           const std::string &method) {
    const std::vector<ObservedCall> calls = observed_calls();
    // Registering an application is a query of ims_init() and a request of its own.
    const auto is_it = [&](const ObservedCall &call) {
        return call.method == method && call.synchronous == synchronous;
    };
    ASSERT_EQ(std::count_if(calls.begin(), calls.end(), is_it), 1);
    const ObservedCall &call = *std::find_if(calls.begin(), calls.end(), is_it);
    EXPECT_EQ(call.bus_name, kServiceName);
    EXPECT_EQ(call.path, kPath);
    EXPECT_EQ(call.interface, interface);
    EXPECT_FALSE(call.has_reply_type);
    EXPECT_EQ(call.flags, G_DBUS_CALL_FLAGS_NONE);
    EXPECT_EQ(call.timeout_ms, 60000);
    EXPECT_FALSE(call.has_cancellable);
}

} // namespace test
