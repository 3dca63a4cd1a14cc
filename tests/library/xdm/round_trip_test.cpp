// SPDX-License-Identifier: Apache-2.0
// Any document that is created and fetched again is the same, as far as the wire lets it.
#include "tests/library/xdm/answered.hpp"
#include "tests/library/xdm/comparison.hpp"
#include "tests/library/xdm/random_group.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

// The seed of a failure is in its trace; each document is its own.
constexpr unsigned kDocuments = 300;

class RoundTrip : public WithPeer {
  protected:
    void SetUp() override {
        WithPeer::SetUp();
        peer().on("org.kelvo.ims.Xdm.XdmCreateGroup", [this](const Call &call) {
            const Variant sent{g_variant_get_child_value(call.body.get(), 0)};
            document_ = answered(sent.get());
            return reply("(i)", "(0,)");
        });
        peer().on("org.kelvo.ims.Xdm.XdmFetchSharedGroup", [this](const Call &) {
            return reply_with(g_variant_new("(i@a{sv})", 0, document_.get()));
        });
    }

    // Only the peer's thread has it, and one call comes after the other.
    Variant document_;
};

TEST_F(RoundTrip, KeepsAnyDocument) {
    for (unsigned seed = 0; seed < kDocuments && !HasFailure(); ++seed) {
        SCOPED_TRACE(seed);
        const RandomGroup random{seed};
        const ims_xdm_group_info_s &group = random.record();
        ResponseRecorder created;
        ASSERT_EQ(ims_xdm_create_group(handle_, &group, ResponseRecorder::callback, &created),
                  IMS_ERROR_NONE);
        ResponseRecorder fetched{[&group](const Response &response, void *data) {
            ASSERT_EQ(response.result, 0);
            ASSERT_NE(data, nullptr);
            expect_same_document(group, *static_cast<ims_xdm_group_info_s *>(data));
        }};
        ASSERT_EQ(ims_xdm_fetch_shared_group(handle_, &group, ResponseRecorder::callback, &fetched),
                  IMS_ERROR_NONE);
        pump_until([&] { return fetched.count() > 0; }, "the document");
        ASSERT_EQ(created.count(), 1U);
        ASSERT_EQ(created.last().result, 0);
    }
}

} // namespace
} // namespace test
