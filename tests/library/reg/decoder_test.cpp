// SPDX-License-Identifier: Apache-2.0
// The registration decoder called by itself, and the request that uses its handle without a look.
#include "tests/library/reg/event_rows.hpp"
#include "tests/support/decoder_checks.hpp"
#include "tests/support/unguarded.hpp"

#include <climits>

namespace test {

constexpr auto kDecode = ims::on_reg_signal_emit_handler;

INSTANTIATE_TEST_SUITE_P(Reg, DecodedEvents,
                         ::testing::ValuesIn(decoded_events_of(kDecode, kRegEvents,
                                                               reg_event_rows())),
                         decoded_name);

namespace {

TEST(RegDecoder, ANullHandleIsLoggedAndNothingElseLookedAt) {
    constexpr int ids[] = {0x101, 0x102, 0x103, 0};
    expect_null_handle_is_logged(kDecode, kRegEvents, ids);
}

TEST(RegDecoder, AnUnknownIdIsLoggedInDecimalAsAWarning) {
    for (const int id : {0x100, 0x103, 0x201, 0x301, 0x501, 0, -1, INT_MIN, INT_MAX}) {
        SCOPED_TRACE(id);
        expect_unknown_id_is_logged(kDecode, kRegEvents, id,
                                    "Unknown/Unhandled notification - noti_id: [" +
                                        std::to_string(id) + "]");
    }
}

using RegDeathTest = UnguardedTest;

TEST_F(RegDeathTest, FlightModeWithANullHandleIsNotGuarded) {
    EXPECT_DEATH(ims_enable_flight_mode(nullptr, nullptr, nullptr), "");
}

} // namespace
} // namespace test
