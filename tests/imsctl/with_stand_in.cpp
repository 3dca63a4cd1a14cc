// SPDX-License-Identifier: Apache-2.0
#include "tests/imsctl/with_stand_in.hpp"

#include <csignal>

namespace test {

WithStandIn::WithStandIn(int slots)
    : service_{{program("ims-sim"), "serve", "--speed", "20", "--slots", std::to_string(slots),
                "--verbose"}} {
    // They register one after the other.
    service_.wait_for_error("sub" + std::to_string(slots - 1) + " signal RegistrationStatus (true");
}

WithStandIn::~WithStandIn() {
    service_.send_signal(SIGTERM);
    EXPECT_EQ(service_.wait(), 0) << service_.both();
}

void WithStandIn::expect_ok(const std::string &line) {
    const Outcome outcome = run(line);
    EXPECT_EQ(outcome.status, 0) << line << '\n' << outcome.error;
}

void WithStandIn::expect_output(const std::string &line, const std::string &output) {
    const Outcome outcome = run(line);
    EXPECT_EQ(outcome.status, 0) << line << '\n' << outcome.error;
    EXPECT_EQ(outcome.output, output + "\n") << line;
}

void WithStandIn::expect_refusal(const std::string &line, int result) {
    const Outcome outcome = run(line + " --json");
    EXPECT_EQ(outcome.status, 1) << line;
    EXPECT_EQ(outcome.json()["error"]["result"], result) << line;
}

WithStandIn::Watcher::Watcher(const std::string &line)
    : Process(imsctl_command(split(line)), strict_environment()) {
    const std::string option = "--slot ";
    const auto at = line.find(option);
    wait_for_error(" slot " + (at == std::string::npos ? "0" : line.substr(at + option.size(), 1)) +
                   "\n");
}

std::vector<Json> WithStandIn::Watcher::lines() {
    EXPECT_EQ(wait(), 0) << both();
    return json_lines(output());
}

} // namespace test
