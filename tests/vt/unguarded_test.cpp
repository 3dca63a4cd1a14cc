// SPDX-License-Identifier: Apache-2.0
// The swipe uses its record without a look.
#include "unguarded.hpp"

#include "client.hpp"
#include "ims.h"

namespace test {
namespace {

using VtDeathTest = UnguardedTest;

TEST_F(VtDeathTest, SwipeVideoWithANullRecordIsNotGuarded) {
    ims_client_s client{};
    EXPECT_DEATH(ims_vt_swipe_video(&client, nullptr, nullptr, nullptr), "");
}

} // namespace
} // namespace test
