// SPDX-License-Identifier: Apache-2.0
// The two call-waiting requests use their handle and their record without a look.
#include "tests/support/unguarded.hpp"

#include "ims.h"
#include "src/client.hpp"

namespace test {
namespace {

using SsDeathTest = UnguardedTest;

constexpr ims_ss_cw_info_s kSomeWaiting{1, 2};

TEST_F(SsDeathTest, SetCallWaitingWithANullRecordIsNotGuarded) {
    ims_client_s client{};
    EXPECT_DEATH(ims_ss_set_call_waiting(&client, nullptr, nullptr, nullptr), "");
}

TEST_F(SsDeathTest, SetCallWaitingWithANullHandleIsNotGuarded) {
    EXPECT_DEATH(ims_ss_set_call_waiting(nullptr, &kSomeWaiting, nullptr, nullptr), "");
}

TEST_F(SsDeathTest, GetCallWaitingWithANullHandleIsNotGuarded) {
    EXPECT_DEATH(ims_ss_get_call_waiting(nullptr, 1, nullptr, nullptr), "");
}

} // namespace
} // namespace test
