// SPDX-License-Identifier: Apache-2.0
// Registration, login, short messages and supplementary services from end to end, with the stand-in
// service.
#include "tests/imsctl/with_stand_in.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace test {
namespace {

using testing::HasSubstr;

std::string repeated(std::string_view piece, int count) {
    std::string text;
    for (int i = 0; i < count; ++i)
        text += piece;
    return text;
}

using Services = WithStandIn;

struct TextRow {
    const char *name;
    std::string text;
    const char *alphabet;
    int parts;
};

void PrintTo(const TextRow &row, std::ostream *out) {
    *out << row.name;
}

class ServicesText : public Services, public ::testing::WithParamInterface<TextRow> {};

TEST_P(ServicesText, ArrivesInTheOtherSlotAsItWasSent) {
    const TextRow &row = GetParam();
    Watcher inbox("--slot 1 sms watch --count 1 --json");
    const Outcome sent = run_imsctl({"sms", "send", "+15550101", row.text, "--wait", "--json"});
    ASSERT_EQ(sent.status, 0) << sent.error;
    EXPECT_EQ(sent.json()["alphabet"], row.alphabet);
    EXPECT_EQ(sent.json()["parts"].size(), static_cast<std::size_t>(row.parts));

    const auto lines = inbox.lines();
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0]["slot"], 1);
    const Json &message = lines[0]["message"];
    EXPECT_EQ(message["number"], "+15550100");
    EXPECT_EQ(message["text"], row.text);
    EXPECT_EQ(message["alphabet"], row.alphabet);
    EXPECT_EQ(message["parts"], row.parts);
}

INSTANTIATE_TEST_SUITE_P(
    All, ServicesText,
    ::testing::Values(TextRow{"Gsm7", "Hello @ {grüße} €", "gsm7", 1},
                      TextRow{"Ucs2", "Привет, 日本 🙂", "ucs2", 1},
                      TextRow{"Gsm7ThreeParts", repeated("The quick brown fox. ", 19), "gsm7", 3},
                      TextRow{"Ucs2ThreeParts", repeated("🙂 до", 40), "ucs2", 3}),
    [](const ::testing::TestParamInfo<TextRow> &row) { return row.param.name; });

TEST_F(Services, BringsDataAndItsClass) {
    Watcher inbox("--slot 1 sms watch --count 1 --json");
    expect_ok("sms send +15550101 --data 00ff1b --class flash");
    const auto lines = inbox.lines();
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0]["message"]["data"], "AP8b");
    EXPECT_EQ(lines[0]["message"]["text"], nullptr);
    EXPECT_EQ(lines[0]["message"]["class"], 0);
}

TEST_F(Services, ReportsTheDeliveryToTheSender) {
    Watcher sender("sms watch --count 1 --json");
    Watcher acknowledgement("--slot 1 monitor sms-delivery-report-ack --count 1 --json");
    Watcher receiver("--slot 1 sms watch --count 1 --json");
    expect_ok("sms send +15550101 hello --report --reference 77");
    EXPECT_EQ(receiver.lines().at(0)["message"]["text"], "hello");
    EXPECT_EQ(acknowledgement.lines().at(0)["member_2"], 0);
    const Json report = sender.lines().at(0)["status_report"];
    EXPECT_EQ(report["number"], "+15550101");
    EXPECT_EQ(report["reference"], 77);
    EXPECT_EQ(report["status"], 0);
}

TEST_F(Services, ReportsARefusalThatWasMadeByHand) {
    Watcher sender("sms watch --count 1 --json");
    Watcher receiver("--slot 1 sms watch --count 1 --json --no-report");
    expect_ok("sms send +15550101 hello --report --reference 78");
    const Json message = receiver.lines().at(0);
    const std::string number = message["member_3"].dump();
    expect_ok("--slot 1 sms report " + number + " --failure memory-exceeded");
    EXPECT_EQ(sender.lines().at(0)["status_report"]["status"], 0x65);
    expect_refusal("--slot 1 sms report " + number, 13);
}

TEST_F(Services, TellWhyAMessageWasNotTaken) {
    const Outcome nobody = run("sms send +15550211 hello --wait --json");
    EXPECT_EQ(nobody.status, 1);
    EXPECT_EQ(nobody.json()["error"]["kind"], "not-sent");
    EXPECT_EQ(nobody.json()["error"]["cause"], 1);
    EXPECT_THAT(nobody.error, HasSubstr("refused by the service centre: invalid address"));
    expect_refusal("sms send +15550101 hello --option 5", 10);
}

TEST_F(Services, FollowFlightMode) {
    Watcher watch("registration watch --count 2 --json");
    EXPECT_EQ(run("flight-mode").output, "ok\n");
    EXPECT_EQ(run("registration show --json").json()["registered"], false);
    expect_refusal("flight-mode", 13);
    expect_refusal("sms send +15550101 hello", 13);
    const Outcome back = run("registration register --json");
    EXPECT_EQ(back.status, 0) << back.error;
    EXPECT_TRUE(back.json()["application_id"].is_number());
    const auto lines = watch.lines();
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0]["registered"], false);
    EXPECT_EQ(lines[1]["registered"], true);
    EXPECT_THAT(run("registration show").output, HasSubstr(": registered over LTE for voice"));
}

TEST_F(Services, StoreMessagesForASlotInFlightMode) {
    Watcher inbox("--slot 1 sms watch --count 1 --json");
    expect_ok("--slot 1 flight-mode");
    expect_ok("sms send +15550101 later --wait");
    expect_ok("--slot 1 registration register");
    EXPECT_EQ(inbox.lines().at(0)["message"]["text"], "later");
}

TEST_F(Services, LogAUserInAndOut) {
    Watcher events("monitor login-state --count 3 --json");
    expect_refusal("login alice wrong", 18);
    expect_refusal("logout", 13);
    EXPECT_EQ(run("login alice secret").output, "ok\n");
    events.wait_for_output(R"("value_1":2)");
    EXPECT_THAT(run("login-state").output, HasSubstr(": logged in\n"));
    EXPECT_EQ(run("login-state --kind push-to-talk --json").json()["value_1"], 0);
    EXPECT_EQ(run("logout").output, "ok\n");
    const auto lines = events.lines();
    ASSERT_EQ(lines.size(), 3u);
    EXPECT_EQ(lines[0]["value_1"], 1);
    EXPECT_EQ(lines[2]["value_1"], 0);
    EXPECT_EQ(run("login-state").output, "value_1=0 value_2=0 value_3=0: logged out: asked for\n");
}

TEST_F(Services, KeepCallWaiting) {
    EXPECT_EQ(run("ss waiting get").output, "CLASS  STATUS\nvoice  on\nvideo  on\n");
    EXPECT_EQ(run("ss waiting set off --class video").output, "ok\n");
    EXPECT_EQ(run("ss waiting get --json").json()["entries"],
              Json::parse(R"([{"ss_class":1,"ss_status":1},{"ss_class":2,"ss_status":0}])"));
}

TEST_F(Services, ForwardCalls) {
    expect_ok("--slot 1 ss forwarding set unconditional on --to +15550150");
    EXPECT_EQ(run("--slot 1 ss forwarding get unconditional --class voice").output,
              "CLASS  STATUS  CONDITION      SECONDS  TARGET\n"
              "voice  on      unconditional  0        +15550150\n");
    EXPECT_EQ(run("--slot 1 ss forwarding get --json").json()["entries"].size(), 8u);
    const Outcome call = run("call dial +15550101 --wait");
    EXPECT_EQ(call.status, 0) << call.error;
    EXPECT_THAT(call.output, HasSubstr("call-forwarded session_id=1"));
    expect_ok("--slot 1 ss forwarding set all off");
    EXPECT_THAT(run("--slot 1 ss forwarding get unconditional --class voice").output,
                HasSubstr("\nvoice  off     unconditional"));
    expect_refusal("ss forwarding set busy on", 10);
}

TEST_F(Services, BarCalls) {
    expect_refusal("ss barring set outgoing on --password 1234", 18);
    expect_ok("ss barring set outgoing on --password 0000 --class voice");
    EXPECT_EQ(run("ss barring get outgoing").output,
              "CLASS  STATUS  CALLS\nvoice  on      outgoing\nvideo  off     outgoing\n");
    expect_refusal("call dial +15550101", 16);
    expect_ok("ss barring set all off --password 0000");
    expect_ok("call dial +15550101");
}

TEST(ServicesRun, SendsAMessageOnTheBusThatIsMadeForIt) {
    Process process({program("ims-sim"), "run", "--", program("imsctl"), "sms", "send", "+15550101",
                     "hello", "--wait", "--json"},
                    strict_environment());
    EXPECT_EQ(process.wait(), 0) << process.both();
    EXPECT_EQ(Json::parse(process.output())["parts"][0]["message_number"], 1);
}

} // namespace
} // namespace test
