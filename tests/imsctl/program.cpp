// SPDX-License-Identifier: Apache-2.0
#include "tests/imsctl/program.hpp"

#include <sstream>

namespace test {

Json Outcome::json() const {
    const auto lines = json_lines(output);
    if (lines.size() != 1 || !lines.front().is_object())
        throw std::runtime_error("not one JSON object: " + output);
    return lines.front();
}

Environment strict_environment() {
    return {{"G_DEBUG", "fatal-warnings"},
            {"KELVO_IMS_FEATURE_FILE", "/nonexistent"},
            {"LC_ALL", "C.UTF-8"},
            {"TZ", "UTC"}};
}

std::vector<std::string> imsctl_command(std::vector<std::string> words) {
    return program("imsctl", std::move(words));
}

Outcome run_imsctl(std::vector<std::string> words, const Environment &more) {
    Environment environment = more;
    environment.merge(strict_environment());
    Process process(imsctl_command(std::move(words)), environment);
    const int status = process.wait();
    return {status, process.output(), process.error()};
}

std::vector<std::string> split(const std::string &line) {
    std::istringstream stream(line);
    std::vector<std::string> words;
    for (std::string word; stream >> word;)
        words.push_back(word);
    return words;
}

std::vector<Json> json_lines(const std::string &text) {
    std::istringstream stream(text);
    std::vector<Json> lines;
    for (std::string line; std::getline(stream, line);)
        lines.push_back(Json::parse(line));
    return lines;
}

} // namespace test
