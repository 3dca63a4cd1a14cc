// SPDX-License-Identifier: Apache-2.0
// What happens before anything is asked of the service: help, completion and wrong usage.
#include "command_line.hpp"
#include "fields.hpp"
#include "verbs.hpp"

#include <cstdlib>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sstream>

namespace imsctl {

void PrintTo(const Verb &verb, std::ostream *out) {
    *out << verb.path;
}

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::StartsWith;

struct Outcome {
    int status;
    std::string output;
    std::string error;
};

// A FILE that writes to memory.
class Memory {
  public:
    Memory() : file_(open_memstream(&data_, &size_)) {}
    ~Memory() {
        std::fclose(file_);
        std::free(data_);
    }
    Memory(const Memory &) = delete;
    Memory &operator=(const Memory &) = delete;

    std::FILE *file() { return file_; }
    std::string text() {
        std::fflush(file_);
        return {data_, size_};
    }

  private:
    char *data_ = nullptr;
    std::size_t size_ = 0;
    std::FILE *file_;
};

Outcome run_words(const std::vector<std::string> &words) {
    std::vector<const char *> arguments;
    for (const std::string &word : words)
        arguments.push_back(word.c_str());
    Memory out;
    Memory err;
    const int status = run(arguments, out.file(), err.file());
    return {status, out.text(), err.text()};
}

std::vector<std::string> split(std::string_view line) {
    std::istringstream stream{std::string(line)};
    std::vector<std::string> words;
    for (std::string word; stream >> word;)
        words.push_back(word);
    return words;
}

Outcome run_line(std::string_view line) {
    return run_words(split(line));
}

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

INSTANTIATE_TEST_SUITE_P(All, EveryVerb, ::testing::ValuesIn(all_verbs()),
                         [](const ::testing::TestParamInfo<Verb> &row) {
                             std::string name(row.param.path);
                             for (char &letter : name)
                                 if (letter == ' ' || letter == '-')
                                     letter = '_';
                             return name;
                         });

TEST(Verbs, HaveGroupsWithASummary) {
    for (const Verb &verb : all_verbs())
        for (auto space = verb.path.find(' '); space != std::string_view::npos;
             space = verb.path.find(' ', space + 1))
            EXPECT_NE(group_summary(verb.path.substr(0, space)), "") << verb.path;
}

struct UsageRow {
    const char *line;
    const char *message;
};

void PrintTo(const UsageRow &row, std::ostream *out) {
    *out << row.line;
}

const UsageRow kMistakes[] = {
    {"",
     "imsctl: a verb is missing: call, registration, flight-mode, login, logout, login-state, "
     "sms, ss, settings, network-environment, profile, monitor, completion\nhelp: imsctl --help\n"},
    {"call", "imsctl: call: a verb is missing: dial, answer, end, "},
    {"cal list", "imsctl: there is no verb \"cal\"; did you mean \"call\"?\nhelp: imsctl --help\n"},
    {"call dail 555", "imsctl: call: there is no verb \"dail\"; did you mean \"dial\"?\n"
                      "help: imsctl call --help\n"},
    {"call xyzzy", "there is no verb \"xyzzy\"; the verbs: dial, answer, "},
    {"call dail --help", "did you mean \"dial\"?"},
    {"call dial", "imsctl: call dial: NUMBER is required\ntry: imsctl call dial +15550101 --wait\n"
                  "help: imsctl call dial --help\n"},
    {"call dial 1 2", "\"2\" is one argument too many"},
    {"call dial 1 --tpye voice", "there is no option \"--tpye\"; did you mean \"--type\"?"},
    {"call dial 1 --tpye=voice", "there is no option \"--tpye=voice\"; did you mean \"--type\"?"},
    {"call dial 1 --type fax", "--type: \"fax\" is not one of voice, video, emergency or a number"},
    {"call hold one", "SESSION: \"one\" is not a whole number of 32 bits"},
    {"call hold 99999999999", "SESSION: \"99999999999\" is not a whole number of 32 bits"},
    {"call hold --session", "--session needs exactly one value"},
    {"call list --slot x", "--slot: \"x\" is not a whole number"},
    {"call list --timeout 0", "--timeout: \"0\" is not a number of seconds above 0"},
    {"call list --timeout -1", "--timeout: \"-1\" is not a number of seconds above 0"},
    {"call list --timeout nan", "--timeout: \"nan\" is not a number of seconds above 0"},
    {"call list --timeout inf", "--timeout: \"inf\" is not a number of seconds above 0"},
    {"call dtmf", "one of DIGITS, --start and --stop is needed"},
    {"call dtmf 1 --stop", "one of DIGITS, --start and --stop is needed"},
    {"call dtmf --start 12", "--start takes one tone, not \"12\""},
    {"call ussd", "TEXT is missing"},
    {"call tty", "imsctl: call tty: a verb is missing: send, mode"},
    {"call tty mode set loud", "MODE: \"loud\" is not one of off, full, hco, vco or a number"},
    {"call conference start", "NUMBER is required"},
    {"call conference nway add", "CALL is required"},
    {"monitor call-endde",
     "EVENT: there is none called \"call-endde\"; did you mean \"call-ended\""},
    {"monitor --module cal", "--module: there is none called \"cal\"; did you mean \"call\"?"},
    {"monitor --count -1", "--count: \"-1\" is not a whole number from 1 to 2147483647"},
    {"monitor --count 0", "--count: \"0\" is not a whole number from 1 to 2147483647"},
    {"monitor --for 0", "--for: \"0\" is not a number of seconds above 0"},
    {"registration", "imsctl: registration: a verb is missing: show, watch, register\n"},
    {"registration show now", "\"now\" is one argument too many"},
    {"registration watch --for x", "--for: \"x\" is not a number of seconds above 0"},
    {"registration register 1", "\"1\" is one argument too many"},
    {"flight-mode on", "\"on\" is one argument too many"},
    {"login", "USER is required"},
    {"login alice", "PASSWORD is required"},
    {"login alice secret --kind x", "--kind: \"x\" is not one of ims, push-to-talk or a number"},
    {"logout alice", "\"alice\" is one argument too many"},
    {"login-state --kind x", "--kind: \"x\" is not one of ims, push-to-talk or a number"},
    {"sms", "imsctl: sms: a verb is missing: send, watch, report\n"},
    {"sms sned +15550101 x", "there is no verb \"sned\"; did you mean \"send\"?"},
    {"sms send", "NUMBER is required"},
    {"sms send +15550101", "one of TEXT and --data is needed"},
    {"sms send +15550101 hello --data 00", "one of TEXT and --data is needed"},
    {"sms send +15550101 hello there", "\"there\" is one argument too many"},
    {"sms send alice hello", "NUMBER: \"alice\" is not a number of 1 to 20 digits"},
    {"sms send +123456789012345678901 hello", "\" is not a number of 1 to 20 digits"},
    {"sms send +15550101 --data 0", "--data: \"0\" is not made of octets in hexadecimal"},
    {"sms send +15550101 --data xy", "--data: \"xy\" is not made of octets in hexadecimal"},
    {"sms send +15550101 hello --sca alice", "--sca: \"alice\" is not a number of 1 to 20"},
    {"sms send +15550101 hello --validity 5",
     "--validity: \"5\" is not a number with s (up to 255), m,"},
    {"sms send +15550101 hello --validity 99w", "--validity: TP-VP cannot be "},
    {"sms send +15550101 hello --class 4", "--class: 4 is not from 0 to 3"},
    {"sms send +15550101 hello --class -1", "--class: -1 is not from 0 to 3"},
    {"sms send +15550101 hello --class red", "--class: \"red\" is not one of flash, device, sim,"},
    {"sms send +15550101 hello --reference 256", "--reference: \"256\" is not a whole number from"},
    {"sms send +15550101 hello --option x", "--option: \"x\" is not a whole number"},
    {"sms watch --count 0", "--count: \"0\" is not a whole number from 1 to 2147483647"},
    {"sms watch now", "\"now\" is one argument too many"},
    {"sms report x", "MESSAGE: \"x\" is not a whole number"},
    {"sms report --failure full", "--failure: \"full\" is not one of sim-full, device-error,"},
    {"sms report --failure 127", "--failure: 127 is not from 128 to 255"},
    {"sms report --failure 256", "--failure: 256 is not from 128 to 255"},
    {"sms report --code x", "--code: \"x\" is not a whole number"},
    {"ss", "imsctl: ss: a verb is missing: waiting, forwarding, barring\n"},
    {"ss waiting", "imsctl: ss waiting: a verb is missing: get, set\n"},
    {"ss waiting get --class fax", "--class: \"fax\" is not one of voice, video, all or a number"},
    {"ss waiting set", "STATUS is required"},
    {"ss waiting set yes", "STATUS: \"yes\" is not one of off, on or a number"},
    {"ss forwarding get sometimes", "CONDITION: \"sometimes\" is not one of unconditional, busy,"},
    {"ss forwarding set", "CONDITION is required"},
    {"ss forwarding set busy", "STATUS is required"},
    {"ss forwarding set busy on --after x", "--after: \"x\" is not a whole number"},
    {"ss barring get some", "CALLS: \"some\" is not one of outgoing, outgoing-international,"},
    {"ss barring set", "CALLS is required"},
    {"ss barring set outgoing", "STATUS is required"},
    {"ss barring set outgoing on", "--password is required"},
    {"completion", "SHELL is required"},
    {"completion fish", "SHELL: there is none called \"fish\""},
};

class Mistakes : public ::testing::TestWithParam<UsageRow> {};

TEST_P(Mistakes, ExitWithTwoAndSayWhatToType) {
    const Outcome outcome = run_line(GetParam().line);
    EXPECT_EQ(outcome.status, 2);
    EXPECT_EQ(outcome.output, "");
    EXPECT_THAT(outcome.error, HasSubstr(GetParam().message));
    EXPECT_THAT(outcome.error,
                testing::AnyOf(HasSubstr("\nhelp: imsctl "), HasSubstr("\ntry: imsctl ")));
}

TEST_P(Mistakes, AreJsonWhenJsonIsAskedFor) {
    const Outcome outcome = run_line(std::string("--json ") + GetParam().line);
    EXPECT_EQ(outcome.status, 2);
    ASSERT_TRUE(Json::accept(outcome.output)) << outcome.output;
    const Json object = Json::parse(outcome.output);
    EXPECT_EQ(object["error"]["kind"], "usage");
    EXPECT_NE(object["error"]["message"], "");
    EXPECT_NE(object["error"]["hint"], "");
}

INSTANTIATE_TEST_SUITE_P(All, Mistakes, ::testing::ValuesIn(kMistakes));

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

std::vector<std::string> completed(const std::vector<std::string> &words) {
    std::vector<std::string> all = {"__complete"};
    all.insert(all.end(), words.begin(), words.end());
    const Outcome outcome = run_words(all);
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.error, "");
    return split(outcome.output);
}

TEST(Completion, OffersVerbsOptionsAndEvents) {
    EXPECT_THAT(completed({""}),
                ElementsAre("call", "registration", "flight-mode", "login", "logout", "login-state",
                            "sms", "ss", "settings", "network-environment", "profile", "monitor",
                            "completion"));
    EXPECT_THAT(completed({"ss", "waiting", ""}), ElementsAre("get", "set"));
    EXPECT_THAT(completed({"sms", "send", "--re"}), ElementsAre("--reference", "--report"));
    EXPECT_THAT(completed({"monitor", "sms-"}),
                ElementsAre("sms-incoming-sms", "sms-send-sms-ack", "sms-delivery-report-ack"));
    EXPECT_THAT(completed({"c"}), ElementsAre("call", "completion"));
    EXPECT_THAT(completed({"call", "re"}),
                ElementsAre("reject", "resume", "reject-change", "record"));
    EXPECT_THAT(completed({"call", "tty", "mode", ""}), ElementsAre("get", "set"));
    EXPECT_THAT(completed({"--slot", "1", "call", "dial", "--t"}),
                ElementsAre("--text-1", "--text-2", "--text-3", "--text-4", "--timeout", "--type"));
    EXPECT_THAT(
        completed({"monitor", "call-e"}),
        ElementsAre("call-established", "call-ended", "call-early-media-start", "call-error"));
    EXPECT_THAT(completed({"monitor", "--mod"}), ElementsAre("--module"));
    EXPECT_TRUE(completed({}).empty());
}

TEST(Completion, HasAScriptThatAsksTheProgram) {
    const Outcome outcome = run_line("completion bash");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(outcome.output, HasSubstr("__complete"));
    EXPECT_THAT(outcome.output, HasSubstr("complete -F _imsctl imsctl\n"));
}

} // namespace
} // namespace imsctl
