// SPDX-License-Identifier: Apache-2.0
// The swipe uses its record without a look.
#include "tests/support/unguarded.hpp"

#include "ims.h"
#include "src/client.hpp"

namespace test {
namespace {

using VtDeathTest = UnguardedTest;

TEST_F(VtDeathTest, SwipeVideoWithANullRecordIsNotGuarded) {
    ims_client_s client{};
    EXPECT_DEATH(ims_vt_swipe_video(&client, nullptr, nullptr, nullptr), "");
}

} // namespace
} // namespace test
