// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/edits.hpp"
#include "sim/group/model.hpp"
#include "tests/sim/group/samples.hpp"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sim::test {

constexpr const char *kCrew = "sip:crew@example.org";
constexpr const char *kAnn = "tel:+15550100";

// Groups that are kept, with the sample in them.
class GroupModelTest : public testing::Test {
  protected:
    void SetUp() override {
        model_.keep_with([this](const GroupState &state) {
            kept_ = state;
            return problem_;
        });
        ASSERT_TRUE(model_.create(sample_group()));
    }

    const GroupDocument &crew() { return **model_.find(kCrew, ""); }

    // The refusal has this code and says this; nothing has changed, nothing was kept.
    void expect_refused(const std::function<Status()> &act, Result code, const std::string &why) {
        const auto before = model_.state();
        const auto kept_before = kept_;
        const auto status = act();
        ASSERT_FALSE(status) << why;
        EXPECT_EQ(status.code(), code) << status.refusal().reason;
        EXPECT_THAT(status.refusal().reason, testing::HasSubstr(why));
        EXPECT_EQ(model_.state(), before);
        EXPECT_EQ(kept_, kept_before);
    }
    template <typename Argument>
    Status edit(Status (*function)(GroupDocument &, const Argument &), const Argument &argument) {
        const auto revision = model_.state().revision;
        const auto status =
            model_.edit(kCrew, [&](GroupDocument &group) { return function(group, argument); });
        // What is done is kept and counted.
        EXPECT_EQ(model_.state().revision, revision + (status ? 1 : 0));
        EXPECT_TRUE(!status || kept_ == model_.state());
        return status;
    }
    template <typename Argument>
    void expect_edit_refused(Status (*function)(GroupDocument &, const Argument &),
                             const Argument &argument, Result code, const std::string &why) {
        expect_refused([&] { return edit(function, argument); }, code, why);
    }

    GroupModel model_;
    GroupState kept_;
    std::optional<std::string> problem_;
};

} // namespace sim::test
