// SPDX-License-Identifier: Apache-2.0
// imsctl as a child process, and what it writes.
#pragma once

#include "tests/programs/programs.hpp"
#include "tests/support/process.hpp"

#include <nlohmann/json.hpp>

namespace test {

using Json = nlohmann::ordered_json;
using Environment = Process::Environment;

// Where the scripted service sends the events of the first slot from, and whose they are.
inline constexpr const char *kSlotPath = "/org/kelvo/ims/sub0";
inline constexpr const char *kSmsInterface = "org.kelvo.ims.Sms";

// What ran to its end.
struct Outcome {
    int status;
    std::string output;
    std::string error;

    // The output as the one JSON object that it has to be.
    Json json() const;
};

// Any warning or critical of GLib ends the child, and with it the test.
Environment strict_environment();

std::vector<std::string> imsctl_command(std::vector<std::string> words);

Outcome run_imsctl(std::vector<std::string> words, const Environment &more = {});

// The words of a command line without quoting.
std::vector<std::string> split(const std::string &line);

// Each line parsed on its own.
std::vector<Json> json_lines(const std::string &text);

} // namespace test
