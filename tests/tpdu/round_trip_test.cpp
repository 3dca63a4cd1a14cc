// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/tpdu.hpp"

#include <gtest/gtest.h>

#include <algorithm>
#include <vector>

namespace {

using namespace tpdu;
using tpdu_test::must;
using tpdu_test::Random;

const std::vector<std::string> kGsm7Characters = {
    "a", "Z", "0", " ", "@", "\n", "\r", "é", "Ω", "ß", "¿",
    "à", "€", "[", "]", "{", "}",  "\\", "^", "~", "|", "\f",
};
const std::vector<std::string> kOtherCharacters = {"ç",          "漢",     "字", "😀",
                                                   "\U0010FFFF", "\uFFFD", "я"};

std::string random_text(Random &random, std::size_t characters, bool with_others) {
    std::string text;
    for (std::size_t i = 0; i < characters; ++i) {
        const auto &set = with_others && random.below(4) == 0 ? kOtherCharacters : kGsm7Characters;
        text += set[random.below(static_cast<std::uint32_t>(set.size()))];
    }
    return text;
}

Address random_address(Random &random) {
    if (random.below(4) == 0)
        return must(alphanumeric_address(random.pick_from("Az09 @_-", 1 + random.below(11))));
    Address address;
    do
        address.type = static_cast<TypeOfNumber>(random.below(8));
    while (address.type == TypeOfNumber::kAlphanumeric);
    address.plan = static_cast<NumberingPlan>(random.below(16));
    address.text = random.pick_from("0123456789*#abc", random.below(21));
    return address;
}

Timestamp random_time(Random &random) {
    return must(timestamp_from_unix(946771200 + std::int64_t{random.below(3155000000U)},
                                    static_cast<int>(random.below(159)) - 79));
}

Validity random_validity(Random &random) {
    switch (random.below(6)) {
    case 0:
        return std::monostate{};
    case 1:
        return RelativeValidity{random.octet()};
    case 2:
        return random_time(random);
    case 3:
        return EnhancedValidity{random.coin(), RelativeValidity{random.octet()}};
    case 4:
        return EnhancedValidity{random.coin(),
                                SecondsValidity{static_cast<std::uint8_t>(1 + random.below(255))}};
    default:
        return EnhancedValidity{random.coin(), ClockValidity{static_cast<int>(random.below(100)),
                                                             static_cast<int>(random.below(60)),
                                                             static_cast<int>(random.below(60))}};
    }
}

std::optional<UserDataHeader> random_header(Random &random) {
    if (random.coin())
        return std::nullopt;
    UserDataHeader header;
    for (std::uint32_t i = random.below(4); i > 0; --i)
        header.elements.push_back({random.octet(), random.octets(random.below(12))});
    return header;
}

/// User data that fits into `limit` octets, up to the very last one.
UserData random_user_data(Random &random, std::uint8_t data_coding, std::size_t limit) {
    const DataCoding coding = decode_data_coding(data_coding);
    UserData user_data;
    user_data.header = random_header(random);
    const bool septets = coding.alphabet == Alphabet::kGsm7 && !coding.compressed;
    const std::size_t room = septets ? limit * 8 / 7 - header_septets(user_data.header)
                                     : limit - header_size(user_data.header);
    std::size_t size = random.below(4) == 0 ? room : random.below(static_cast<std::uint32_t>(room));
    if (coding.alphabet == Alphabet::kUcs2)
        size -= size % 2;
    user_data.body = random.octets(size);
    if (septets) {
        for (std::uint8_t &septet : user_data.body)
            septet &= 0x7F;
    }
    return user_data;
}

ReportParameters random_parameters(Random &random, std::size_t limit) {
    ReportParameters parameters;
    if (random.coin())
        parameters.protocol_identifier = random.octet();
    if (random.coin())
        parameters.data_coding = random.octet();
    if (random.coin())
        parameters.user_data = random_user_data(random, parameters.data_coding.value_or(0), limit);
    return parameters;
}

std::optional<std::uint8_t> random_cause(Random &random) {
    if (random.coin())
        return std::nullopt;
    return static_cast<std::uint8_t>(0x80 | random.octet());
}

constexpr int kRounds = 3000;
constexpr std::size_t kLargestMessage = 164;

TEST(RoundTrip, Submit) {
    Random random(1);
    for (int i = 0; i < kRounds; ++i) {
        Submit submit;
        submit.reject_duplicates = random.coin();
        submit.status_report_request = random.coin();
        submit.reply_path = random.coin();
        submit.message_reference = random.octet();
        submit.destination = random_address(random);
        submit.protocol_identifier = random.octet();
        submit.data_coding = random.octet();
        submit.validity = random_validity(random);
        submit.user_data = random_user_data(random, submit.data_coding, 140);
        const Octets octets = must(encode(submit));
        ASSERT_LE(octets.size(), kLargestMessage);
        ASSERT_EQ(must(decode_submit(octets)), submit) << to_hex(octets);
        ASSERT_EQ(std::get<Submit>(must(decode_from_mobile(octets))), submit);
    }
}

TEST(RoundTrip, Deliver) {
    Random random(2);
    for (int i = 0; i < kRounds; ++i) {
        Deliver deliver;
        deliver.more_messages = random.coin();
        deliver.loop_prevention = random.coin();
        deliver.status_report_indication = random.coin();
        deliver.reply_path = random.coin();
        deliver.originator = random_address(random);
        deliver.protocol_identifier = random.octet();
        deliver.data_coding = random.octet();
        deliver.service_centre_time = random_time(random);
        deliver.user_data = random_user_data(random, deliver.data_coding, 140);
        const Octets octets = must(encode(deliver));
        ASSERT_LE(octets.size(), kLargestMessage);
        ASSERT_EQ(must(decode_deliver(octets)), deliver) << to_hex(octets);
        ASSERT_EQ(std::get<Deliver>(must(decode_to_mobile(octets))), deliver);
    }
}

TEST(RoundTrip, StatusReport) {
    Random random(3);
    for (int i = 0; i < kRounds; ++i) {
        StatusReport report;
        report.more_messages = random.coin();
        report.loop_prevention = random.coin();
        report.for_command = random.coin();
        report.message_reference = random.octet();
        report.recipient = random_address(random);
        report.service_centre_time = random_time(random);
        report.discharge_time = random_time(random);
        report.status = random.octet() & 0x7F;
        report.parameters = random_parameters(random, 131);
        const Octets octets = must(encode(report));
        ASSERT_LE(octets.size(), kLargestMessage);
        ASSERT_EQ(must(decode_status_report(octets)), report) << to_hex(octets);
        ASSERT_EQ(std::get<StatusReport>(must(decode_to_mobile(octets))), report);
    }
}

TEST(RoundTrip, DeliverReport) {
    Random random(4);
    for (int i = 0; i < kRounds; ++i) {
        DeliverReport report;
        report.failure_cause = random_cause(random);
        report.parameters = random_parameters(random, report.failure_cause ? 158 : 159);
        const ReportKind kind = report.failure_cause ? ReportKind::kError : ReportKind::kAck;
        const Octets octets = must(encode(report));
        ASSERT_LE(octets.size(), kLargestMessage);
        ASSERT_EQ(must(decode_deliver_report(octets, kind)), report) << to_hex(octets);
        ASSERT_EQ(likely_report_kind(octets), kind);
        ASSERT_EQ(std::get<DeliverReport>(must(decode_from_mobile(octets))), report);
    }
}

TEST(RoundTrip, SubmitReport) {
    Random random(5);
    for (int i = 0; i < kRounds; ++i) {
        SubmitReport report;
        report.failure_cause = random_cause(random);
        report.service_centre_time = random_time(random);
        report.parameters = random_parameters(random, report.failure_cause ? 151 : 152);
        const ReportKind kind = report.failure_cause ? ReportKind::kError : ReportKind::kAck;
        const Octets octets = must(encode(report));
        ASSERT_LE(octets.size(), kLargestMessage);
        ASSERT_EQ(must(decode_submit_report(octets, kind)), report) << to_hex(octets);
        ASSERT_EQ(std::get<SubmitReport>(must(decode_to_mobile(octets))), report);
    }
}

TEST(RoundTrip, Addresses) {
    Random random(6);
    for (int i = 0; i < kRounds; ++i) {
        const Address address = random_address(random);
        ASSERT_EQ(must(decode_address(must(encode_address(address)))), address);
        if (address.type != TypeOfNumber::kAlphanumeric) {
            ASSERT_EQ(must(decode_service_centre(must(encode_service_centre(address)))), address);
        }
    }
}

/// From text to messages on the wire, shuffled, and back to text.
TEST(RoundTrip, TextsThroughMessages) {
    Random random(7);
    for (int i = 0; i < 400; ++i) {
        const std::string text = random_text(random, random.below(700), random.coin());
        const ReferenceWidth width = random.coin() ? ReferenceWidth::k8Bit : ReferenceWidth::k16Bit;
        const SegmentedText segmented =
            must(segment(text, {static_cast<std::uint16_t>(random.below(256)), width, {}}));
        std::vector<Octets> wire;
        for (const UserData &part : segmented.parts) {
            Deliver deliver;
            deliver.originator = must(number_address("+15550100"));
            deliver.data_coding = data_coding_for(segmented.alphabet);
            deliver.user_data = part;
            wire.push_back(must(encode(deliver)));
        }
        for (std::size_t left = wire.size(); left > 1; --left)
            std::swap(wire[left - 1], wire[random.below(static_cast<std::uint32_t>(left))]);
        Reassembler reassembler;
        std::optional<CompleteMessage> message;
        for (const Octets &octets : wire) {
            ASSERT_FALSE(message);
            message = reassembler.add(must(decode_deliver(octets)));
        }
        ASSERT_TRUE(message);
        ASSERT_EQ(must(message->text()), text);
    }
}

} // namespace
