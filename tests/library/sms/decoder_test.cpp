// SPDX-License-Identifier: Apache-2.0
// The short-message decoder called by itself.
#include "tests/library/sms/broken_texts.hpp"
#include "tests/library/sms/event_rows.hpp"
#include "tests/support/decoder_checks.hpp"
#include "tests/support/expectations.hpp"

#include <climits>

namespace test {

constexpr auto kDecode = ims::on_sms_signal_emit_handler;

INSTANTIATE_TEST_SUITE_P(Sms, DecodedEvents,
                         ::testing::ValuesIn(decoded_events_of(kDecode, kSmsEvents,
                                                               sms_event_rows())),
                         decoded_name);

namespace {

TEST(SmsDecoder, ANullHandleIsLoggedAndNothingElseLookedAt) {
    constexpr int ids[] = {0x301, 0x302, 0x303, 0x304, 0};
    expect_null_handle_is_logged(kDecode, kSmsEvents, ids);
}

TEST(SmsDecoder, IdsThatAreNotItsOwnAreIgnored) {
    for (const int id : {0x300, 0x304, 0x101, 0x201, 0x401, 0x501, 0, -1, INT_MIN, INT_MAX}) {
        SCOPED_TRACE(id);
        NotificationRecorder recorder;
        decode(kDecode, some_handle(), id, parse("(ii)", "(1, 2)"), recorder);
        decode(kDecode, some_handle(), id, parse("(isii)", "(1, 'QQ==', 3, 4)"), recorder);
        EXPECT_EQ(recorder.count(), 0U);
    }
    EXPECT_TRUE(take_log().empty());
}

// Whether anybody listens is asked only once there is something to hand over.
TEST(SmsDecoder, ATextThatDecodesToNothingIsLoggedWithoutACallbackToo) {
    const ims_noti_cb_info_s nobody{1, nullptr, nullptr};
    for (const char *text : kTextsOfNothing) {
        SCOPED_TRACE(text);
        kDecode(some_handle(), 0x301, share(g_variant_new("(isii)", 5, text, 3, 4)).get(), &nobody);
        expect_one_line(kSmsEvents.unit, kSmsEvents.decoder, "base64 decoding of TPDU failed");
        kDecode(some_handle(), 0x302, share(g_variant_new("(iiisii)", 1, 2, 3, text, 5, 6)).get(),
                &nobody);
        expect_one_line(kSmsEvents.unit, kSmsEvents.decoder, "base64 decoding of TPDU failed");
    }
}

} // namespace
} // namespace test
