// SPDX-License-Identifier: Apache-2.0
// The call signals as they reach the application's callback.
#include "tests/library/call/event_rows.hpp"
#include "tests/support/event_checks.hpp"
#include "tests/support/released.hpp"

#include <cstdlib>
#include <set>

namespace test {

INSTANTIATE_TEST_SUITE_P(Call, Events,
                         ::testing::ValuesIn(events_of(kCallEvents, call_event_rows())),
                         event_name);

namespace {

TEST(CallEventRows, CoverEveryCallNotification) {
    std::set<int> expected{0x223};
    for (int id = 0x201; id <= 0x213; ++id)
        expected.insert(id);
    EXPECT_EQ(ids_of(call_event_rows()), expected);
}

class CallNotification : public WithPeer {};

TEST_F(CallNotification, BytesOfAUssdIndicationAreGoneAfterTheCallback) {
    const void *bytes = nullptr;
    NotificationRecorder recorder{[&](const Notified &, void *event) {
        const auto &record = *static_cast<ims_call_ussd_indication_s *>(event);
        EXPECT_EQ(record.length, 5);
        bytes = record.data;
    }};
    listen(IMS_NOTI_CALL_USSD_INDICATION, recorder);
    emit(kCallEvents.interface, "CallUssdIndication", parse("(iiis)", "(1, 2, 3, 'aGVsbG8=')"));
    fence();
    expect_released(bytes);
}

TEST_F(CallNotification, TextsStayTheApplicationsAfterTheCallback) {
    char *text = nullptr;
    NotificationRecorder recorder{[&](const Notified &, void *event) {
        text = static_cast<ims_call_error_s *>(event)->text_1;
    }};
    listen(IMS_NOTI_CALL_ERROR, recorder);
    emit(kCallEvents.interface, "CallError", parse("(iis)", "(1, 2, 'kept for later')"));
    fence();
    EXPECT_STREQ(text, "kept for later");
    std::free(text);
}

TEST_F(CallNotification, TextsThatAreNotBase64DoNoHarm) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_USSD_INDICATION, recorder);
    listen(IMS_NOTI_CALL_CHANGE_REQUEST, recorder);
    for (const char *text : {"=", "====", "Q", "QQ", "not base64 at all!", "\xe2\x82\xac", " "}) {
        emit(kCallEvents.interface, "CallUssdIndication",
             Variant{share(g_variant_new("(iiis)", 1, 2, 3, text))});
        emit(kCallEvents.interface, "CallChangeRequest",
             Variant{share(g_variant_new("(iis)", 1, 2, text))});
    }
    fence();
    EXPECT_EQ(recorder.count(IMS_NOTI_CALL_USSD_INDICATION), 7U);
    EXPECT_EQ(recorder.count(IMS_NOTI_CALL_CHANGE_REQUEST), 7U);
}

TEST_F(CallNotification, LargeTextsAreDecodedWhole) {
    const std::string bytes(1000000, 'x');
    gchar *text = g_base64_encode(reinterpret_cast<const guchar *>(bytes.data()), bytes.size());
    NotificationRecorder recorder{[&](const Notified &, void *event) {
        const auto &record = *static_cast<ims_call_ussd_indication_s *>(event);
        EXPECT_EQ(std::string(reinterpret_cast<const char *>(record.data),
                              static_cast<std::size_t>(record.length)),
                  bytes);
    }};
    listen(IMS_NOTI_CALL_USSD_INDICATION, recorder);
    emit(kCallEvents.interface, "CallUssdIndication",
         share(g_variant_new("(iiis)", 1, 2, 3, text)));
    g_free(text);
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_F(CallNotification, OnlyTheRegisteredKindArrives) {
    NotificationRecorder recorder;
    listen(IMS_NOTI_CALL_ENDED, recorder);
    emit(kCallEvents.interface, "CallAlerting", parse("(i)", "(1,)"));
    emit(kCallEvents.interface, "CallEnded", parse("(ii)", "(1, 2)"));
    emit(kCallEvents.interface, "CallEndedAgain", parse("(ii)", "(1, 2)"));
    emit("org.kelvo.ims.Sms", "CallEnded", parse("(ii)", "(1, 2)"));
    fence();
    EXPECT_EQ(recorder.count(), 1U);
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
