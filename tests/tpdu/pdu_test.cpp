// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/pdu.hpp"

#include <gtest/gtest.h>

#include <vector>

// The octets here are composed by hand from the standard's layout, field by field.

namespace {

using namespace tpdu;
using tpdu_test::hex;
using tpdu_test::must;

const Timestamp kSubmitted{2031, 4, 9, 8, 15, 30, -20}; // 13 40 90 80 51 03 0A
const Timestamp kDischarged{2031, 4, 9, 8, 16, 30, -20};

UserData text(std::string_view characters) {
    return must(encode_text(characters, Alphabet::kGsm7));
}

TEST(Submit, WorkedExample) {
    // Type 01, relative validity 10 in bits 4 and 3, status report request in bit 5: 0x31.
    // One day is step 167 of the validity scale.
    const Octets octets = hex("31 2A 08 91 51551010 00 00 A7 0A E8329BFD4697D9EC37");
    Submit submit;
    submit.status_report_request = true;
    submit.message_reference = 42;
    submit.destination = must(number_address("+15550101"));
    submit.validity = RelativeValidity{167};
    submit.user_data = text("hellohello");
    EXPECT_EQ(must(encode(submit)), octets);
    EXPECT_EQ(must(decode_submit(octets)), submit);
}

TEST(Submit, EveryFlagHasItsBit) {
    const auto first_octet = [](auto set) {
        Submit submit;
        set(submit);
        return must(encode(submit))[0];
    };
    EXPECT_EQ(first_octet([](Submit &) {}), 0x01);
    EXPECT_EQ(first_octet([](Submit &s) { s.reject_duplicates = true; }), 0x05);
    EXPECT_EQ(first_octet([](Submit &s) { s.validity = EnhancedValidity{}; }), 0x09);
    EXPECT_EQ(first_octet([](Submit &s) { s.validity = RelativeValidity{}; }), 0x11);
    EXPECT_EQ(first_octet([](Submit &s) { s.validity = Timestamp{}; }), 0x19);
    EXPECT_EQ(first_octet([](Submit &s) { s.status_report_request = true; }), 0x21);
    EXPECT_EQ(first_octet([](Submit &s) { s.user_data.header.emplace(); }), 0x41);
    EXPECT_EQ(first_octet([](Submit &s) { s.reply_path = true; }), 0x81);
}

TEST(Submit, ProtocolIdentifierAndCodingStandInTheirPlaces) {
    Submit submit;
    submit.destination = must(number_address("12"));
    submit.protocol_identifier = 0x40;
    submit.data_coding = 0xF6;
    submit.user_data.body = hex("AB");
    EXPECT_EQ(must(encode(submit)), hex("01 00 02 81 21 40 F6 01 AB"));
    EXPECT_EQ(must(decode_submit(hex("01 00 02 81 21 40 F6 01 AB"))), submit);
}

TEST(Deliver, WorkedExample) {
    // No more messages in bit 2. The sender is a name: 7 septets, 13 semi-octets, type 101.
    const Octets octets = hex("04 0D D0 D772988E2ECB01 00 00 1340908051030A"
                              "0C C8F71D14969741F977FD07");
    Deliver deliver;
    deliver.originator = must(alphanumeric_address("Weather"));
    deliver.service_centre_time = kSubmitted;
    deliver.user_data = text("How are you?");
    EXPECT_EQ(must(encode(deliver)), octets);
    EXPECT_EQ(must(decode_deliver(octets)), deliver);
    EXPECT_EQ(must(decode_text(deliver.data_coding, deliver.user_data.body)), "How are you?");
}

TEST(Deliver, OnePartOfALongText) {
    // Header indicator in bit 6; 48 bits of header and one fill bit before "AB".
    const Octets octets = hex("44 08 91 51550010 00 00 1340908051030A 09 05 00 03 07 03 02 8242");
    Deliver deliver;
    deliver.originator = must(number_address("+15550001"));
    deliver.service_centre_time = kSubmitted;
    deliver.user_data = {UserDataHeader{{{0x00, hex("070302")}}}, {'A', 'B'}};
    EXPECT_EQ(must(encode(deliver)), octets);
    EXPECT_EQ(must(decode_deliver(octets)), deliver);
}

TEST(Deliver, EveryFlagHasItsBit) {
    const auto first_octet = [](auto set) {
        Deliver deliver;
        set(deliver);
        return must(encode(deliver))[0];
    };
    EXPECT_EQ(first_octet([](Deliver &) {}), 0x04);
    EXPECT_EQ(first_octet([](Deliver &d) { d.more_messages = true; }), 0x00);
    EXPECT_EQ(first_octet([](Deliver &d) { d.loop_prevention = true; }), 0x0C);
    EXPECT_EQ(first_octet([](Deliver &d) { d.status_report_indication = true; }), 0x24);
    EXPECT_EQ(first_octet([](Deliver &d) { d.user_data.header.emplace(); }), 0x44);
    EXPECT_EQ(first_octet([](Deliver &d) { d.reply_path = true; }), 0x84);
}

TEST(Deliver, TheReservedTypeIsReadAsOne) {
    const auto deliver = decode_deliver(hex("07 02 81 21 00 00 1340908051030A 00"));
    EXPECT_EQ(must(deliver).originator.text, "12");
    EXPECT_TRUE(std::holds_alternative<Deliver>(
        must(decode_to_mobile(hex("07 02 81 21 00 00 1340908051030A 00")))));
}

TEST(StatusReport, WorkedExample) {
    const Octets octets = hex("06 2A 08 91 51551010 1340908051030A 1340908061030A 00");
    StatusReport report;
    report.message_reference = 42;
    report.recipient = must(number_address("+15550101"));
    report.service_centre_time = kSubmitted;
    report.discharge_time = kDischarged;
    EXPECT_EQ(must(encode(report)), octets);
    EXPECT_EQ(must(decode_status_report(octets)), report);
}

TEST(StatusReport, WithEveryParameter) {
    const Octets octets =
        hex("66 01 02 81 21 1340908051030A 1340908061030A 46 07 41 04 05 02 70 00 CAFE");
    StatusReport report;
    report.for_command = true;
    report.message_reference = 1;
    report.recipient = must(number_address("12"));
    report.service_centre_time = kSubmitted;
    report.discharge_time = kDischarged;
    report.status = 0x46;
    report.parameters = {std::uint8_t{0x41}, std::uint8_t{0x04},
                         UserData{UserDataHeader{{{0x70, {}}}}, hex("CAFE")}};
    EXPECT_EQ(must(encode(report)), octets);
    EXPECT_EQ(must(decode_status_report(octets)), report);
}

TEST(StatusReport, EveryFlagHasItsBit) {
    const auto first_octet = [](auto set) {
        StatusReport report;
        set(report);
        return must(encode(report))[0];
    };
    EXPECT_EQ(first_octet([](StatusReport &) {}), 0x06);
    EXPECT_EQ(first_octet([](StatusReport &r) { r.more_messages = true; }), 0x02);
    EXPECT_EQ(first_octet([](StatusReport &r) { r.loop_prevention = true; }), 0x0E);
    EXPECT_EQ(first_octet([](StatusReport &r) { r.for_command = true; }), 0x26);
}

TEST(StatusReport, AnIndicatorOfNothingIsAccepted) {
    const auto report =
        must(decode_status_report(hex("06 2A 02 81 21 1340908051030A 1340908061030A 00 00")));
    EXPECT_EQ(report.parameters, ReportParameters{});
}

TEST(DeliverReport, AckAndError) {
    EXPECT_EQ(must(encode(DeliverReport{})), hex("00 00"));
    EXPECT_EQ(must(decode_deliver_report(hex("00 00"), ReportKind::kAck)), DeliverReport{});
    const DeliverReport memory_exceeded{std::uint8_t{0xD3}, {}};
    EXPECT_EQ(must(encode(memory_exceeded)), hex("00 D3 00"));
    EXPECT_EQ(must(decode_deliver_report(hex("00 D3 00"), ReportKind::kError)), memory_exceeded);
}

TEST(DeliverReport, EveryCombinationOfParameters) {
    const std::vector<std::pair<ReportParameters, std::string_view>> rows = {
        {{std::uint8_t{0x7F}, std::nullopt, std::nullopt}, "01 7F"},
        {{std::nullopt, std::uint8_t{0x04}, std::nullopt}, "02 04"},
        {{std::uint8_t{0x7F}, std::uint8_t{0x04}, std::nullopt}, "03 7F 04"},
        // Without a coding of its own the data is text of the default alphabet.
        {{std::nullopt, std::nullopt, text("Hi")}, "04 02 C834"},
        {{std::uint8_t{0x7F}, std::nullopt, text("Hi")}, "05 7F 02 C834"},
        {{std::nullopt, std::uint8_t{0x04}, UserData{std::nullopt, hex("0102")}}, "06 04 02 0102"},
        {{std::uint8_t{0x7F}, std::uint8_t{0x04}, UserData{std::nullopt, hex("0102")}},
         "07 7F 04 02 0102"},
    };
    for (const auto &[parameters, tail] : rows) {
        const DeliverReport ack{std::nullopt, parameters};
        const Octets ack_octets = hex("00" + std::string(tail));
        EXPECT_EQ(must(encode(ack)), ack_octets);
        EXPECT_EQ(must(decode_deliver_report(ack_octets, ReportKind::kAck)), ack);
        const DeliverReport error{std::uint8_t{0xD5}, parameters};
        const Octets error_octets = hex("00 D5" + std::string(tail));
        EXPECT_EQ(must(encode(error)), error_octets);
        EXPECT_EQ(must(decode_deliver_report(error_octets, ReportKind::kError)), error);
    }
}

TEST(DeliverReport, WithAHeader) {
    const DeliverReport report{
        std::nullopt,
        {std::nullopt, std::uint8_t{0x04}, UserData{UserDataHeader{{{0x70, {}}}}, hex("AB")}}};
    EXPECT_EQ(must(encode(report)), hex("40 06 04 04 02 70 00 AB"));
    EXPECT_EQ(must(decode_deliver_report(hex("40 06 04 04 02 70 00 AB"), ReportKind::kAck)),
              report);
}

TEST(Reports, ParametersOfALaterVersionAreLeftAlone) {
    // A reserved bit announces something behind what is known.
    EXPECT_EQ(must(decode_deliver_report(hex("00 09 7F AABBCC"), ReportKind::kAck)),
              (DeliverReport{std::nullopt, {std::uint8_t{0x7F}, std::nullopt, std::nullopt}}));
    // The top bit continues the indicator in a further octet, and that one in yet another.
    EXPECT_EQ(must(decode_deliver_report(hex("00 81 81 01 7F AA"), ReportKind::kAck)),
              (DeliverReport{std::nullopt, {std::uint8_t{0x7F}, std::nullopt, std::nullopt}}));
}

TEST(SubmitReport, AckAndError) {
    SubmitReport report;
    report.service_centre_time = kSubmitted;
    EXPECT_EQ(must(encode(report)), hex("01 00 1340908051030A"));
    EXPECT_EQ(must(decode_submit_report(hex("01 00 1340908051030A"), ReportKind::kAck)), report);
    report.failure_cause = 0xC4;
    EXPECT_EQ(must(encode(report)), hex("01 C4 00 1340908051030A"));
    EXPECT_EQ(must(decode_submit_report(hex("01 C4 00 1340908051030A"), ReportKind::kError)),
              report);
}

TEST(SubmitReport, WithEveryParameter) {
    const Octets octets = hex("41 C3 07 1340908051030A 00 08 07 04 70 02 0102 6F22");
    SubmitReport report;
    report.failure_cause = 0xC3;
    report.service_centre_time = kSubmitted;
    report.parameters = {std::uint8_t{0x00}, std::uint8_t{0x08},
                         UserData{UserDataHeader{{{0x70, hex("0102")}}}, hex("6F22")}};
    EXPECT_EQ(must(encode(report)), octets);
    EXPECT_EQ(must(decode_submit_report(octets, ReportKind::kError)), report);
}

TEST(Reports, LikelyKind) {
    EXPECT_EQ(likely_report_kind(hex("00 07")), ReportKind::kAck);
    EXPECT_EQ(likely_report_kind(hex("00 7F")), ReportKind::kAck);
    EXPECT_EQ(likely_report_kind(hex("00 80 00")), ReportKind::kError);
    EXPECT_EQ(likely_report_kind(hex("00 FF 00")), ReportKind::kError);
    EXPECT_EQ(likely_report_kind(hex("00")), ReportKind::kAck);
    EXPECT_EQ(likely_report_kind({}), ReportKind::kAck);
}

/// Every parameter, and that much 8-bit data.
ReportParameters parameters(std::size_t octets) {
    return {std::uint8_t{0}, std::uint8_t{0x04}, UserData{std::nullopt, Octets(octets, 0xAA)}};
}

TEST(Reports, EachMessageHasItsOwnLimit) {
    struct Row {
        const char *name;
        std::size_t octets;
        Result<Octets> (*encode_with)(std::size_t octets);
    };
    const std::vector<Row> rows = {
        {"status report", 131,
         [](std::size_t octets) {
             StatusReport report;
             report.recipient = must(number_address("12345678901234567890"));
             report.parameters = parameters(octets);
             return encode(report);
         }},
        {"deliver report, ack", 159,
         [](std::size_t octets) {
             return encode(DeliverReport{std::nullopt, parameters(octets)});
         }},
        {"deliver report, error", 158,
         [](std::size_t octets) {
             return encode(DeliverReport{std::uint8_t{0xD5}, parameters(octets)});
         }},
        {"submit report, ack", 152,
         [](std::size_t octets) {
             return encode(SubmitReport{std::nullopt, {}, parameters(octets)});
         }},
        {"submit report, error", 151,
         [](std::size_t octets) {
             return encode(SubmitReport{std::uint8_t{0xC2}, {}, parameters(octets)});
         }},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(must(row.encode_with(row.octets)).size(), 164U) << row.name;
        const auto too_long = row.encode_with(row.octets + 1);
        ASSERT_FALSE(too_long) << row.name;
        EXPECT_EQ(too_long.error().kind, ErrorKind::kTooLong);
        EXPECT_EQ(too_long.error().field, "TP-UD");
    }
}

TEST(AnyMessage, FromADevice) {
    const auto submit = must(decode_from_mobile(hex("01 00 02 81 21 00 00 00")));
    EXPECT_EQ(std::get<Submit>(submit).destination.text, "12");
    const auto ack = must(decode_from_mobile(hex("00 00")));
    EXPECT_EQ(std::get<DeliverReport>(ack).failure_cause, std::nullopt);
    const auto error = must(decode_from_mobile(hex("00 D3 00")));
    EXPECT_EQ(std::get<DeliverReport>(error).failure_cause, 0xD3);
}

TEST(AnyMessage, ToADevice) {
    const auto deliver = must(decode_to_mobile(hex("04 02 81 21 00 00 1340908051030A 00")));
    EXPECT_EQ(std::get<Deliver>(deliver).originator.text, "12");
    const auto ack = must(decode_to_mobile(hex("01 00 1340908051030A")));
    EXPECT_EQ(std::get<SubmitReport>(ack).service_centre_time, kSubmitted);
    const auto error = must(decode_to_mobile(hex("01 C4 00 1340908051030A")));
    EXPECT_EQ(std::get<SubmitReport>(error).failure_cause, 0xC4);
    const auto report =
        must(decode_to_mobile(hex("06 2A 02 81 21 1340908051030A 1340908061030A 20")));
    EXPECT_EQ(std::get<StatusReport>(report).status, 0x20);
}

} // namespace
