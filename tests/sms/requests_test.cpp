// SPDX-License-Identifier: Apache-2.0
// The short-message module's rows through every check, and what its requests do beside that.
#include "declarations.hpp"
#include "expectations.hpp"
#include "request_checks.hpp"

#include <climits>

namespace test {
namespace {

constexpr Module kSms{"ims_sms.cpp", "org.kelvo.ims.Sms"};

constexpr std::uint8_t kTpdu[] = {1, 0, 255};
constexpr ims_sms_deliver_report_s kReport{-7, kTpdu, sizeof kTpdu, 8};

// Each request has an address of its own, because sending rewrites it.
int send_sample(ims_h handle, ims_response_cb callback, void *user_data) {
    std::uint8_t sca[] = {11, 0x91, 0x44, 0x77, 0x58, 0x10, 0x06, 0xF0};
    const ims_sms_send_info_s info{kTpdu, sizeof kTpdu, sca, 9};
    return ims_sms_send_sms(handle, &info, callback, user_data);
}

RequestRow send_row() {
    RequestRow row = named_row<ims_sms_send_sms>(kSms, "ims_sms_send_sms", "SendSms", "(isisi)",
                                                 "(42, 'AQD/', 3, 'B5FEd1gQBvA=', 9)");
    row.call = send_sample;
    row.missing_pointers = {
        {"handle", [](ims_h, ims_response_cb callback,
                      void *user_data) { return send_sample(nullptr, callback, user_data); }},
        {"info", [](ims_h handle, ims_response_cb callback, void *user_data) {
             return ims_sms_send_sms(handle, nullptr, callback, user_data);
         }}};
    return row;
}

std::vector<RequestRow> request_rows() {
    return {with_reply(send_row(), "(iiii)", "(0, 7, 8, 9)"),
            with_reply(record_row<ims_sms_send_deliver_report, kReport>(
                           kSms, "ims_sms_send_deliver_report", "SendDeliverReport", "(iisii)",
                           "(42, -7, 'AQD/', 3, 8)"),
                       "(iiii)", "(0, 7, 8, 9)")};
}

} // namespace

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Sms, Requests, ValuesIn(request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Sms, RequestGates, ValuesIn(request_rows()), row_name<RequestRow>);

namespace {

TEST(SmsRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(functions_of(request_rows()), declared_functions("ims_sms.h"));
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
    expect_one_line(kSms.unit, "ims_sms_send_deliver_report", "Invalid parameter");
    EXPECT_TRUE(requests().empty());
    EXPECT_EQ(ims_sms_send_deliver_report(handle_, &kReport, nullptr, nullptr), IMS_ERROR_NONE);
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
