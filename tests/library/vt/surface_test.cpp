// SPDX-License-Identifier: Apache-2.0
// The list of a surface: how many entries are sent, and the count as it was.
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>

namespace test {
namespace {

struct Surface {
    const char *name;
    int (*set)(ims_h, const ims_vt_surface_s *, ims_response_cb, void *);
};

void PrintTo(const Surface &surface, std::ostream *out) {
    *out << surface.name;
}

class Surfaces : public WithPeer, public ::testing::WithParamInterface<Surface> {
  protected:
    void expect(const ims_vt_surface_s &surface, const std::string &sent) {
        EXPECT_EQ(GetParam().set(handle_, &surface, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iiv)", sent);
    }
};

INSTANTIATE_TEST_SUITE_P(Vt, Surfaces,
                         ::testing::Values(Surface{"Near", ims_vt_set_near_end_surface},
                                           Surface{"Far", ims_vt_set_far_end_surface}),
                         [](const auto &tested) { return tested.param.name; });

constexpr std::int32_t kExtremes[] = {INT_MIN, -1, 0, INT_MAX};

TEST_P(Surfaces, SendTheFirstEntriesInTheirOrder) {
    expect({7, 4, kExtremes}, "(7, 4, <[-2147483648, -1, 0, 2147483647]>)");
    expect({7, 2, kExtremes}, "(7, 2, <[-2147483648, -1]>)");
}

TEST_P(Surfaces, OfCountNoneSendAnEmptyArray) {
    expect({7, 0, kExtremes}, "(7, 0, <@ai []>)");
    expect({7, 0, nullptr}, "(7, 0, <@ai []>)");
}

TEST_P(Surfaces, OfANegativeCountSendAnEmptyArrayAndTheCountAsItIs) {
    expect({7, -1, kExtremes}, "(7, -1, <@ai []>)");
    expect({7, INT_MIN, nullptr}, "(7, -2147483648, <@ai []>)");
}

TEST_P(Surfaces, WithoutEntriesSendAnEmptyArrayAndTheCountAsItIs) {
    expect({7, 3, nullptr}, "(7, 3, <@ai []>)");
}

TEST_P(Surfaces, SendTheFirstValueAsItIs) {
    expect({INT_MIN, 0, nullptr}, "(-2147483648, 0, <@ai []>)");
}

// On the heap, where reading past the end is noticed.
TEST_P(Surfaces, OfManyEntriesSendThemAll) {
    std::vector<std::int32_t> entries(100000);
    for (std::size_t at = 0; at < entries.size(); ++at)
        entries[at] = static_cast<std::int32_t>(at * 7919);
    const ims_vt_surface_s surface{7, 100000, entries.data()};
    EXPECT_EQ(GetParam().set(handle_, &surface, nullptr, nullptr), IMS_ERROR_NONE);
    const Call sent = requests().back();
    ASSERT_EQ(sent.signature, "iiv");
    const Variant box{g_variant_get_child_value(sent.body.get(), 2)};
    const Variant list{g_variant_get_variant(box.get())};
    gsize count = 0;
    const auto *first = static_cast<const std::int32_t *>(
        g_variant_get_fixed_array(list.get(), &count, sizeof(std::int32_t)));
    EXPECT_TRUE(std::vector<std::int32_t>(first, first + count) == entries);
}

TEST_P(Surfaces, ThatNoBusCarriesAreRefused) {
    const std::vector<std::int32_t> entries(5 * 1024 * 1024);
    const ims_vt_surface_s surface{7, static_cast<std::int32_t>(entries.size()), entries.data()};
    EXPECT_EQ(GetParam().set(handle_, &surface, nullptr, nullptr), IMS_ERROR_INVALID_PARAMETER);
    EXPECT_EQ(messages(take_log()), std::vector<std::string>{"Invalid parameter"});
    EXPECT_TRUE(requests().empty());
}

} // namespace
} // namespace test
