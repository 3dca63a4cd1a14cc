// SPDX-License-Identifier: Apache-2.0
#include "tests/support/event_checks.hpp"

#include "tests/support/expectations.hpp"
#include "tests/support/malformed.hpp"

namespace test {

TEST_P(Events, ReachTheCallbackAsTheirRecord) {
    const auto &[module, row] = GetParam();
    NotificationRecorder recorder{[&](const Notified &, void *event) {
        ASSERT_NE(event, nullptr);
        GetParam().row.check(event);
    }};
    listen(row.id, recorder);
    emit(module.interface, row.member, parse(row.type, row.value));
    fence();
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.all()[0].handle, handle_);
    EXPECT_EQ(recorder.all()[0].id, row.id);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Events, OfAnotherShapeAreDroppedWithOneLineEach) {
    const auto &[module, row] = GetParam();
    NotificationRecorder recorder;
    listen(row.id, recorder);
    for (const Malformed &malformed : malformed_for(row.type)) {
        SCOPED_TRACE(malformed.type);
        emit(module.interface, row.member, malformed.body);
        fence();
        EXPECT_EQ(recorder.count(), 0U);
        expect_one_line(module.unit, module.decoder);
    }
    // And the next good one is delivered.
    recorder.inspect_with([&](const Notified &, void *event) { GetParam().row.check(event); });
    emit(module.interface, row.member, parse(row.type, row.value));
    fence();
    EXPECT_EQ(recorder.count(), 1U);
}

TEST_P(Events, MayEndTheirSubscriptionInTheCallback) {
    const auto &[module, row] = GetParam();
    NotificationRecorder recorder{[&](const Notified &notified, void *event) {
        EXPECT_EQ(ims_unset_notification_cb(notified.handle, notified.id), IMS_ERROR_NONE);
        GetParam().row.check(event); // still valid
    }};
    listen(row.id, recorder);
    for (int i = 0; i < 3; ++i)
        emit(module.interface, row.member, parse(row.type, row.value));
    fence();
    EXPECT_EQ(recorder.count(), 1U);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(Events, MayReleaseTheHandleInTheCallback) {
    const auto &[module, row] = GetParam();
    init(4); // keeps the connection for the fence
    NotificationRecorder recorder{[&](const Notified &notified, void *event) {
        forget(notified.handle);
        EXPECT_EQ(ims_deinit(notified.handle), IMS_ERROR_NONE);
        GetParam().row.check(event); // still valid
    }};
    listen(row.id, recorder);
    for (int i = 0; i < 3; ++i)
        emit(module.interface, row.member, parse(row.type, row.value));
    fence();
    EXPECT_EQ(recorder.count(), 1U);
    EXPECT_TRUE(take_log().empty());
}

} // namespace test
