// SPDX-License-Identifier: Apache-2.0
// The push-to-talk decoder called by itself: what no signal leads to, and events for nobody.
#include "tests/library/poc/event_rows.hpp"
#include "tests/support/decoder_checks.hpp"

#include <climits>

namespace test {

constexpr auto kDecode = ims::on_poc_signal_emit_handler;

INSTANTIATE_TEST_SUITE_P(Poc, DecodedEvents,
                         ::testing::ValuesIn(decoded_events_of(kDecode, kPocEvents,
                                                               poc_event_rows())),
                         decoded_name);

namespace {

TEST(PocDecoder, ANullHandleIsLoggedAndNothingElseLookedAt) {
    constexpr int ids[] = {0x401, 0x410, 0x417, 0};
    expect_null_handle_is_logged(kDecode, kPocEvents, ids);
}

TEST(PocDecoder, IdsOutsideItsRangeReturnWithoutALine) {
    for (const int id : {0x400, 0x417, 0x101, 0x201, 0x301, 0x501, 0, -1, INT_MIN, INT_MAX}) {
        SCOPED_TRACE(id);
        NotificationRecorder recorder;
        decode(kDecode, some_handle(), id, parse("(i)", "(1,)"), recorder);
        decode(kDecode, some_handle(), id, parse("(ia{sv})", "(1, {'subject': <'a'>})"), recorder);
        EXPECT_EQ(recorder.count(), 0U);
    }
    EXPECT_TRUE(take_log().empty());
}

// The nested values are read and released, with their lines, whether or not somebody listens.
TEST(PocDecoder, MissingValuesOfAnEventForNobodyAreLogged) {
    const ims_noti_cb_info_s nobody{1, nullptr, nullptr};
    const auto lines_of = [&](int id, const char *type, const char *value) {
        kDecode(some_handle(), id, parse(type, value).get(), &nobody);
        std::vector<std::string> texts;
        for (const LogLine &line : take_log())
            texts.push_back(line.message);
        return texts;
    };
    using Lines = std::vector<std::string>;
    EXPECT_EQ(lines_of(0x410, "(ia{sv})", "(1, {})"), (Lines{"No Group Adv Present"}));
    EXPECT_EQ(lines_of(0x410, "(ia{sv})", "(1, {'subject': <'a'>})"),
              (Lines{"No Group Content Info Present"}));
    EXPECT_EQ(lines_of(0x414, "(ivviv)", "(1, <1>, <2>, 3, <4>)"),
              (Lines{"user_list is NULL", "user_list is NULL", "user_list is NULL"}));
}

} // namespace
} // namespace test
