// SPDX-License-Identifier: Apache-2.0
// Command lines that are wrong: nothing is asked of the service, and the message says what to type.
#include "imsctl/output/fields.hpp"
#include "tests/imsctl/in_process.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

using testing::HasSubstr;

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
     "sms, ss, settings, network-environment, profile, ptt, group, vt, monitor, completion\nhelp: "
     "imsctl "
     "--help\n"},
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
    {"call list --slot x", "--slot: \"x\" is not a whole number from 0 to 2147483647"},
    {"call list --slot -1", "--slot: \"-1\" is not a whole number from 0 to 2147483647"},
    {"--slot call list", "--slot: \"call\" is not a whole number from 0 to 2147483647"},
    {"monitor --modul call", "there is no option \"--modul\"; did you mean \"--module\"?"},
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
    {"sms send abc hello", "NUMBER: \"abc\" is not a number of 1 to 20 digits"},
    {"sms send 555+0101 hello", "NUMBER: \"555+0101\" is not a number of 1 to 20 digits"},
    {"sms send tel: hello", "NUMBER: \"tel:\" is not a number of 1 to 20 digits"},
    {"sms send ( hello", "NUMBER: \"(\" is not a number of 1 to 20 digits"},
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
    {"settings", "a verb is missing: list-keys, get, set, add, delete, export, import, diff"},
    {"profile", "a verb is missing: list, list-keys, show, set, add, delete"},
    {"network-environment", "a verb is missing: get, set"},
    {"settings get", "NAME is required"},
    {"settings get a ringing_timr",
     "there is none called \"ringing_timr\"; did you mean \"ringing_timer\""},
    {"settings set a", "CHANGE is required"},
    {"settings set a ringing_timer", "\"ringing_timer\" is not KEY=VALUE"},
    {"settings set a ringing_timr=1",
     "there is no key \"ringing_timr\"; did you mean \"ringing_timer\""},
    {"settings set a ringing_timer=x", "ringing_timer: \"x\" is not a whole number of 32 bits"},
    {"settings set a is_rcs_enabled=1", "is_rcs_enabled: \"1\" is neither true nor"},
    {"settings set a id=1 id=1", "id is given twice"},
    {"settings set a name=b", "name cannot be set: it says which set is meant"},
    {"settings set a audio_port_end=1", "audio_port_end cannot be set: the service"},
    {"settings set a is_enable_srtp=1", "is_enable_srtp cannot be set: the service"},
    {"settings add a is_enable_srtp=1", "is_enable_srtp cannot be set: the service"},
    {"settings diff a", "SECOND is required"},
    {"settings export a", "FILE is required"},
    {"settings import", "FILE is required"},
    {"profile show", "PROFILE is required"},
    {"profile show 1 prot", "did you mean \"port\""},
    {"profile set 1 id=2", "id cannot be set: it says which profile is meant"},
    {"profile set 1 port=99999999999", "is not a whole number of 32 bits"},
    {"profile add a name=b", "name cannot be set: it is given as NAME"},
    {"network-environment set x", "TYPE: \"x\" is not a whole number of 32 bits"},
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

} // namespace
} // namespace imsctl
