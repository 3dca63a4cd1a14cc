// SPDX-License-Identifier: Apache-2.0
// The largest request: one more byte is refused, before the bus would cut the process off.
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

constexpr std::size_t kLimit = std::size_t{16} << 20;
// Beside its text a request has the zero byte that ends it, and whatever comes before it.
constexpr std::size_t kLargestName = kLimit - 1;
constexpr std::size_t kLargestTones = kLimit - 1 - 2 * sizeof(std::int32_t);

class SizeLimit : public WithPeer {
  protected:
    int send_dtmf(std::size_t length) {
        const std::string tones(length, '1');
        const ims_call_dtmf_info_s info{7, tones.c_str()};
        return ims_call_send_dtmf(handle_, &info, ResponseRecorder::callback, &recorder_);
    }

    int get_settings(std::size_t length) {
        const std::string name(length, 'n');
        return ims_get_global_settings_info(handle_, name.c_str(), &settings_);
    }

    // The length of the last text in the only request.
    std::size_t length_sent() {
        const std::vector<Call> sent = requests();
        if (sent.size() != 1)
            throw std::runtime_error(std::to_string(sent.size()) + " calls instead of 1");
        GVariant *body = sent.front().body.get();
        const Variant text{g_variant_get_child_value(body, g_variant_n_children(body) - 1)};
        gsize length = 0;
        g_variant_get_string(text.get(), &length);
        return length;
    }

    ResponseRecorder recorder_;
    ims_global_settings_s settings_{};
};

TEST_F(SizeLimit, ARequestOfTheLimitIsSentWhole) {
    peer().on("org.kelvo.ims.Call.SendDtmf", reply("(i)", "(0,)"));
    EXPECT_EQ(send_dtmf(kLargestTones), IMS_ERROR_NONE);
    fence();
    ASSERT_EQ(recorder_.count(), 1U);
    EXPECT_EQ(recorder_.last().result, 0);
    EXPECT_EQ(length_sent(), kLargestTones);
}

TEST_F(SizeLimit, ALargerRequestIsRefusedAndTheNextIsSent) {
    peer().on("org.kelvo.ims.Call.SendDtmf", reply("(i)", "(0,)"));
    EXPECT_EQ(send_dtmf(kLargestTones + 1), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims_call.cpp", "ims_call_send_dtmf", "Invalid parameter");
    EXPECT_TRUE(requests().empty());
    EXPECT_EQ(send_dtmf(1), IMS_ERROR_NONE);
    fence();
    EXPECT_EQ(recorder_.count(), 1U);
    EXPECT_EQ(length_sent(), 1U);
}

TEST_F(SizeLimit, AQueryOfTheLimitIsSentWhole) {
    peer().on("org.kelvo.ims.Settings.GetGlobalSettings", reply("(ia{sv})", "(0, {})"));
    EXPECT_EQ(get_settings(kLargestName), IMS_ERROR_NONE);
    EXPECT_EQ(length_sent(), kLargestName);
}

TEST_F(SizeLimit, ALargerQueryIsRefused) {
    EXPECT_EQ(get_settings(kLargestName + 1), IMS_ERROR_INVALID_PARAMETER);
    expect_one_line("ims_settings.cpp", "ims_get_global_settings_info", "Invalid parameter");
    EXPECT_TRUE(requests().empty());
}

} // namespace
} // namespace test
