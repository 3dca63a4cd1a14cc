// SPDX-License-Identifier: Apache-2.0
// Sending and watching short messages against a scripted service.
#include "tests/imsctl/program.hpp"
#include "tests/support/private_bus.hpp"
#include "tests/support/scripted_peer.hpp"

#include "tpdu/tpdu.hpp"

#include <csignal>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <optional>
#include <set>

namespace test {
namespace {

using testing::HasSubstr;

constexpr const char *kSendSms = "org.kelvo.ims.Sms.SendSms";
constexpr const char *kSendDeliverReport = "org.kelvo.ims.Sms.SendDeliverReport";

std::string base64(const tpdu::Octets &octets) {
    gchar *text = g_base64_encode(octets.data(), octets.size());
    const std::string copy = text;
    g_free(text);
    return copy;
}

tpdu::Octets unbase64(const char *text) {
    gsize size = 0;
    guchar *data = g_base64_decode(text, &size);
    const tpdu::Octets octets(data, data + size);
    g_free(data);
    return octets;
}

// What SendSms was called with.
struct Sent {
    std::int32_t application = 0;
    tpdu::Submit submit{};
    std::int32_t length = 0;
    std::size_t octets = 0;
    std::string service_centre{}; // in hexadecimal
    std::int32_t option = 0;
};

Sent read_sent(const Call &call) {
    Sent sent;
    const char *tpdu = nullptr;
    const char *centre = nullptr;
    g_variant_get(call.body.get(), "(i&si&si)", &sent.application, &tpdu, &sent.length, &centre,
                  &sent.option);
    const tpdu::Octets octets = unbase64(tpdu);
    sent.octets = octets.size();
    sent.submit = tpdu::decode_submit(octets).value();
    sent.service_centre = tpdu::to_hex(unbase64(centre));
    return sent;
}

class Sms : public ::testing::Test {
  protected:
    Sms() {
        peer_.on(kSendSms, reply("(iiii)", "(0, 1, 2, 3)"));
        peer_.on(kSendDeliverReport, reply("(iiii)", "(0, 1, 2, 3)"));
    }

    void emit_incoming(const tpdu::Octets &octets, int number, int kind = 0) {
        GVariant *body = g_variant_new("(isii)", 0, base64(octets).c_str(), number, kind);
        peer_.emit_signal(kSlotPath, kSmsInterface, "IncomingSms",
                          Variant(g_variant_ref_sink(body)));
    }

    void emit_ack(int cause, int reference, std::optional<std::uint8_t> failure = std::nullopt) {
        tpdu::SubmitReport report;
        report.failure_cause = failure;
        GVariant *body = g_variant_new("(iiisii)", 9, cause, reference,
                                       base64(tpdu::encode(report).value()).c_str(), 0, 0);
        peer_.emit_signal(kSlotPath, kSmsInterface, "SendSmsAck",
                          Variant(g_variant_ref_sink(body)));
    }

    Process &watch(const std::string &words) {
        process_.emplace(imsctl_command(split("sms watch " + words)), strict_environment());
        process_->wait_for_error("watching the short messages of slot 0\n");
        return *process_;
    }

    std::optional<PrivateBus> bus_{std::in_place};
    ScriptedPeer peer_{bus_->address()};
    std::optional<Process> process_;
};

TEST_F(Sms, SendsATextAsOneMessage) {
    const Outcome outcome = run_imsctl({"sms", "send", "+15550101", "grüße @ €"});
    EXPECT_EQ(outcome.status, 0) << outcome.error;
    EXPECT_THAT(outcome.output, testing::MatchesRegex("part=1 of=1 reference=[0-9]+\n"));
    const auto calls = peer_.calls_to(kSendSms);
    ASSERT_EQ(calls.size(), 1u);
    const Sent sent = read_sent(calls[0]);
    EXPECT_EQ(sent.application, 42);
    EXPECT_EQ(sent.length, static_cast<std::int32_t>(sent.octets));
    EXPECT_EQ(sent.option, 0);
    // The type of address alone.
    EXPECT_EQ(sent.service_centre, "0181");
    EXPECT_EQ(tpdu::to_text(sent.submit.destination), "+15550101");
    EXPECT_EQ(tpdu::decode_text(sent.submit.data_coding, sent.submit.user_data.body).value(),
              "grüße @ €");
    EXPECT_EQ(outcome.output,
              "part=1 of=1 reference=" + std::to_string(sent.submit.message_reference) + "\n");
    EXPECT_EQ(peer_.calls().size(), 2u);
}

TEST_F(Sms, TakesNumbersAsPeopleWriteThem) {
    std::set<int> references;
    for (const std::string number : {"+1 555-01.01", "+1 (555) 0101", "tel:+15550101",
                                     "tel:+1-555-0101;phone-context=example.invalid"}) {
        const Outcome outcome = run_imsctl({"sms", "send", number, "hello", "--sca", number});
        EXPECT_EQ(outcome.status, 0) << outcome.error;
        const Sent sent = read_sent(peer_.calls_to(kSendSms).back());
        EXPECT_EQ(tpdu::to_text(sent.submit.destination), "+15550101") << number;
        EXPECT_EQ(sent.service_centre, "059151551010") << number;
        references.insert(sent.submit.message_reference);
    }
    // One message, however its number is written.
    EXPECT_EQ(references.size(), 1u);
}

TEST_F(Sms, SendsEachPartWithAnAddressOfItsOwn) {
    const std::string text(400, 'a');
    const Outcome outcome = run_imsctl({"sms", "send", "+15550101", text, "--sca", "+15550999000",
                                        "--reference", "254", "--report", "--json"});
    EXPECT_EQ(outcome.status, 0) << outcome.error;
    EXPECT_EQ(outcome.output, R"({"verb":"sms send","alphabet":"gsm7","parts":[)"
                              R"({"part":1,"of":3,"reference":254},)"
                              R"({"part":2,"of":3,"reference":255},)"
                              R"({"part":3,"of":3,"reference":0}]})"
                              "\n");
    const auto calls = peer_.calls_to(kSendSms);
    ASSERT_EQ(calls.size(), 3u);
    std::string received;
    for (std::size_t i = 0; i < calls.size(); ++i) {
        const Sent sent = read_sent(calls[i]);
        // Eleven digits: the count of octets in front, and always the same.
        EXPECT_EQ(sent.service_centre, "07915155909900F0");
        EXPECT_EQ(sent.option, i < 2 ? 1 : 0);
        EXPECT_TRUE(sent.submit.status_report_request);
        const auto part = tpdu::find_concatenation(*sent.submit.user_data.header);
        ASSERT_TRUE(part);
        EXPECT_EQ(part->reference, 254);
        EXPECT_EQ(part->number, i + 1);
        received += tpdu::decode_text(sent.submit.data_coding, sent.submit.user_data.body).value();
    }
    EXPECT_EQ(received, text);
}

TEST_F(Sms, SendsDataClassValidityAndOption) {
    const Outcome outcome = run_imsctl(split(
        "sms send 5550 --data 00fF1b --class sim --validity 2d --option 5 --json --reference 3"));
    EXPECT_EQ(outcome.status, 0) << outcome.error;
    EXPECT_EQ(outcome.json()["alphabet"], "8bit");
    const Sent sent = read_sent(peer_.calls_to(kSendSms).at(0));
    EXPECT_EQ(sent.submit.user_data.body, (tpdu::Octets{0x00, 0xFF, 0x1B}));
    const auto coding = tpdu::decode_data_coding(sent.submit.data_coding);
    EXPECT_EQ(coding.alphabet, tpdu::Alphabet::kEightBit);
    EXPECT_EQ(coding.message_class, tpdu::MessageClass::kSimSpecific);
    EXPECT_EQ(tpdu::lifetime(sent.submit.validity, 0), std::chrono::hours(48));
    EXPECT_EQ(sent.option, 5);
    EXPECT_EQ(sent.submit.message_reference, 3);
}

TEST_F(Sms, StopsAtThePartThatIsRefused) {
    constexpr std::size_t kSecondPart = 2; // call 0 registers the application
    peer_.on(kSendSms, [](const Call &call) {
        return reply("(iiii)", call.number == kSecondPart ? "(77, 0, 0, 0)" : "(0, 0, 0, 0)");
    });
    const std::string text(400, 'a');
    const Outcome outcome =
        run_imsctl({"sms", "send", "+15550101", text, "--json", "--reference", "8"});
    EXPECT_EQ(outcome.status, 1);
    const Json error = outcome.json()["error"];
    EXPECT_EQ(error["kind"], "service");
    EXPECT_EQ(error["result"], 77);
    EXPECT_EQ(error["part"], 2);
    EXPECT_EQ(error["of"], 3);
    EXPECT_EQ(error["reference"], 9);
    EXPECT_EQ(peer_.calls_to(kSendSms).size(), 2u);
}

TEST_F(Sms, WaitsForTheAcknowledgementOfItsOwnMessage) {
    Process send(imsctl_command(split("sms send +15550101 hello --reference 5 --wait")),
                 strict_environment());
    peer_.wait_for_calls(kSendSms, 1);
    emit_ack(1, 6, 0xC3); // somebody else's
    emit_ack(0, 5);
    EXPECT_EQ(send.wait(), 0) << send.both();
    EXPECT_EQ(send.output(), "part=1 of=1 reference=5 message_number=9\n");
}

TEST_F(Sms, FailsWhenTheServiceCentreRefuses) {
    Process send(imsctl_command(split("sms send +15550101 hello --reference 5 --wait --json")),
                 strict_environment());
    peer_.wait_for_calls(kSendSms, 1);
    emit_ack(1, 5, 0xC3);
    EXPECT_EQ(send.wait(), 1) << send.both();
    const Json error = Json::parse(send.output())["error"];
    EXPECT_EQ(error["kind"], "not-sent");
    EXPECT_EQ(error["message"],
              "part 1 of 1 is refused by the service centre: invalid address (cause 195)");
    EXPECT_EQ(error["cause"], 1);
    EXPECT_EQ(error["message_number"], 9);
}

TEST_F(Sms, WaitsNoLongerThanItIsTold) {
    const Outcome outcome =
        run_imsctl(split("sms send +15550101 hello --wait --timeout 0.3 --json"));
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "timeout");
    EXPECT_EQ(outcome.json()["error"]["part"], 1);
}

tpdu::Deliver delivery(const std::string &text) {
    tpdu::Deliver deliver;
    deliver.originator = tpdu::number_address("+15550100").value();
    deliver.service_centre_time = {2031, 4, 9, 8, 15, 30, 0};
    deliver.user_data = tpdu::encode_text(text, tpdu::Alphabet::kGsm7).value();
    return deliver;
}

tpdu::Octets octets_of(const tpdu::Deliver &deliver) {
    return tpdu::encode(deliver).value();
}

std::string report_of(const Call &call) {
    return to_text(call.body.get());
}

std::string acknowledgement(int number) {
    return to_text(parse("(iisii)", "(42, 0, 'AAA=', 2, " + std::to_string(number) + ")").get());
}

TEST_F(Sms, ShowsAndAnswersAMessage) {
    Process &process = watch("--count 1");
    emit_incoming(octets_of(delivery("hello")), 7);
    EXPECT_EQ(process.wait(), 0) << process.both();
    EXPECT_THAT(
        process.output(),
        HasSubstr(" message 7: from +15550100, sent 2031-04-09T08:15:30+00:00: \"hello\"\n"));
    const auto calls = peer_.calls_to(kSendDeliverReport);
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(report_of(calls[0]), acknowledgement(7));
}

TEST_F(Sms, AnswersEachPartAndShowsTheWhole) {
    const std::string text = std::string(200, 'a') + std::string(200, 'b');
    const auto segments = tpdu::segment(text).value();
    ASSERT_EQ(segments.parts.size(), 3u);
    Process &process = watch("--count 1 --json");
    for (const int i : {2, 0, 1}) {
        tpdu::Deliver deliver = delivery("");
        deliver.user_data = segments.parts[static_cast<std::size_t>(i)];
        emit_incoming(octets_of(deliver), 10 + i);
    }
    EXPECT_EQ(process.wait(), 0) << process.both();
    const auto lines = json_lines(process.output());
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0]["event"], "sms-incoming-sms");
    EXPECT_EQ(lines[0]["message"]["text"], text);
    EXPECT_EQ(lines[0]["message"]["parts"], 3);
    const auto calls = peer_.calls_to(kSendDeliverReport);
    ASSERT_EQ(calls.size(), 3u);
    EXPECT_EQ(report_of(calls[0]), acknowledgement(12));
    EXPECT_EQ(report_of(calls[1]), acknowledgement(10));
    EXPECT_EQ(report_of(calls[2]), acknowledgement(11));
}

TEST_F(Sms, AnswersNothingWhenToldSo) {
    Process &process = watch("--count 1 --no-report");
    emit_incoming(octets_of(delivery("hello")), 7);
    EXPECT_EQ(process.wait(), 0);
    EXPECT_THAT(process.output(), HasSubstr("\"hello\"\n"));
    EXPECT_TRUE(peer_.calls_to(kSendDeliverReport).empty());
}

TEST_F(Sms, ShowsStatusReportsAndWhatItCannotReadWithoutAnAnswer) {
    tpdu::StatusReport report;
    report.message_reference = 5;
    report.recipient = tpdu::number_address("+15550101").value();
    report.service_centre_time = {2031, 4, 9, 8, 15, 30, 0};
    report.discharge_time = {2031, 4, 9, 8, 15, 31, 0};
    Process &process = watch("--count 2 --json");
    emit_incoming(tpdu::encode(report).value(), 1, 1);
    emit_incoming({0xFF}, 2);
    EXPECT_EQ(process.wait(), 0);
    const auto lines = json_lines(process.output());
    ASSERT_EQ(lines.size(), 2u);
    EXPECT_EQ(lines[0]["status_report"]["reference"], 5);
    EXPECT_EQ(lines[0]["status_report"]["status"], 0);
    EXPECT_EQ(lines[0]["member_4"], 1);
    EXPECT_EQ(lines[1]["unreadable"]["tpdu"], "/w==");
    EXPECT_TRUE(peer_.calls_to(kSendDeliverReport).empty());
}

TEST_F(Sms, SaysWhenAReportIsNotTakenAndGoesOn) {
    peer_.on(kSendDeliverReport, reply("(iiii)", "(13, 0, 0, 0)"));
    Process &process = watch("--count 2");
    emit_incoming(octets_of(delivery("one")), 1);
    process.wait_for_error("the delivery report on message 1: the service answered with result 13");
    emit_incoming(octets_of(delivery("two")), 2);
    EXPECT_EQ(process.wait(), 0);
    EXPECT_THAT(process.output(), HasSubstr("\"two\"\n"));
}

TEST_F(Sms, ShowsMessagesWhileAReportIsUnanswered) {
    peer_.on(kSendDeliverReport, Silence{});
    Process &process = watch("--json");
    emit_incoming(octets_of(delivery("one")), 1);
    emit_incoming(octets_of(delivery("two")), 2);
    process.wait_for_output("\"two\"");
    process.send_signal(SIGINT);
    EXPECT_EQ(process.wait(), 0);
    EXPECT_EQ(json_lines(process.output()).size(), 2u);
}

TEST_F(Sms, EndsOnSignalsAlsoWhileItWaitsForTheLastReport) {
    peer_.on(kSendDeliverReport, Silence{});
    Process &process = watch("--count 1");
    emit_incoming(octets_of(delivery("one")), 1);
    process.wait_for_output("\"one\"\n");
    peer_.wait_for_calls(kSendDeliverReport, 1);
    process.send_signal(SIGTERM);
    EXPECT_EQ(process.wait(), 0);
}

TEST_F(Sms, TellsOfMessagesThatLackParts) {
    const auto segments = tpdu::segment(std::string(161, 'a')).value();
    tpdu::Deliver deliver = delivery("");
    deliver.user_data = segments.parts[0];
    Process &process = watch("");
    emit_incoming(octets_of(deliver), 1);
    peer_.wait_for_calls(kSendDeliverReport, 1);
    process.send_signal(SIGTERM);
    EXPECT_EQ(process.wait(), 0);
    EXPECT_EQ(process.output(), "");
    EXPECT_THAT(process.error(), HasSubstr("messages that lack parts: 1\n"));
}

TEST_F(Sms, FailsWhenTheBusBreaks) {
    Process &process = watch("");
    bus_.reset();
    EXPECT_EQ(process.wait(), 1);
    EXPECT_THAT(process.error(), HasSubstr("imsctl: sms watch: the connection to the system bus"));
}

} // namespace
} // namespace test
