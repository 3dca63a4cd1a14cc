// SPDX-License-Identifier: Apache-2.0
// The login decoder called by itself.
#include "tests/library/login/event_rows.hpp"
#include "tests/support/decoder_checks.hpp"

#include <climits>

namespace test {

constexpr auto kDecode = ims::on_login_signal_emit_handler;

INSTANTIATE_TEST_SUITE_P(Login, DecodedEvents,
                         ::testing::ValuesIn(decoded_events_of(kDecode, kLoginEvents,
                                                               login_event_rows())),
                         decoded_name);

namespace {

struct UnknownId {
    int id;
    const char *text;
};

constexpr UnknownId kUnknownIds[] = {
    {0x500, "0x500"}, {0x502, "0x502"},   {0x101, "0x101"},        {0x20A, "0x20a"},
    {0, "0x0"},       {-1, "0xffffffff"}, {INT_MAX, "0x7fffffff"}, {INT_MIN, "0x80000000"}};

TEST(LoginDecoder, AnUnknownIdIsLoggedInHexadecimalAsAWarning) {
    for (const auto &[id, text] : kUnknownIds) {
        SCOPED_TRACE(text);
        expect_unknown_id_is_logged(kDecode, kLoginEvents, id,
                                    std::string{"Unknown/Unhandled notification - noti_id: ["} +
                                        text + "]");
    }
}

TEST(LoginDecoder, ANullHandleIsNotCheckedAndHandedToTheCallback) {
    NotificationRecorder recorder{[](const Notified &, void *event) {
        EXPECT_EQ(static_cast<ims_login_state_s *>(event)->value_3, 3);
    }};
    decode(kDecode, nullptr, 0x501, parse("(iuii)", "(1, 2, 3, 4)"), recorder);
    ASSERT_EQ(recorder.count(), 1U);
    EXPECT_EQ(recorder.all()[0].handle, nullptr);
    EXPECT_EQ(recorder.all()[0].id, 0x501);
    EXPECT_TRUE(take_log().empty());
}

} // namespace
} // namespace test
