// SPDX-License-Identifier: Apache-2.0
// The two requests that delete use their record without a look.
#include "tests/support/unguarded.hpp"

#include "ims.h"
#include "src/client.hpp"

namespace test {
namespace {

using SettingsDeathTest = UnguardedTest;

TEST_F(SettingsDeathTest, DeleteGlobalSettingsWithANullRecordIsNotGuarded) {
    ims_client_s client{};
    EXPECT_DEATH(ims_delete_global_settings(&client, nullptr, nullptr, nullptr), "");
}

TEST_F(SettingsDeathTest, DeleteProfileWithANullProfileIsNotGuarded) {
    ims_client_s client{};
    EXPECT_DEATH(ims_delete_profile(&client, nullptr, nullptr, nullptr), "");
}

} // namespace
} // namespace test
