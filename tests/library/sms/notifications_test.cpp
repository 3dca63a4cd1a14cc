// SPDX-License-Identifier: Apache-2.0
// The short-message signals as they reach the application's callback.
#include "tests/library/sms/broken_texts.hpp"
#include "tests/library/sms/event_rows.hpp"
#include "tests/support/event_checks.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/released.hpp"

namespace test {

INSTANTIATE_TEST_SUITE_P(Sms, Events, ::testing::ValuesIn(events_of(kSmsEvents, sms_event_rows())),
                         event_name);

namespace {

constexpr const char *kDecodingFailed = "base64 decoding of TPDU failed";

TEST(SmsEventRows, CoverEveryShortMessageNotification) {
    EXPECT_EQ(ids_of(sms_event_rows()),
              (std::set<int>{IMS_NOTI_SMS_INCOMING_SMS, IMS_NOTI_SMS_SEND_SMS_ACK,
                             IMS_NOTI_SMS_DELIVERY_REPORT_ACK}));
}

// A decoded TPDU and its length, in whichever record it came.
struct Tpdu {
    const std::uint8_t *bytes;
    std::uint32_t length;
};

Tpdu tpdu_in(int id, const void *event) {
    if (id == IMS_NOTI_SMS_INCOMING_SMS)
        return {as<ims_sms_incoming_s>(event).tpdu, as<ims_sms_incoming_s>(event).tpdu_length};
    return {as<ims_sms_send_ack_s>(event).tpdu, as<ims_sms_send_ack_s>(event).tpdu_length};
}

// One of the two signals that carry a TPDU.
struct Carrier {
    const char *name;
    int id;
    const char *member;
    Variant (*body)(const char *text);
};

void PrintTo(const Carrier &carrier, std::ostream *out) {
    *out << carrier.name;
}

constexpr Carrier kCarriers[] = {
    {"IncomingSms", 0x301, "IncomingSms",
     [](const char *text) { return share(g_variant_new("(isii)", 5, text, 3, 4)); }},
    {"SendSmsAck", 0x302, "SendSmsAck",
     [](const char *text) { return share(g_variant_new("(iiisii)", 1, 2, 3, text, 5, 6)); }}};

class TpduCarrier : public WithPeer, public ::testing::WithParamInterface<Carrier> {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        recorder_.inspect_with([this](const Notified &notified, void *event) {
            const Tpdu tpdu = tpdu_in(notified.id, event);
            bytes_.assign(reinterpret_cast<const char *>(tpdu.bytes), tpdu.length);
            address_ = tpdu.bytes;
        });
        listen(GetParam().id, recorder_);
    }

    void emit_text(const char *text) {
        emit(kSmsEvents.interface, GetParam().member, GetParam().body(text));
        fence();
    }

    NotificationRecorder recorder_;
    std::string bytes_;
    const void *address_ = nullptr;
};

INSTANTIATE_TEST_SUITE_P(Sms, TpduCarrier, ::testing::ValuesIn(kCarriers),
                         [](const auto &tested) { return tested.param.name; });

TEST_P(TpduCarrier, IsDroppedAndLoggedWhenItsTextDecodesToNothing) {
    for (const char *text : kTextsOfNothing) {
        SCOPED_TRACE(text);
        emit_text(text);
        EXPECT_EQ(recorder_.count(), 0U);
        expect_one_line(kSmsEvents.unit, kSmsEvents.decoder, kDecodingFailed);
    }
    emit_text("aGVsbG8=");
    EXPECT_EQ(recorder_.count(), 1U);
    EXPECT_EQ(bytes_, "hello");
    EXPECT_TRUE(take_log().empty());
}

TEST_P(TpduCarrier, CarriesWhatThePlatformsDecoderMakesOfADoubtfulText) {
    for (const char *text : kDoubtfulTexts) {
        SCOPED_TRACE(text);
        gsize length = 0;
        guchar *decoded = g_base64_decode(text, &length);
        const std::string expected{reinterpret_cast<const char *>(decoded), length};
        g_free(decoded);
        ASSERT_NE(expected, "");
        const std::size_t before = recorder_.count();
        emit_text(text);
        EXPECT_EQ(recorder_.count(), before + 1);
        EXPECT_EQ(bytes_, expected);
    }
    EXPECT_TRUE(take_log().empty());
}

TEST_P(TpduCarrier, CarriesALargeTextWhole) {
    const std::string large(1000000, '\xfe');
    gchar *text = g_base64_encode(reinterpret_cast<const guchar *>(large.data()), large.size());
    emit_text(text);
    g_free(text);
    ASSERT_EQ(recorder_.count(), 1U);
    EXPECT_TRUE(bytes_ == large);
}

TEST_P(TpduCarrier, TakesItsBytesBackAfterTheCallback) {
    emit_text("aGVsbG8=");
    ASSERT_EQ(recorder_.count(), 1U);
    expect_released(address_);
}

class SmsNotification : public WithPeer {};

TEST_F(SmsNotification, TheThreeKindsArriveInTheirOrder) {
    std::vector<int> ids;
    NotificationRecorder recorder{
        [&](const Notified &notified, void *) { ids.push_back(notified.id); }};
    for (const int id : {0x301, 0x302, 0x303})
        listen(id, recorder);
    emit(kSmsEvents.interface, "SendSmsAck", parse("(iiisii)", "(1, 2, 3, 'QQ==', 5, 6)"));
    emit(kSmsEvents.interface, "DeliveryReportAck", parse("(ii)", "(1, 2)"));
    emit(kSmsEvents.interface, "IncomingSms", parse("(isii)", "(1, 'QQ==', 3, 4)"));
    emit(kSmsEvents.interface, "DeliveryReportAck", parse("(ii)", "(1, 2)"));
    fence();
    EXPECT_EQ(ids, (std::vector<int>{0x302, 0x303, 0x301, 0x303}));
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
