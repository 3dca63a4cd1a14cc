// SPDX-License-Identifier: Apache-2.0
// Ad hoc groups, channels, and who belongs to a group.
#include "tests/sim/ptt/network.hpp"

namespace sim::test {
namespace {

class PttGroups : public PttNetwork {
  protected:
    Answer<std::int32_t> try_ad_hoc(const std::vector<PttUser> &users, PttOffer offer = {}) {
        return ptt_.make_ad_hoc_call(0, {std::move(offer), "Night shift", users});
    }
    // Session 1 of the slots 0 and 1.
    void connect_ad_hoc() {
        expect_accepted(
            try_ad_hoc({{to("+15550101"), false}, {to("+15550221"), false}}, {.automatic = true}));
        advance(2s);
        forget_events();
    }
    Status add(const std::string &uri, bool automatic = true) {
        return ptt_.add_users(0, {1, automatic, {{to(uri), false}}, 0, {}});
    }
};

TEST_F(PttGroups, AnAdHocGroupIsMadeOfThoseWhoAreNamed) {
    expect_accepted(try_ad_hoc({{to("+15550101"), false}, {to("+15550102"), true}}));
    advance(700ms);
    const auto told = take(1);
    ASSERT_EQ(told.size(), 2u);
    EXPECT_THAT(told[0],
                testing::StartsWith("PocGroupAdvertisement (1, {'subject': <'Night shift'>, "
                                    "'call_info': <'sip:adhoc-1@groups.invalid'>, 'remote_uri': "
                                    "<{'uri_type': <int64 0>, 'uri': <'tel:+15550100'>, "));
    EXPECT_THAT(told[0], HasSubstr("'group_advertisement_content': <[{'content_byte': <'"));
    EXPECT_THAT(told[1], HasSubstr("'sip:adhoc-1@groups.invalid', 'Night shift', "
                                   "'sip:anonymous@anonymous.invalid', 1, 2,"));
    answer_all({1});
    expect_accepted(ptt_.answer(2, {false, false, 1, 0, {}, {}}));
    EXPECT_THAT(take(1), ElementsAre("PocGroupConfParticipantInfo (1, "
                                     "'sip:anonymous@anonymous.invalid', 'connected')"));
}

TEST_F(PttGroups, UsersAreAddedAndRemoved) {
    connect_ad_hoc();
    expect_accepted(ptt_.add_users(
        0, {1, true, {{to("+15550102"), false}}, 0, {{"See you", "text/plain", "inline"}}}));
    advance(500ms);
    EXPECT_THAT(take_names(2),
                ElementsAre("PocGroupAdvertisement", "PocCallIncomingInd", "PocCallEstablished",
                            "PocGroupConfParticipantInfo", "PocGroupConfParticipantInfo",
                            "PocGroupConfParticipantInfo", "PocCallFloorIdle"));
    EXPECT_THAT(take(1),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550102', 'alerting')",
                            "PocGroupConfParticipantInfo (1, 'tel:+15550102', 'connected')"));
    forget_events();
    expect_accepted(ptt_.remove_users(0, 1, {to("tel:+15550102")}));
    EXPECT_THAT(take(2), ElementsAre("PocCallEnded (1, 8)"));
    EXPECT_THAT(take(1),
                ElementsAre("PocGroupConfParticipantInfo (1, 'tel:+15550102', 'disconnected')"));
    expect_accepted(add("+15550102", false));
    advance(500ms);
    EXPECT_EQ(take_names(2).back(), "PocCallIncomingInd");
    advance(30s);
    EXPECT_EQ(take(2).back(), "PocCallEnded (2, 5)");
}

TEST_F(PttGroups, AGroupMayBeNamedAmongTheUsers) {
    expect_accepted(try_ad_hoc({{to(kTeam, true), false}}, {.automatic = true}));
    advance(700ms);
    EXPECT_EQ(ptt_.running(0).front().participants.size(), 3u);
}

TEST_F(PttGroups, WhatMakesNoSenseForAnAdHocGroupIsRefused) {
    expect_refused(try_ad_hoc({}), Result::kInvalidArgument, "nobody is to be called");
    expect_refused(try_ad_hoc({{to("+15550101"), false}, {to("tel:15550101"), false}}),
                   Result::kInvalidArgument, "named twice");
    expect_refused(try_ad_hoc({{to("+15550100"), false}}), Result::kInvalidArgument, "itself");
    expect_refused(try_ad_hoc({{to("bob"), false}}), Result::kInvalidArgument, "no number");
    expect_refused(try_ad_hoc({{to("sip:x@y", true), false}}), Result::kUnknownRecord, "no group");
    std::vector<PttUser> many;
    for (int i = 0; i < 16; ++i)
        many.push_back({to(fmt::format("+1556{:04}", i)), false});
    expect_refused(try_ad_hoc(many), Result::kTooMany, "at most 16");
    connect_ad_hoc();
    expect_refused(add("+15550101"), Result::kInvalidArgument, "takes part");
    expect_refused(ptt_.remove_users(0, 1, {to("+15550103")}), Result::kInvalidArgument,
                   "does not take part");
    expect_refused(ptt_.add_users(1, {1, true, {{to("+15550102"), false}}, 0, {}}),
                   Result::kWrongState, "not placed here");
    many.resize(14);
    expect_refused(ptt_.add_users(0, {1, true, many, 0, {}}), Result::kTooMany, "at most 16");
    expect_refused(ptt_.add_users(0, {1, true, {{to("+15550102"), false}}, 3601, {}}),
                   Result::kInvalidArgument, "the time to answer");
    expect_refused(ptt_.add_users(0, {7, true, {}, 0, {}}), Result::kUnknownSession, "session 7");
    place(2, "+15550103");
    advance(700ms);
    answer_all({3});
    expect_refused(ptt_.add_users(2, {1, true, {}, 0, {}}), Result::kWrongState,
                   "no call to an ad");
}

TEST_F(PttGroups, AChannelIsForThoseWhoAreTunedToIt) {
    using enum PttChannelMode;
    for (const int slot : {0, 1})
        expect_accepted(ptt_.set_channel(slot, 5, kTalkAndListen));
    expect_accepted(ptt_.set_channel(2, 6, kTalkAndListen));
    place(0, "", PttCallType::kChannel);
    advance(700ms);
    EXPECT_THAT(take_names(1), ElementsAre("PocCallIncomingInd", "PocCallEstablished",
                                           "PocGroupConfParticipantInfo", "PocCallFloorIdle"));
    EXPECT_EQ(take_only(0, "PocCallEst").size(), 1u);
    EXPECT_THAT(take(2), IsEmpty());
    // Tuning in is joining, tuning away is leaving.
    expect_accepted(ptt_.set_channel(2, 5, kListenOnly));
    EXPECT_EQ(take_names(2).front(), "PocCallIncomingInd");
    EXPECT_EQ(take(0).back(), "PocGroupConfParticipantInfo (1, 'tel:+15550102', 'connected')");
    expect_accepted(ask_floor(2));
    EXPECT_EQ(take(2).back(), "PocCallFloorRejected (1, <[0, 0, 0, 0]>, 0, '', 3, '', 0, 0, 3, "
                              "'this participant listens only')");
    expect_accepted(ptt_.set_channel(2, 5, kTalkAndListen));
    expect_accepted(ask_floor(2));
    EXPECT_EQ(take_names(2), std::vector<std::string>{"PocCallFloorGranted"});
    expect_accepted(ptt_.set_channel(2, 0, kTalkAndListen));
    EXPECT_THAT(take(2), ElementsAre("PocCallEnded (1, 0)"));
    EXPECT_EQ(take_names(0).back(), "PocCallFloorIdle");
    // One may be alone there.
    expect_accepted(ptt_.set_channel(1, 0, kTalkAndListen));
    EXPECT_EQ(ptt_.running(0).size(), 1u);
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
    place(0, "", PttCallType::kChannel);
    advance(700ms);
    EXPECT_EQ(take_names(0).back(), "PocCallFloorIdle");
}

TEST_F(PttGroups, WhoeverTurnsToListeningOnlyNeitherSpeaksNorWaits) {
    using enum PttChannelMode;
    for (const int slot : {0, 1, 2})
        expect_accepted(ptt_.set_channel(slot, 5, kTalkAndListen));
    place(0, "", PttCallType::kChannel);
    advance(2s);
    for (const int slot : {0, 1, 2})
        expect_accepted(ask_floor(slot));
    forget_events();
    expect_accepted(ptt_.set_channel(1, 5, kListenOnly));
    EXPECT_THAT(take_floor(1),
                ElementsAre("PocCallFloorCanceled (1, <[1, 0, 0, 0]>, 0, 'tel:+15550100', 3, '', "
                            "0, 0, 3, 'this participant listens only')"));
    EXPECT_THAT(take_floor(2), ElementsAre(testing::StartsWith("PocCallFloorQueuePosition")));
    forget_events();
    expect_accepted(ptt_.set_channel(0, 5, kListenOnly));
    EXPECT_THAT(take_floor(0),
                ElementsAre("PocCallFloorCanceled (1, <[1, 0, 0, 0]>, 0, 'tel:+15550100', 3, '', "
                            "0, 0, 3, 'this participant listens only')",
                            testing::StartsWith("PocCallFloorTaken (1, <[1, 0, 0, 0]>, 0, "
                                                "'tel:+15550102'")));
    EXPECT_THAT(take_floor(2), ElementsAre(testing::StartsWith("PocCallFloorGranted")));
    expect_accepted(ptt_.set_channel(1, 5, kListenOnly)); // nothing is left to take
    EXPECT_THAT(take(1), testing::Each(testing::Not(HasSubstr("Canceled"))));
    expect_accepted(floor_.release(2, 1));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttGroups, ChannelsHaveTheirLimits) {
    for (const std::int32_t channel : {-1, 17})
        expect_refused(ptt_.set_channel(0, channel, PttChannelMode::kListenOnly),
                       Result::kInvalidArgument, "1 to 16");
    expect_refused(ptt_.set_channel(0, 1, PttChannelMode{2}), Result::kInvalidArgument, "not 2");
}

TEST_F(PttGroups, TheDirectoryKnowsItsGroups) {
    const auto uris = [&](const std::string &group) {
        std::vector<std::string> found;
        const auto members = directory_.members(0, group);
        if (members)
            for (const auto &member : *members)
                found.push_back(member.uri);
        return found;
    };
    EXPECT_THAT(uris("sip:all@groups.invalid"),
                ElementsAre("tel:+15550101", "tel:+15550102", "tel:+15550103"));
    EXPECT_THAT(uris("sip:network@groups.invalid"),
                ElementsAre("tel:+15550221", "tel:+15550222", "tel:+15550214"));
    EXPECT_EQ(uris("sip:mixed@groups.invalid").size(), 6u);
    EXPECT_THAT(uris(kTeam), ElementsAre("tel:+15550101", "tel:+15550102"));
    for (const char *none : {"", "sip:all", "sip:all@elsewhere", "sip:other@groups.invalid"})
        expect_refused(directory_.members(0, none), Result::kUnknownRecord, "there is no group");
    directory_.add_groups([](std::string_view) -> std::optional<std::vector<std::string>> {
        return std::vector<std::string>{"sip:alice@example.org"};
    });
    const auto alice = directory_.members(0, "sip:x@example.org");
    ASSERT_TRUE(alice);
    EXPECT_EQ(alice->front().party->welcome, PttWelcome::kNobody);
}

} // namespace
} // namespace sim::test
