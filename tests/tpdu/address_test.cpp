// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/address.hpp"

#include <gtest/gtest.h>

namespace {

using tpdu::Address;
using tpdu::ErrorKind;
using tpdu::NumberingPlan;
using tpdu::TypeOfNumber;
using tpdu_test::hex;
using tpdu_test::must;

const Address kInternational{TypeOfNumber::kInternational, NumberingPlan::kIsdn, "15550101"};

TEST(Address, EvenAndOddNumbersOfDigits) {
    EXPECT_EQ(must(tpdu::encode_address(kInternational)), hex("08 91 51 55 10 10"));
    EXPECT_EQ(must(tpdu::decode_address(hex("08 91 51 55 10 10"))), kInternational);

    const Address odd{TypeOfNumber::kUnknown, NumberingPlan::kIsdn, "12345"};
    EXPECT_EQ(must(tpdu::encode_address(odd)), hex("05 81 21 43 F5"));
    EXPECT_EQ(must(tpdu::decode_address(hex("05 81 21 43 F5"))), odd);
}

TEST(Address, AllDigits) {
    const Address address{TypeOfNumber::kUnknown, NumberingPlan::kIsdn, "0123456789*#abc"};
    EXPECT_EQ(must(tpdu::encode_address(address)), hex("0F 81 10 32 54 76 98 BA DC FE"));
    EXPECT_EQ(must(tpdu::decode_address(hex("0F 81 10 32 54 76 98 BA DC FE"))), address);
}

TEST(Address, TheFillerBehindAnOddNumberIsNotLookedAt) {
    EXPECT_EQ(must(tpdu::decode_address(hex("05 81 21 43 05"))).text, "12345");
}

TEST(Address, NoDigits) {
    const Address none{TypeOfNumber::kUnknown, NumberingPlan::kUnknown, ""};
    EXPECT_EQ(must(tpdu::encode_address(none)), hex("00 80"));
    EXPECT_EQ(must(tpdu::decode_address(hex("00 80"))), none);
}

TEST(Address, EveryTypeAndPlanIsCarriedThrough) {
    for (unsigned type = 0; type < 8; ++type) {
        for (unsigned plan = 0; plan < 16; ++plan) {
            const Address address{static_cast<TypeOfNumber>(type), static_cast<NumberingPlan>(plan),
                                  "123"};
            const auto octets = must(tpdu::encode_address(address));
            EXPECT_EQ(octets[1], 0x80 | type << 4 | plan);
            EXPECT_EQ(must(tpdu::decode_address(octets)), address);
        }
    }
}

TEST(Address, AlphanumericCountsUsefulSemiOctets) {
    // 7 septets are 49 bits: 12.25 semi-octets, so 13 are useful.
    const Address seven = must(tpdu::alphanumeric_address("Weather"));
    EXPECT_EQ(must(tpdu::encode_address(seven)), hex("0D D0 D772988E2ECB01"));
    EXPECT_EQ(must(tpdu::decode_address(hex("0D D0 D772988E2ECB01"))), seven);
    // 8 septets are 56 bits: 14 semi-octets.
    const Address eight = must(tpdu::alphanumeric_address("12345678"));
    EXPECT_EQ(must(tpdu::encode_address(eight)), hex("0E D0 31D98C56B3DD70"));
    EXPECT_EQ(must(tpdu::decode_address(hex("0E D0 31D98C56B3DD70"))), eight);
}

TEST(Address, AlphanumericOfEveryLength) {
    const std::string name = "@bcdefghij@";
    for (std::size_t length = 1; length <= 11; ++length) {
        const Address address = must(tpdu::alphanumeric_address(name.substr(0, length)));
        const auto octets = must(tpdu::encode_address(address));
        EXPECT_LE(octets.size(), 12U);
        EXPECT_EQ(must(tpdu::decode_address(octets)), address) << length;
    }
    // Characters of the extension table count twice: 5 of them and one more make 11 septets.
    EXPECT_TRUE(tpdu::alphanumeric_address("€€€€€x"));
    EXPECT_FALSE(tpdu::alphanumeric_address("€€€€€€"));
}

TEST(Address, FromAndToWhatPeopleWrite) {
    EXPECT_EQ(must(tpdu::number_address("+15550101")), kInternational);
    EXPECT_EQ(must(tpdu::number_address("*100#")),
              (Address{TypeOfNumber::kUnknown, NumberingPlan::kIsdn, "*100#"}));
    for (const char *text : {"+15550101", "0171", "#31#", "12345678901234567890"})
        EXPECT_EQ(to_text(must(tpdu::number_address(text))), text);
    EXPECT_EQ(to_text(must(tpdu::alphanumeric_address("Weather"))), "Weather");
}

TEST(Address, RefusesWhatIsNoNumber) {
    const auto problem = [](const char *text) {
        return tpdu::number_address(text).error().message;
    };
    EXPECT_EQ(problem(""), "number has no digits");
    EXPECT_EQ(problem("+"), "number has no digits");
    EXPECT_EQ(problem("555-01"), "number has no digit for '-' in \"555-01\" (0-9 * # a b c)");
    EXPECT_EQ(problem("++1"), "number has no digit for '+' in \"+1\" (0-9 * # a b c)");
    EXPECT_EQ(problem("123456789012345678901"), "number has 21 digits, more than the 20 that fit");
}

TEST(Address, RefusesWhatIsNoName) {
    const auto error = [](const char *text) { return tpdu::alphanumeric_address(text).error(); };
    EXPECT_EQ(error("").message, "name is empty");
    EXPECT_EQ(error("twelve chars").kind, ErrorKind::kTooLong);
    EXPECT_EQ(error("twelve chars").message,
              "name has a name of 12 septets, more than the 11 that fit");
    EXPECT_EQ(error("Ŵeather").kind, ErrorKind::kNotEncodable);
    EXPECT_EQ(error("Ŵeather").message, "name cannot be encoded: text contains U+0174, which the "
                                        "GSM 7-bit alphabet does not have");
}

TEST(Address, RefusesATypeThatTheOctetCannotHold) {
    Address address = kInternational;
    address.type = static_cast<TypeOfNumber>(8);
    EXPECT_EQ(tpdu::encode_address(address).error().kind, ErrorKind::kOutOfRange);
    address = kInternational;
    address.plan = static_cast<NumberingPlan>(16);
    EXPECT_EQ(tpdu::encode_address(address).error().kind, ErrorKind::kOutOfRange);
}

TEST(Address, DecodingErrorsNameTheFieldAndTheProblem) {
    const auto problem = [](std::string_view octets) {
        return tpdu::decode_address(hex(octets), "TP-DA").error().message;
    };
    EXPECT_EQ(problem(""), "TP-DA is missing: the message ends before it");
    EXPECT_EQ(problem("08"), "TP-DA ends before its type of address");
    EXPECT_EQ(problem("08 91 51 55"), "TP-DA says 8 semi-octets but only 2 octets follow");
    EXPECT_EQ(problem("03 91 51"), "TP-DA says 3 semi-octets but only 1 octet follows");
    EXPECT_EQ(problem("15 91 0000000000000000000000"),
              "TP-DA says 21 semi-octets but holds 20 at most");
    EXPECT_EQ(problem("04 11 51 55"),
              "TP-DA has the type of address 0x11, whose top bit is not set");
    EXPECT_EQ(problem("04 91 51 F5"), "TP-DA has the filler 0xF in place of digit 4 of 4");
    EXPECT_EQ(problem("04 91 51 55 10"), "TP-DA ends before the message does: 1 octet left over");
}

TEST(ServiceCentre, CountsOctets) {
    EXPECT_EQ(must(tpdu::encode_service_centre(kInternational)), hex("05 91 51 55 10 10"));
    EXPECT_EQ(must(tpdu::decode_service_centre(hex("05 91 51 55 10 10"))), kInternational);
    const Address odd{TypeOfNumber::kInternational, NumberingPlan::kIsdn, "15550100999"};
    EXPECT_EQ(must(tpdu::encode_service_centre(odd)), hex("07 91 51 55 10 00 99 F9"));
    EXPECT_EQ(must(tpdu::decode_service_centre(hex("07 91 51 55 10 00 99 F9"))), odd);
}

TEST(ServiceCentre, NoneIsAZero) {
    EXPECT_EQ(must(tpdu::encode_service_centre(std::nullopt)), hex("00"));
    EXPECT_EQ(must(tpdu::decode_service_centre(hex("00"))), std::nullopt);
}

TEST(ServiceCentre, TheTypeOfAddressAlone) {
    const Address none{TypeOfNumber::kInternational, NumberingPlan::kIsdn, ""};
    EXPECT_EQ(must(tpdu::encode_service_centre(none)), hex("01 91"));
    EXPECT_EQ(must(tpdu::decode_service_centre(hex("01 91"))), none);
}

TEST(ServiceCentre, DigitsWhateverTheType) {
    const Address address{TypeOfNumber::kAlphanumeric, NumberingPlan::kIsdn, "123"};
    EXPECT_EQ(must(tpdu::encode_service_centre(address)), hex("03 D1 21 F3"));
    EXPECT_EQ(must(tpdu::decode_service_centre(hex("03 D1 21 F3"))), address);
    EXPECT_FALSE(tpdu::encode_service_centre(must(tpdu::alphanumeric_address("Weather"))));
}

TEST(ServiceCentre, ErrorsSayWhatIsWrong) {
    const auto problem = [](std::string_view octets) {
        return tpdu::decode_service_centre(hex(octets)).error().message;
    };
    EXPECT_EQ(problem(""), "service centre address is missing: the message ends before it");
    EXPECT_EQ(problem("03"), "service centre address ends before its type of address");
    EXPECT_EQ(problem("03 91 51"),
              "service centre address needs 2 octets but only 1 octet follows");
    EXPECT_EQ(problem("0C 91 0000000000000000000000"),
              "service centre address says 12 octets but holds 11 at most");
    EXPECT_EQ(problem("03 91 5F 55"),
              "service centre address has the filler 0xF in place of digit 1 of 4");
    EXPECT_EQ(problem("02 91 51 55"),
              "service centre address ends before the message does: 1 octet left over");
    EXPECT_EQ(problem("00 91"),
              "service centre address ends before the message does: 1 octet left over");
    EXPECT_EQ(problem("02 11 51"),
              "service centre address has the type of address 0x11, whose top bit is not set");
}

} // namespace
