// SPDX-License-Identifier: Apache-2.0
// What happens before anything is asked of the service: help, and output that nobody takes.
#include "imsctl/line/command_line.hpp"
#include "tests/imsctl/in_process.hpp"

#include <csignal>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <memory>
#include <unistd.h>

namespace imsctl {

void PrintTo(const Verb &verb, std::ostream *out) {
    *out << verb.path;
}

namespace {

using testing::HasSubstr;
using testing::StartsWith;

class EveryVerb : public ::testing::TestWithParam<Verb> {};

TEST_P(EveryVerb, HasHelpWithASummaryAndAnExample) {
    const Verb &verb = GetParam();
    const Outcome outcome = run_line(std::string(verb.path) + " --help");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.error, "");
    EXPECT_THAT(outcome.output, StartsWith(std::string(verb.summary) + "\n"));
    EXPECT_THAT(outcome.output, HasSubstr("Usage: imsctl " + std::string(verb.path)));
    EXPECT_THAT(outcome.output, HasSubstr("Example: imsctl " + std::string(verb.example)));
    EXPECT_EQ(verb.summary.find('\n'), std::string_view::npos);
}

TEST_P(EveryVerb, IsListedInTheHelpOfItsGroup) {
    const std::string path(GetParam().path);
    const auto space = path.rfind(' ');
    const std::string group = space == std::string::npos ? "" : path.substr(0, space);
    const std::string name = space == std::string::npos ? path : path.substr(space + 1);
    const Outcome outcome = run_line(group + " --help");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(outcome.output, HasSubstr("\n  " + name + " "));
    EXPECT_THAT(outcome.output, HasSubstr(std::string(GetParam().summary)));
}

TEST_P(EveryVerb, TakesItsOwnExampleButNoUnknownOption) {
    // What the example redirects is for the shell.
    const std::string example(GetParam().example.substr(0, GetParam().example.find(" >")));
    const Outcome outcome = run_line(example + " --no-such-option");
    EXPECT_EQ(outcome.status, 2);
    EXPECT_THAT(outcome.error, HasSubstr("there is no option \"--no-such-option\""));
    EXPECT_THAT(outcome.error, StartsWith("imsctl: " + std::string(GetParam().path) + ": "));
    EXPECT_THAT(outcome.error, HasSubstr("try: imsctl " + std::string(GetParam().example)));
}

INSTANTIATE_TEST_SUITE_P(All, EveryVerb, ::testing::ValuesIn(catalogue().verbs()),
                         [](const ::testing::TestParamInfo<Verb> &row) {
                             std::string name(row.param.path);
                             for (char &letter : name)
                                 if (letter == ' ' || letter == '-')
                                     letter = '_';
                             return name;
                         });

TEST(Verbs, HaveGroupsWithASummary) {
    for (const Verb &verb : catalogue().verbs())
        for (auto space = verb.path.find(' '); space != std::string_view::npos;
             space = verb.path.find(' ', space + 1))
            EXPECT_NE(catalogue().group_summary(verb.path.substr(0, space)), "") << verb.path;
}

TEST(CommandLine, EscapesWhatItRepeats) {
    const Outcome outcome = run_words({"call", "hold", "\x1b[2J"});
    EXPECT_EQ(outcome.status, 2);
    EXPECT_THAT(outcome.error, HasSubstr(R"("\x1b[2J")"));
}

TEST(CommandLine, HasAVersion) {
    const Outcome outcome = run_line("--version");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(outcome.output, testing::MatchesRegex("imsctl [0-9]+\\.[0-9]+\\.[0-9]+\n"));
}

TEST(CommandLine, HasHelpThatNamesTheExitStatus) {
    const Outcome outcome = run_line("--help");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(outcome.output, HasSubstr("Exit status: 0 done, 1 failed, 2 wrong usage"));
}

using Stream = std::unique_ptr<std::FILE, decltype(&std::fclose)>;

TEST(CommandLine, FailsWhenItsHelpCannotBeWritten) {
    const std::vector<std::vector<const char *>> lines = {
        {"--help"}, {"--version"}, {"call", "--help"}, {"__complete", ""}};
    for (const auto &words : lines) {
        const Stream full(std::fopen("/dev/full", "w"), std::fclose);
        const Stream err(std::tmpfile(), std::fclose);
        EXPECT_EQ(run(catalogue(), words, full.get(), err.get()), 1) << words.front();
        EXPECT_GT(std::ftell(err.get()), 0) << words.front();
    }
}

TEST(CommandLine, EndsWithoutAWordWhenNobodyReads) {
    std::signal(SIGPIPE, SIG_IGN); // as main() does
    int ends[2];
    ASSERT_EQ(pipe(ends), 0);
    close(ends[0]);
    const Stream out(fdopen(ends[1], "w"), std::fclose);
    const Stream err(std::tmpfile(), std::fclose);
    const std::vector<const char *> words = {"settings", "list-keys"};
    EXPECT_EQ(run(catalogue(), words, out.get(), err.get()), 1);
    EXPECT_EQ(std::ftell(err.get()), 0);
}

} // namespace
} // namespace imsctl
