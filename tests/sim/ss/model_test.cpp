// SPDX-License-Identifier: Apache-2.0
// Setting and querying; how the services act on calls is in call_routing_test.cpp.
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

using enum ForwardCondition;

class Supplementary : public NetworkTest {
  protected:
    static constexpr auto kVoice = ServiceClass::kVoice;
    static constexpr auto kVideo = ServiceClass::kVideo;
    static constexpr auto kBoth = ServiceClass::kBoth;

    static ForwardingEntry to(const std::string &uri, ForwardCondition condition,
                              ServiceClass service = kVoice, int time = 0) {
        return {service,
                1,
                condition,
                time,
                static_cast<std::int32_t>(uri.size()),
                uri.starts_with("sip:") ? UriType::kSip : UriType::kNumber,
                uri};
    }
    static ForwardingEntry off(ForwardCondition condition, ServiceClass service = kVoice) {
        return {service, 0, condition, 0, 0, UriType::kNumber, ""};
    }
    std::vector<ForwardingEntry> forwarding(ServiceClass service, ForwardCondition condition) {
        const auto entries = services_.forwarding(0, service, condition);
        EXPECT_TRUE(entries);
        return entries ? *entries : std::vector<ForwardingEntry>{};
    }
};

TEST_F(Supplementary, CallWaitingIsOnUntilItIsSwitchedOff) {
    EXPECT_THAT(*services_.waiting(0, kBoth),
                ElementsAre(WaitingEntry{kVoice, 1}, WaitingEntry{kVideo, 1}));
    expect_accepted(services_.set_waiting(0, {kVideo, 0}));
    EXPECT_THAT(*services_.waiting(0, ServiceClass{0}),
                ElementsAre(WaitingEntry{kVoice, 1}, WaitingEntry{kVideo, 0}));
    EXPECT_THAT(*services_.waiting(0, kVideo), ElementsAre(WaitingEntry{kVideo, 0}));
    EXPECT_THAT(*services_.waiting(1, kVideo), ElementsAre(WaitingEntry{kVideo, 1}));
    expect_accepted(services_.set_waiting(0, {ServiceClass{0}, 0}));
    EXPECT_THAT(*services_.waiting(0, kVoice), ElementsAre(WaitingEntry{kVoice, 0}));
    expect_refused(services_.set_waiting(0, {ServiceClass{4}, 1}), Result::kInvalidArgument,
                   "not 4");
    expect_refused(services_.set_waiting(0, {kVoice, 2}), Result::kInvalidArgument, "not 2");
    expect_refused(services_.waiting(0, ServiceClass{-1}), Result::kInvalidArgument, "not -1");
}

TEST_F(Supplementary, WithNothingSetAQueryStillListsWhatItAsksAbout) {
    EXPECT_THAT(forwarding(kVoice, kUnconditional), ElementsAre(off(kUnconditional)));
    EXPECT_THAT(forwarding(kBoth, kAllConditional),
                ElementsAre(off(kBusy), off(kNoReply), off(kNotReachable), off(kBusy, kVideo),
                            off(kNoReply, kVideo), off(kNotReachable, kVideo)));
    EXPECT_EQ(forwarding(kBoth, kAll).size(), 8u);
    EXPECT_THAT(*services_.barring(0, kVideo, BarringType::kAllIncoming),
                ElementsAre(BarringEntry{kVideo, 0, BarringType::kAllIncoming}));
    EXPECT_EQ(services_.barring(0, kBoth, BarringType::kAll)->size(), 10u);
}

TEST_F(Supplementary, ForwardingIsKeptAsItWasSet) {
    auto wanted = to("tel:+1555-020-0", kNoReply, kVoice, 15);
    expect_accepted(services_.set_forwarding(0, wanted));
    EXPECT_THAT(forwarding(kVoice, kNoReply), ElementsAre(wanted));
    EXPECT_EQ(forwarding(kVideo, kNoReply), std::vector{off(kNoReply, kVideo)});
    EXPECT_EQ(services_.forward_target(0, kNoReply, CallType::kVoice), "+15550200");
    EXPECT_EQ(services_.no_reply_time(0, CallType::kVoice), 15s);
    EXPECT_EQ(services_.no_reply_time(0, CallType::kVideo), std::nullopt);

    expect_accepted(services_.set_forwarding(0, off(kNoReply)));
    wanted.status = 0;
    EXPECT_THAT(forwarding(kVoice, kNoReply), ElementsAre(wanted));
    EXPECT_EQ(services_.forward_target(0, kNoReply, CallType::kVoice), std::nullopt);

    // Without a uri the kept one is used.
    expect_accepted(services_.set_forwarding(0, to("", kNoReply)));
    wanted.status = 1;
    EXPECT_THAT(forwarding(kVoice, kNoReply), ElementsAre(wanted));
}

TEST_F(Supplementary, SeveralConditionsAtOnce) {
    expect_accepted(services_.set_forwarding(0, to("sip:+15559999@ims.invalid", kAll, kBoth)));
    const auto all = forwarding(kBoth, kAll);
    ASSERT_EQ(all.size(), 8u);
    for (const auto &entry : all) {
        EXPECT_EQ(entry.status, 1);
        EXPECT_EQ(entry.uri_type, UriType::kSip);
        EXPECT_EQ(entry.uri_length, 25);
        // Only one of them has a time.
        EXPECT_EQ(entry.no_reply_time, entry.condition == kNoReply ? 20 : 0);
    }
    expect_accepted(services_.set_forwarding(0, off(kAllConditional, kBoth)));
    EXPECT_EQ(services_.forward_target(0, kUnconditional, CallType::kVideo), "+15559999");
    EXPECT_EQ(services_.forward_target(0, kBusy, CallType::kVideo), std::nullopt);
    // One of the conditions has kept nothing.
    EXPECT_TRUE(services_.set_forwarding(1, to("+15559999", kBusy)));
    expect_refused(services_.set_forwarding(1, to("", kAllConditional)), Result::kInvalidArgument,
                   "none is kept");
}

TEST_F(Supplementary, ForwardingThatMakesNoSenseIsRefusedAndChangesNothing) {
    const auto refused = [&](const ForwardingEntry &entry, const std::string &why) {
        expect_refused(services_.set_forwarding(0, entry), Result::kInvalidArgument, why);
    };
    refused(to("+15559999", ForwardCondition{6}), "not 6");
    refused(to("+15559999", ForwardCondition{-1}), "not -1");
    refused(to("+15559999", kBusy, ServiceClass{8}), "not 8");
    refused(to("", kBusy), "no uri to forward to");
    refused(to("+15550100", kBusy), "cannot be forwarded to +15550100");
    refused(to("112", kBusy), "cannot be forwarded to 112");
    refused(to("*100#", kBusy), "service code");
    for (const int time : {4, 7, 31, 35, -5})
        refused(to("+15559999", kNoReply, kVoice, time), fmt::format("not {}", time));
    auto entry = to("+15559999", kBusy);
    entry.uri_length = 8;
    refused(entry, "the length says 8, and the uri has 9 bytes");
    entry.uri_length = -9;
    refused(entry, "the length says -9");
    entry = to("+15559999", kBusy);
    entry.uri_type = UriType::kSip;
    refused(entry, "is of uri type 0");
    entry.uri_type = UriType{7};
    refused(entry, "not 7");
    entry = to("+15559999", kBusy);
    entry.status = -1;
    refused(entry, "not -1");
    EXPECT_EQ(forwarding(kVoice, kBusy), std::vector{off(kBusy)});
    expect_refused(services_.forwarding(0, kVoice, ForwardCondition{6}), Result::kInvalidArgument,
                   "not 6");
    // Nobody looks at the time of the other conditions.
    expect_accepted(services_.set_forwarding(0, to("+15559999", kBusy, kVoice, 7)));
}

TEST_F(Supplementary, BarringNeedsThePassword) {
    const BarringEntry wanted{kBoth, 1, BarringType::kInternational};
    for (const auto *password : {"1234", "", "00000"})
        expect_refused(services_.set_barring(0, wanted, password), Result::kWrongPassword,
                       "not the barring password");
    EXPECT_THAT(*services_.barring(0, kVoice, BarringType::kInternational),
                ElementsAre(BarringEntry{kVoice, 0, BarringType::kInternational}));
    expect_accepted(services_.set_barring(0, wanted, "0000"));
    EXPECT_THAT(*services_.barring(0, kBoth, BarringType::kInternational),
                ElementsAre(BarringEntry{kVoice, 1, BarringType::kInternational},
                            BarringEntry{kVideo, 1, BarringType::kInternational}));
    expect_refused(services_.set_barring(0, {kVoice, 0, BarringType::kAll}, "1111"),
                   Result::kWrongPassword, "");
    expect_accepted(services_.set_barring(0, {kVoice, 0, BarringType::kAll}, "0000"));
    EXPECT_THAT(*services_.barring(0, kBoth, BarringType::kInternational),
                ElementsAre(BarringEntry{kVoice, 0, BarringType::kInternational},
                            BarringEntry{kVideo, 1, BarringType::kInternational}));
}

TEST_F(Supplementary, BarringThatMakesNoSenseIsRefused) {
    const auto refused = [&](const BarringEntry &entry, const std::string &why) {
        expect_refused(services_.set_barring(0, entry, "0000"), Result::kInvalidArgument, why);
    };
    refused({kBoth, 1, BarringType::kAll}, "can only be switched off");
    refused({kBoth, 1, BarringType{6}}, "not 6");
    refused({kBoth, 2, BarringType::kAllOutgoing}, "not 2");
    refused({ServiceClass{4}, 1, BarringType::kAllOutgoing}, "not 4");
    expect_refused(services_.barring(0, kBoth, BarringType{-1}), Result::kInvalidArgument,
                   "not -1");
}

TEST_F(Supplementary, AllOfThemNeedTheNetwork) {
    lose(0);
    const auto refused = [](const auto &answer) {
        expect_refused(answer, Result::kWrongState, "flight mode");
    };
    refused(services_.set_waiting(0, {kBoth, 1}));
    refused(services_.waiting(0, kBoth));
    refused(services_.set_forwarding(0, to("+15559999", kBusy)));
    refused(services_.forwarding(0, kBoth, kAll));
    refused(services_.set_barring(0, {kBoth, 1, BarringType::kAllOutgoing}, "0000"));
    refused(services_.barring(0, kBoth, BarringType::kAll));
}

} // namespace
} // namespace sim::test
