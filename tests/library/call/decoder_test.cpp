// SPDX-License-Identifier: Apache-2.0
// The call decoder called by itself: ids that no signal leads to, and what it is not to trust.
#include "tests/library/call/event_rows.hpp"
#include "tests/support/decoder_checks.hpp"

#include <climits>

namespace test {

using ::testing::ValuesIn;

constexpr auto kDecode = ims::on_call_signal_emit_handler;

INSTANTIATE_TEST_SUITE_P(Call, DecodedEvents,
                         ValuesIn(decoded_events_of(kDecode, kCallEvents, call_event_rows())),
                         decoded_name);
INSTANTIATE_TEST_SUITE_P(Undelivered, DecodedEvents,
                         ValuesIn(decoded_events_of(kDecode, kCallEvents,
                                                    undelivered_event_rows())),
                         decoded_name);

namespace {

TEST(CallDecoder, KnowsEveryIdBetweenItsSignalsIdsWhichNobodyCanAskFor) {
    int id = 0x214;
    for (const EventRow &row : undelivered_event_rows()) {
        EXPECT_EQ(row.id, id++);
        EXPECT_EQ(
            ims_set_notification_cb(some_handle(), row.id, NotificationRecorder::callback, nullptr),
            IMS_ERROR_INVALID_PARAMETER);
    }
    EXPECT_EQ(id, 0x223);
}

TEST(CallDecoder, ANullHandleIsLoggedAndNothingElseLookedAt) {
    constexpr int ids[] = {0x209, 0x214, 0x230, 0};
    expect_null_handle_is_logged(kDecode, kCallEvents, ids);
}

TEST(CallDecoder, IdsOutsideItsRangeReturnWithoutALine) {
    for (const int id :
         {0x230, 0x224, 0x200, 0x101, 0x301, 0x401, 0x501, 0, -1, INT_MIN, INT_MAX}) {
        SCOPED_TRACE(id);
        NotificationRecorder recorder;
        decode(kDecode, some_handle(), id, parse("(i)", "(1,)"), recorder);
        decode(kDecode, some_handle(), id, parse("(ii)", "(1, 2)"), recorder);
        EXPECT_EQ(recorder.count(), 0U);
    }
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
