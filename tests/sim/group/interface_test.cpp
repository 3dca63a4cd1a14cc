// SPDX-License-Identifier: Apache-2.0
// What org.kelvo.ims.Xdm answers about push-to-talk sessions.
#include "sim/group/interface.hpp"

#include "sim/bus/form.hpp"
#include "sim/network.hpp"

#include <algorithm>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace sim::test {
namespace {

using testing::HasSubstr;

ParticipantInfo sample_session() {
    return {.list_service_uri = "sip:crew@example.org",
            .session_uri = "sip:session1@example.org",
            .disp_name = "Crew",
            .session_type = 1,
            .media = {.audio = true, .poc_speech = true},
            .qoe = 2,
            .area_id = "a",
            .seu_id = "b",
            .flow_id = "c",
            .inviting_user = "tel:+15550100",
            .is_emergency = true,
            .is_one_many_one = false,
            .expiry_time = "60",
            .is_full_duplex = true,
            .participants = {{.member = {.uri = "tel:+15550101", .active = true, .type = 5},
                              .user_state = 3,
                              .media = {.video = true},
                              .user_qoe = 4}}};
}

constexpr const char *kSampleText =
    "(0, {'list_service_uri': <'sip:crew@example.org'>, 'session_uri': "
    "<'sip:session1@example.org'>, 'disp_name': <'Crew'>, 'session_type': <int64 1>, "
    "'media_list_v': <{'audio': <true>, 'video': <false>, 'message': <false>, 'file_transfer': "
    "<false>, 'group_advertisement': <false>, 'pager_mode': <false>, 'poc_speech': <true>}>, "
    "'qoe': <int64 2>, 'area_id': <'a'>, 'seu_id': <'b'>, 'flow_id': <'c'>, 'inviting_user': "
    "<'tel:+15550100'>, 'is_emergency_flag': <true>, 'is_one_many_one_flag': <false>, "
    "'expiry_time': <'60'>, 'is_full_duplex': <true>, 'conf_participant_entry_v': "
    "<[{'contact_list_entry_v': <{'uri': <'tel:+15550101'>, 'stt': <false>, 'active': <true>, "
    "'type': <int64 5>, 'auto_join': <false>, 'status_v': <@a{sv} {}>}>, 'user_state': <int64 3>, "
    "'media_info_v': <{'audio': <false>, 'video': <true>, 'message': <false>, 'file_transfer': "
    "<false>, 'group_advertisement': <false>, 'pager_mode': <false>, 'poc_speech': <false>}>, "
    "'user_qoe': <int64 4>}]>})";

class XdmParticipants : public testing::Test {
  protected:
    Answer<Variant> ask(int slot, const std::string &text) {
        const auto methods = interface_.describe().methods;
        const auto method = std::ranges::find(methods, "XdmGetParticipantInfo", &Method::member);
        return method->handler({slot, "", wire::pack(text)});
    }

    Timers timers_{1, [] { return std::chrono::nanoseconds(0); }};
    Network network_{{.numbers = {"+15550100", "+15550101"}}, timers_, {}};
    // One session, of the second slot alone.
    GroupInterface interface_{network_.groups, network_.plan, network_.registrations, [](int slot) {
                                  return slot == 1 ? std::vector{sample_session()}
                                                   : std::vector<ParticipantInfo>();
                              }};
};

TEST_F(XdmParticipants, AreThoseOfTheSessionOrOfTheGroupsSession) {
    for (const auto *text : {"sip:session1@example.org", "sip:crew@example.org"}) {
        const auto answer = ask(1, text);
        ASSERT_TRUE(answer) << answer.refusal().reason;
        EXPECT_EQ((*answer).print(), kSampleText);
    }
}

TEST_F(XdmParticipants, AreNotToldOfOtherSessions) {
    for (const auto &[slot, text] :
         {std::pair(0, "sip:crew@example.org"), {1, "sip:other@example.org"}, {1, ""}}) {
        const auto answer = ask(slot, text);
        ASSERT_FALSE(answer) << text;
        EXPECT_EQ(answer.code(), Result::kUnknownSession);
        EXPECT_THAT(answer.refusal().reason, HasSubstr(fmt::format("\"{}\"", text)));
    }
}

} // namespace
} // namespace sim::test
