// SPDX-License-Identifier: Apache-2.0
// The short-message module's rows through every check, and what its requests do beside that.
#include "tests/library/sms/sms_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/request_checks.hpp"

#include <climits>

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Sms, Requests, ValuesIn(sms_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Sms, RequestGates, ValuesIn(sms_request_rows()), row_name<RequestRow>);

namespace {

TEST(SmsRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(sms_request_rows()), declared_functions("ims_sms.h"));
}

// Both requests send a TPDU in the same way.
struct TpduCase {
    const char *name;
    std::string bytes;
    std::int32_t length;
    const char *text;
};

void PrintTo(const TpduCase &tested, std::ostream *out) {
    *out << tested.name;
}

const TpduCase kTpduCases[] = {{"OneByteIsPaddedTwice", "A", 1, "QQ=="},
                               {"TwoBytesArePaddedOnce", "AB", 2, "QUI="},
                               {"ThreeBytesAreNotPadded", "ABC", 3, "QUJD"},
                               {"TheAlphabetIsTheStandardOne", "\xfb\xef\xff\xbe", 4, "++//vg=="},
                               {"ZeroBytesAreBytesLikeOthers", std::string(4, '\0'), 4, "AAAAAA=="},
                               {"OfManyBytesOnlyTheFirstAreSent", "ABCDEF", 3, "QUJD"},
                               {"LengthNoneSendsNoBytes", "ABC", 0, ""},
                               {"NegativeLengthSendsNoBytes", "ABC", -1, ""},
                               {"TheSmallestLengthSendsNoBytes", "ABC", INT_MIN, ""}};

class TpduRequest : public WithPeer, public ::testing::WithParamInterface<TpduCase> {
  protected:
    // On the heap, where reading past the end is noticed.
    TpduRequest() : bytes_(GetParam().bytes.begin(), GetParam().bytes.end()) {}

    std::vector<std::uint8_t> bytes_;
};

INSTANTIATE_TEST_SUITE_P(Sms, TpduRequest, ValuesIn(kTpduCases),
                         [](const auto &tested) { return tested.param.name; });

TEST_P(TpduRequest, SendSmsSendsItWithItsLengthAsStored) {
    const ims_sms_send_info_s info{bytes_.data(), GetParam().length, nullptr, 9};
    EXPECT_EQ(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(isisi)",
                "(42, '" + std::string{GetParam().text} + "', " +
                    std::to_string(GetParam().length) + ", '', 9)");
}

TEST_P(TpduRequest, SendDeliverReportSendsItWithItsLengthAsStored) {
    const ims_sms_deliver_report_s report{7, bytes_.data(), GetParam().length, 8};
    EXPECT_EQ(ims_sms_send_deliver_report(handle_, &report, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(iisii)",
                "(42, 7, '" + std::string{GetParam().text} + "', " +
                    std::to_string(GetParam().length) + ", 8)");
}

class SmsRequest : public WithPeer {};

TEST_F(SmsRequest, ANullTpduIsSentAsNoBytesWithItsLengthAsStored) {
    const ims_sms_send_info_s info{nullptr, 5, nullptr, 9};
    EXPECT_EQ(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(isisi)", "(42, '', 5, '', 9)");
    const ims_sms_deliver_report_s report{7, nullptr, 5, 8};
    EXPECT_EQ(ims_sms_send_deliver_report(handle_, &report, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(iisii)", "(42, 7, '', 5, 8)");
}

TEST_F(SmsRequest, EveryByteOfALargeTpduIsSent) {
    std::vector<std::uint8_t> bytes(100000);
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<std::uint8_t>(i % 256);
    const ims_sms_send_info_s info{bytes.data(), 100000, nullptr, 0};
    EXPECT_EQ(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    const Call sent = requests().back();
    ASSERT_EQ(sent.signature, "isisi");
    const Variant text{g_variant_get_child_value(sent.body.get(), 1)};
    gsize length = 0;
    guchar *decoded = g_base64_decode(g_variant_get_string(text.get(), nullptr), &length);
    EXPECT_TRUE(std::vector<std::uint8_t>(decoded, decoded + length) == bytes);
    g_free(decoded);
}

TEST_F(SmsRequest, ATpduThatNoBusCarriesIsRefusedAndTheNextIsSent) {
    const std::vector<std::uint8_t> bytes(20 * 1024 * 1024);
    const auto length = static_cast<std::int32_t>(bytes.size());
    const ims_sms_deliver_report_s large{7, bytes.data(), length, 8};
    EXPECT_EQ(ims_sms_send_deliver_report(handle_, &large, nullptr, nullptr),
              IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims_sms.cpp", "ims_sms_send_deliver_report", "Invalid parameter");
    EXPECT_TRUE(requests().empty());
    const ims_sms_deliver_report_s small{7, bytes.data(), 3, 8};
    EXPECT_EQ(ims_sms_send_deliver_report(handle_, &small, nullptr, nullptr), IMS_ERROR_NONE);
    EXPECT_EQ(requests().size(), 1U);
}

TEST_F(SmsRequest, OptionsAndCodesPassThroughUnchecked) {
    for (const std::int32_t value : {INT_MIN, -1, 0, INT_MAX}) {
        const std::string number = std::to_string(value);
        const ims_sms_send_info_s info{nullptr, 0, nullptr, value};
        EXPECT_EQ(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(isisi)", "(42, '', 0, '', " + number + ")");
        const ims_sms_deliver_report_s report{value, nullptr, 0, value};
        EXPECT_EQ(ims_sms_send_deliver_report(handle_, &report, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iisii)", "(42, " + number + ", '', 0, " + number + ")");
    }
}

} // namespace
} // namespace test
