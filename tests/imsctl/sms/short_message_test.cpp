// SPDX-License-Identifier: Apache-2.0
// From a text to TPDUs and back, without a bus.
#include "imsctl/sms/module.hpp"
#include "imsctl/sms/received_message.hpp"
#include "imsctl/sms/short_message.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <ims.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

using testing::HasSubstr;

Submission to(const std::string &text) {
    Submission submission;
    submission.destination = tpdu::number_address("+15550101").value();
    submission.text = text;
    submission.reference = 7;
    return submission;
}

std::string repeated(std::string_view piece, std::size_t count) {
    std::string text;
    for (std::size_t i = 0; i < count; ++i)
        text += piece;
    return text;
}

std::vector<tpdu::Submit> decoded(const Submitted &submitted) {
    std::vector<tpdu::Submit> submits;
    for (const SubmittedPart &part : submitted.parts)
        submits.push_back(tpdu::decode_submit(part.tpdu).value());
    return submits;
}

struct SplitRow {
    const char *name;
    std::string text;
    tpdu::Alphabet alphabet;
    std::size_t parts;
};

void PrintTo(const SplitRow &row, std::ostream *out) {
    *out << row.name;
}

class Split : public ::testing::TestWithParam<SplitRow> {};

TEST_P(Split, TakesAsManyMessagesAsItHasTo) {
    const auto submitted = compose(to(GetParam().text));
    ASSERT_TRUE(submitted) << submitted.error().message;
    EXPECT_EQ(submitted->alphabet, GetParam().alphabet);
    ASSERT_EQ(submitted->parts.size(), GetParam().parts);
    tpdu::Reassembler reassembler;
    std::string text;
    std::uint8_t reference = 7;
    for (const tpdu::Submit &submit : decoded(*submitted)) {
        EXPECT_EQ(submit.message_reference, reference++);
        EXPECT_EQ(tpdu::to_text(submit.destination), "+15550101");
        const auto complete =
            reassembler.add(submit.destination, submit.data_coding, submit.user_data);
        if (complete)
            text = complete->text().value();
    }
    EXPECT_EQ(text, GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    All, Split,
    ::testing::Values(SplitRow{"Gsm7", "hello", tpdu::Alphabet::kGsm7, 1},
                      SplitRow{"Gsm7Full", repeated("a", 160), tpdu::Alphabet::kGsm7, 1},
                      SplitRow{"Gsm7OneMore", repeated("a", 161), tpdu::Alphabet::kGsm7, 2},
                      SplitRow{"Gsm7TwoFull", repeated("a", 306), tpdu::Alphabet::kGsm7, 2},
                      SplitRow{"Gsm7Three", repeated("a", 307), tpdu::Alphabet::kGsm7, 3},
                      SplitRow{"Gsm7Extended", repeated("€", 80), tpdu::Alphabet::kGsm7, 1},
                      SplitRow{"Gsm7ExtendedMore", repeated("€", 81), tpdu::Alphabet::kGsm7, 2},
                      SplitRow{"Ucs2", "привет", tpdu::Alphabet::kUcs2, 1},
                      SplitRow{"Ucs2Full", repeated("я", 70), tpdu::Alphabet::kUcs2, 1},
                      SplitRow{"Ucs2OneMore", repeated("я", 71), tpdu::Alphabet::kUcs2, 2},
                      SplitRow{"Ucs2Pairs", repeated("🙂", 40), tpdu::Alphabet::kUcs2, 2}),
    [](const ::testing::TestParamInfo<SplitRow> &row) { return row.param.name; });

TEST(Compose, PassesOnWhatWasAskedFor) {
    Submission submission = to("hello");
    submission.message_class = tpdu::MessageClass::kFlash;
    submission.status_report = true;
    submission.validity = parse_validity("1h").value();
    const tpdu::Submit submit = decoded(compose(submission).value()).at(0);
    EXPECT_TRUE(submit.status_report_request);
    EXPECT_EQ(tpdu::decode_data_coding(submit.data_coding).message_class,
              tpdu::MessageClass::kFlash);
    EXPECT_EQ(tpdu::lifetime(submit.validity, 0), std::chrono::hours(1));

    const tpdu::Submit plain = decoded(compose(to("hello")).value()).at(0);
    EXPECT_FALSE(plain.status_report_request);
    EXPECT_EQ(plain.data_coding, 0);
    EXPECT_EQ(tpdu::lifetime(plain.validity, 0), std::nullopt);
}

TEST(Compose, SendsDataAsItIs) {
    Submission submission = to("");
    submission.data = tpdu::Octets{0x00, 0xFF, 0x1B};
    const Submitted submitted = compose(submission).value();
    EXPECT_EQ(submitted.alphabet, tpdu::Alphabet::kEightBit);
    const tpdu::Submit submit = decoded(submitted).at(0);
    EXPECT_EQ(tpdu::decode_data_coding(submit.data_coding).alphabet, tpdu::Alphabet::kEightBit);
    EXPECT_EQ(submit.user_data.body, (tpdu::Octets{0x00, 0xFF, 0x1B}));

    submission.data = tpdu::Octets(140);
    EXPECT_TRUE(compose(submission));
    submission.data = tpdu::Octets(141);
    EXPECT_FALSE(compose(submission));
}

TEST(Compose, LetsTheReferencesStartOver) {
    Submission submission = to(repeated("a", 161));
    submission.reference = 255;
    const Submitted submitted = compose(submission).value();
    EXPECT_EQ(submitted.parts.at(0).reference, 255);
    EXPECT_EQ(submitted.parts.at(1).reference, 0);
}

TEST(Compose, RefusesWhatNoMessageCanHold) {
    EXPECT_FALSE(compose(to("\xff")));
    EXPECT_FALSE(compose(to(repeated("a", 255 * 153 + 1))));
    EXPECT_TRUE(compose(to(repeated("a", 255 * 153))));
}

TEST(UsualReference, DependsOnTheMessageAlone) {
    EXPECT_EQ(usual_reference("+15550101", "hello"), usual_reference("+15550101", "hello"));
    EXPECT_NE(usual_reference("+15550101", "hello"), usual_reference("+15550102", "hello"));
    EXPECT_NE(usual_reference("+15550101", "hello"), usual_reference("+15550101", "hallo"));
}

TEST(ParseValidity, TakesANumberAndAUnit) {
    const auto seconds_of = [](std::string_view text) {
        return tpdu::lifetime(parse_validity(text).value(), 0)->count();
    };
    EXPECT_EQ(seconds_of("1s"), 1);
    EXPECT_EQ(seconds_of("255s"), 255);
    EXPECT_EQ(seconds_of("5m"), 300);
    EXPECT_EQ(seconds_of("7m"), 600); // in steps of five minutes
    EXPECT_EQ(seconds_of("12h"), 12 * 3600);
    EXPECT_EQ(seconds_of("2d"), 2 * 86400);
    EXPECT_EQ(seconds_of("63w"), 63 * 7 * 86400);
    for (const char *wrong : {"", "m", "5", "0m", "-5m", "5y", "256s", "64w", "5 m", "9999999999m",
                              "2147483647w", "5mm"})
        EXPECT_FALSE(parse_validity(wrong)) << wrong;
}

tpdu::Deliver delivery(const tpdu::UserData &user_data, std::uint8_t data_coding = 0) {
    tpdu::Deliver deliver;
    deliver.originator = tpdu::number_address("+15550100").value();
    deliver.service_centre_time = {2031, 4, 9, 8, 15, 30, 4};
    deliver.data_coding = data_coding;
    deliver.user_data = user_data;
    return deliver;
}

Bytes octets_of(const tpdu::Deliver &deliver) {
    return tpdu::encode(deliver).value();
}

tpdu::StatusReport status_report() {
    tpdu::StatusReport report;
    report.message_reference = 7;
    report.recipient = tpdu::number_address("+15550101").value();
    report.service_centre_time = {2031, 4, 9, 8, 15, 30, 0};
    report.discharge_time = {2031, 4, 9, 8, 16, 0, 0};
    report.status = 0x46;
    return report;
}

std::string words(const Received &received) {
    Event event{
        find_event(sms_events(), IMS_NOTI_SMS_INCOMING_SMS), {{"member_3", std::int64_t{3}}}, 0};
    return to_text(received, event).substr(std::string_view("00:00:00.000 ").size());
}

Json json(const Received &received) {
    const Event event{
        find_event(sms_events(), IMS_NOTI_SMS_INCOMING_SMS),
        {{"tpdu", Binary{{1}}}, {"member_3", std::int64_t{3}}, {"member_4", std::int64_t{0}}},
        0};
    return to_json(received, event, 1);
}

TEST(MessageReader, ReadsAText) {
    MessageReader reader;
    const Received received = reader.read(
        octets_of(delivery(tpdu::encode_text("a\x1b[2Jb", tpdu::Alphabet::kUcs2).value(),
                           tpdu::data_coding_for(tpdu::Alphabet::kUcs2))));
    EXPECT_TRUE(received.is_complete());
    EXPECT_TRUE(received.wants_report);
    EXPECT_EQ(words(received),
              R"(message 3: from +15550100, sent 2031-04-09T08:15:30+01:00: "a\x1b[2Jb")");
    EXPECT_EQ(json(received), Json::parse(R"({"event":"sms-incoming-sms","id":769,"slot":1,
        "time":"1970-01-01T00:00:00.000000Z","member_3":3,"member_4":0,
        "message":{"number":"+15550100","sent":"2031-04-09T08:15:30+01:00","alphabet":"ucs2",
                   "class":null,"parts":1,"text":"a\u001b[2Jb","data":null}})"));
}

TEST(MessageReader, PutsPartsTogetherInAnyOrder) {
    const std::string text = repeated("0123456789", 31);
    const auto segments = tpdu::segment(text, {.reference = 5}).value();
    ASSERT_EQ(segments.parts.size(), 3u);
    MessageReader reader;
    for (const std::size_t i : {2u, 0u}) {
        const Received received = reader.read(octets_of(delivery(segments.parts[i])));
        EXPECT_FALSE(received.is_complete());
        EXPECT_TRUE(received.wants_report);
        EXPECT_EQ(reader.incomplete(), 1u);
    }
    const Received received = reader.read(octets_of(delivery(segments.parts[1])));
    EXPECT_TRUE(received.is_complete());
    EXPECT_EQ(reader.incomplete(), 0u);
    EXPECT_EQ(json(received)["message"]["text"], text);
    EXPECT_EQ(json(received)["message"]["parts"], 3);
    EXPECT_THAT(words(received), HasSubstr(", 3 parts: \"0123"));
}

TEST(MessageReader, ShowsDataThatIsNoText) {
    MessageReader reader;
    tpdu::UserData data;
    data.body = {0x00, 0xFF};
    const Received received = reader.read(octets_of(delivery(
        data, tpdu::data_coding_for(tpdu::Alphabet::kEightBit, tpdu::MessageClass::kSimSpecific))));
    EXPECT_EQ(words(received),
              "message 3: from +15550100, sent 2031-04-09T08:15:30+01:00, class sim: 00ff");
    const Json message = json(received)["message"];
    EXPECT_EQ(message["alphabet"], "8bit");
    EXPECT_EQ(message["class"], 2);
    EXPECT_EQ(message["text"], nullptr);
    EXPECT_EQ(message["data"], "AP8=");
}

TEST(MessageReader, ReadsAStatusReport) {
    MessageReader reader;
    const Received received = reader.read(tpdu::encode(status_report()).value());
    EXPECT_TRUE(received.is_complete());
    EXPECT_FALSE(received.wants_report);
    EXPECT_EQ(words(received), "message 3: status report, delivery to +15550101 (reference 7): "
                               "validity period expired (status 70)");
    EXPECT_EQ(json(received)["status_report"], Json::parse(R"({"number":"+15550101","reference":7,
        "sent":"2031-04-09T08:15:30+00:00","discharged":"2031-04-09T08:16:00+00:00","status":70,
        "status_text":"validity period expired"})"));
}

TEST(MessageReader, SaysWhatItCannotRead) {
    MessageReader reader;
    const Received truncated = reader.read(Bytes{0x04, 0x0B});
    EXPECT_TRUE(truncated.is_complete());
    EXPECT_FALSE(truncated.wants_report);
    EXPECT_THAT(words(truncated), HasSubstr("message 3: not readable: "));
    EXPECT_THAT(words(truncated), HasSubstr(": 040b"));
    EXPECT_EQ(json(truncated)["unreadable"]["tpdu"], "BAs=");
    EXPECT_NE(json(truncated)["unreadable"]["problem"], "");

    tpdu::SubmitReport report;
    report.service_centre_time = {2031, 4, 9, 8, 15, 30, 0};
    const Received misplaced = reader.read(tpdu::encode(report).value());
    EXPECT_THAT(words(misplaced), HasSubstr("not readable: an SMS-SUBMIT-REPORT"));
}

TEST(Describe, SaysInOneLineWhatATpduIs) {
    const auto plain = tpdu::encode_text("hi\n", tpdu::Alphabet::kGsm7).value();
    EXPECT_EQ(describe(octets_of(delivery(plain))), R"(message from +15550100: "hi\n")");
    const auto segments = tpdu::segment(repeated("a", 161)).value();
    EXPECT_EQ(describe(octets_of(delivery(segments.parts[1]))),
              "message from +15550100: \"aaaaaaaa\" (part 2 of 2)");
    tpdu::UserData data;
    data.body = {0xAB};
    EXPECT_EQ(describe(octets_of(delivery(data, 0x04))), "message from +15550100: ab");
    EXPECT_EQ(describe(tpdu::encode(status_report()).value()),
              "delivery to +15550101 (reference 7): validity period expired (status 70)");
    tpdu::SubmitReport report;
    report.service_centre_time = {2031, 4, 9, 8, 15, 30, 0};
    EXPECT_EQ(describe(tpdu::encode(report).value()), "taken by the service centre");
    report.failure_cause = 0xC3;
    EXPECT_EQ(describe(tpdu::encode(report).value()),
              "refused by the service centre: invalid address (cause 195)");
    EXPECT_THAT(describe(tpdu::Octets{0x00}), HasSubstr("not readable: "));
    EXPECT_THAT(describe(tpdu::Octets{}), HasSubstr("not readable: "));
}

} // namespace
} // namespace imsctl
