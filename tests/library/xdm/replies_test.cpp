// SPDX-License-Identifier: Apache-2.0
// The answers that are no group documents: participant groups, user profiles, participants.
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

// One of the fetching functions that take a text.
using Fetch = int (*)(ims_h handle, const char *text, ims_response_cb callback, void *user_data);

class Replies : public WithPeer {
  protected:
    // Has the peer answer a method, and looks at the record while it is there.
    template <typename Record>
    void fetch(Fetch function, const char *method, const std::string &dictionary,
               const std::function<void(const Record &)> &look) {
        peer().on(std::string{"org.kelvo.ims.Xdm."} + method,
                  reply("(ia{sv})", "(0, " + dictionary + ")"));
        ResponseRecorder recorder{[&](const Response &response, void *data) {
            EXPECT_EQ(response.result, 0);
            ASSERT_NE(data, nullptr);
            look(*static_cast<Record *>(data));
        }};
        ASSERT_EQ(function(handle_, "x", ResponseRecorder::callback, &recorder), IMS_ERROR_NONE);
        pump_until([&] { return recorder.count() > 0; }, method);
        EXPECT_TRUE(take_log().empty());
    }
    void groups(const std::string &dictionary,
                const std::function<void(const ims_xdm_participant_groups_s &)> &look) {
        fetch(ims_xdm_fetch_all_participant_groups, "XdmFetchAllParticipantGroups", dictionary,
              look);
    }
    void profile(const std::string &dictionary,
                 const std::function<void(const ims_xdm_user_profile_s &)> &look) {
        fetch(ims_xdm_fetch_shared_user_profile, "XdmFetchSharedUserProfile", dictionary, look);
    }
    void participants(const std::string &dictionary,
                      const std::function<void(const ims_xdm_participant_info_s &)> &look) {
        fetch(ims_xdm_get_participant_info, "XdmGetParticipantInfo", dictionary, look);
    }
};

constexpr const char *kMedia =
    "{'audio': <true>, 'video': <false>, 'message': <false>, 'file_transfer': <true>, "
    "'group_advertisement': <false>, 'pager_mode': <false>, 'poc_speech': <true>}";

constexpr const char *kGroupLists =
    "{'version': <'4'>, 'participant_groups_v': <{'num_of_group_lists': <int64 2>, "
    "'group_list_info_v': <[{'group_list_name': <'work'>, 'num_of_groups': <int64 1>, "
    "'display_name': <'Work'>, 'group_entries_v': <[{'group_list_entry_uri_v': "
    "<{'uri_type': <int64 6>, 'uri': <'sip:team@example.org'>, 'disp_name': <'Team'>, "
    "'is_group_uri': <true>}>, 'entry_uri_usages_v': <{'num_of_common_uri_usages': <int64 1>, "
    "'poc_usage': <'poc'>, 'im_usage': <'im'>, 'common_uri_usage_v': <[{'pc_id': <'pc'>, "
    "'grp_adv_v': <{'note': <'hello'>, 'grp_v': <{'type': <int64 8>, 'display_name': <'T'>, "
    "'supported_services_v': <[{'service_enabler': <int64 9>}]>, 'group_uri': <'sip:t'>}>}>}]>}>, "
    "'is_default_group': <true>, 'is_start_up': <true>}]>}, {'display_name': <'Empty'>}]>}>}";

TEST_F(Replies, BringParticipantGroups) {
    const ims_xdm_common_uri_usage_s *usages = nullptr;
    groups(kGroupLists, [&](const ims_xdm_participant_groups_s &groups) {
        EXPECT_STREQ(groups.version, "4");
        ASSERT_EQ(groups.num_of_group_lists, 2);
        ASSERT_NE(groups.group_list_info, nullptr);
        const ims_xdm_group_list_s &list = groups.group_list_info[0];
        EXPECT_STREQ(list.group_list_name, "work");
        EXPECT_STREQ(list.display_name, "Work");
        ASSERT_EQ(list.num_of_groups, 1);
        ASSERT_NE(list.group_entries, nullptr);
        const ims_xdm_group_entry_s &entry = list.group_entries[0];
        EXPECT_EQ(entry.group_list_entry_uri.uri_type, 6);
        EXPECT_STREQ(entry.group_list_entry_uri.uri, "sip:team@example.org");
        EXPECT_STREQ(entry.group_list_entry_uri.disp_name, "Team");
        EXPECT_TRUE(entry.group_list_entry_uri.is_group_uri);
        EXPECT_TRUE(entry.is_default_group);
        EXPECT_TRUE(entry.is_start_up);
        EXPECT_STREQ(entry.entry_uri_usages.poc_usage, "poc");
        EXPECT_STREQ(entry.entry_uri_usages.im_usage, "im");
        ASSERT_EQ(entry.entry_uri_usages.num_of_common_uri_usages, 1);
        ASSERT_NE(entry.entry_uri_usages.common_uri_usage, nullptr);
        usages = entry.entry_uri_usages.common_uri_usage;
        EXPECT_STREQ(usages->pc_id, "pc");
        EXPECT_STREQ(usages->grp_adv.note, "hello");
        EXPECT_EQ(usages->grp_adv.grp.type, 8);
        EXPECT_STREQ(usages->grp_adv.grp.display_name, "T");
        EXPECT_STREQ(usages->grp_adv.grp.group_uri, "sip:t");
        ASSERT_NE(usages->grp_adv.grp.supported_services, nullptr);
        EXPECT_EQ(usages->grp_adv.grp.supported_services->service_enabler, 9);
        const ims_xdm_group_list_s &empty = groups.group_list_info[1];
        EXPECT_STREQ(empty.group_list_name, "");
        EXPECT_STREQ(empty.display_name, "Empty");
        EXPECT_EQ(empty.group_entries, nullptr);
    });
    expect_released(usages);
}

TEST_F(Replies, DropGroupListsWhoseCountsLie) {
    groups("{'participant_groups_v': <{'num_of_group_lists': <int64 1>, 'group_list_info_v': "
           "<[{'num_of_groups': <int64 3>, 'group_entries_v': <[{'is_start_up': <true>}]>}]>}>}",
           [](const ims_xdm_participant_groups_s &groups) {
               ASSERT_NE(groups.group_list_info, nullptr);
               EXPECT_EQ(groups.group_list_info[0].group_entries, nullptr);
               EXPECT_EQ(groups.group_list_info[0].num_of_groups, 3);
           });
    groups("{'participant_groups_v': <{'group_list_info_v': <@aa{sv} [{}]>}>}",
           [](const ims_xdm_participant_groups_s &groups) {
               EXPECT_EQ(groups.group_list_info, nullptr);
               EXPECT_EQ(groups.num_of_group_lists, 0);
           });
}

TEST_F(Replies, CutGroupListNamesAndUris) {
    const std::string name(128, 'n');
    const std::string uri(1536, 'u');
    groups("{'participant_groups_v': <{'num_of_group_lists': <int64 1>, 'group_list_info_v': "
           "<[{'group_list_name': <'" +
               name +
               "x'>, 'num_of_groups': <int64 1>, 'group_entries_v': "
               "<[{'group_list_entry_uri_v': <{'uri': <'" +
               uri + "x'>}>}]>}]>}>}",
           [&](const ims_xdm_participant_groups_s &groups) {
               ASSERT_NE(groups.group_list_info, nullptr);
               EXPECT_EQ(groups.group_list_info[0].group_list_name, name);
               ASSERT_NE(groups.group_list_info[0].group_entries, nullptr);
               EXPECT_EQ(groups.group_list_info[0].group_entries[0].group_list_entry_uri.uri, uri);
           });
}

TEST_F(Replies, BringAUserProfile) {
    char **hobbies = nullptr;
    profile("{'user_uri': <'sip:a'>, 'display_name': <'A'>, 'birth_day': <'1 May'>, "
            "'gender': <'x'>, 'free_text': <'free'>, 'qoe': <int64 -2>, 'status': <'on'>, "
            "'dispatcher_id': <'d'>, 'client_type': <'c'>, "
            "'comm_info_v': <[{'comm_info': <'tel:1'>}, {'other': <'tel:2'>}]>, "
            "'name_v': <{'given_name': <'G'>, 'family_name': <'F'>, 'middle_name': <'M'>, "
            "'name_suffix': <'S'>, 'name_prefix': <'P'>}>, "
            "'address_v': <{'country': <'C'>, 'region': <'R'>, 'locality': <'L'>, 'area': <'A'>, "
            "'street_name': <'SN'>, 'street_number': <'1a'>, 'postal_code': <'PC'>}>, "
            "'company_info_v': <{'assign': <'as'>, 'position': <'po'>, 'rank': <'ra'>}>, "
            "'hobbies_v': <[{'hobby': <'chess'>}]>, "
            "'favourite_link_v': <[{'link': <'l1'>}, {'link': <'l2'>}]>}",
            [&](const ims_xdm_user_profile_s &profile) {
                EXPECT_STREQ(profile.user_uri, "sip:a");
                EXPECT_STREQ(profile.display_name, "A");
                EXPECT_STREQ(profile.birth_day, "1 May");
                EXPECT_STREQ(profile.gender, "x");
                EXPECT_STREQ(profile.free_text, "free");
                EXPECT_EQ(profile.qoe, -2);
                EXPECT_STREQ(profile.status, "on");
                EXPECT_STREQ(profile.dispatcher_id, "d");
                EXPECT_STREQ(profile.client_type, "c");
                ASSERT_EQ(profile.num_of_comm_info, 2);
                EXPECT_STREQ(profile.comm_info[0], "tel:1");
                EXPECT_EQ(profile.comm_info[1], nullptr); // under a key of its own
                EXPECT_STREQ(profile.name.given_name, "G");
                EXPECT_STREQ(profile.name.family_name, "F");
                EXPECT_STREQ(profile.name.middle_name, "M");
                EXPECT_STREQ(profile.name.name_suffix, "S");
                EXPECT_STREQ(profile.name.name_prefix, "P");
                EXPECT_STREQ(profile.address.country, "C");
                EXPECT_STREQ(profile.address.region, "R");
                EXPECT_STREQ(profile.address.locality, "L");
                EXPECT_STREQ(profile.address.area, "A");
                EXPECT_STREQ(profile.address.street_name, "SN");
                EXPECT_STREQ(profile.address.street_number, "1a");
                EXPECT_STREQ(profile.address.postal_code, "PC");
                EXPECT_STREQ(profile.company_info.assign, "as");
                EXPECT_STREQ(profile.company_info.position, "po");
                EXPECT_STREQ(profile.company_info.rank, "ra");
                ASSERT_EQ(profile.num_of_hobbies, 1);
                hobbies = profile.hobbies;
                EXPECT_STREQ(profile.hobbies[0], "chess");
                ASSERT_EQ(profile.num_of_favourite_links, 2);
                EXPECT_STREQ(profile.favourite_link[0], "l1");
                EXPECT_STREQ(profile.favourite_link[1], "l2");
            });
    expect_released(hobbies);
}

TEST_F(Replies, BringAnEmptyUserProfile) {
    profile("{'hobbies_v': <@aa{sv} []>, 'favourite_link_v': <'none'>}",
            [](const ims_xdm_user_profile_s &profile) {
                EXPECT_EQ(profile.user_uri, nullptr);
                EXPECT_EQ(profile.name.given_name, nullptr);
                EXPECT_EQ(profile.comm_info, nullptr);
                EXPECT_EQ(profile.num_of_comm_info, 0);
                EXPECT_EQ(profile.hobbies, nullptr);
                EXPECT_EQ(profile.num_of_hobbies, 0);
                EXPECT_EQ(profile.favourite_link, nullptr);
                EXPECT_EQ(profile.num_of_favourite_links, 0);
            });
}

TEST_F(Replies, BringWhoTakesPart) {
    const ims_xdm_conf_participant_s *released = nullptr;
    participants(
        std::string{"{'list_service_uri': <'sip:list'>, 'session_uri': <'sip:session'>, "
                    "'disp_name': <'Team'>, 'session_type': <int64 2>, 'media_list_v': <"} +
            kMedia +
            ">, 'qoe': <int64 3>, 'area_id': <'area'>, 'seu_id': <'seu'>, 'flow_id': <'flow'>, "
            "'inviting_user': <'sip:alice'>, 'is_emergency_flag': <true>, "
            "'is_one_many_one_flag': <true>, 'expiry_time': <'3600'>, 'is_full_duplex': <true>, "
            "'conf_participant_entry_v': <[{'contact_list_entry_v': <{'uri': <'sip:bob'>, "
            "'disp_name': <'Bob'>, 'stt': <true>, 'active': <false>, 'type': <int64 5>, "
            "'auto_join': <true>, 'status_v': <{'rank': <'first'>}>}>, 'user_state': <int64 4>, "
            "'media_info_v': <" +
            kMedia + ">, 'user_qoe': <int64 -1>}, {}]>}",
        [&](const ims_xdm_participant_info_s &info) {
            EXPECT_STREQ(info.list_service_uri, "sip:list");
            EXPECT_STREQ(info.session_uri, "sip:session");
            EXPECT_STREQ(info.disp_name, "Team");
            EXPECT_EQ(info.session_type, 2);
            ASSERT_NE(info.media_list, nullptr);
            EXPECT_TRUE(info.media_list->audio);
            EXPECT_TRUE(info.media_list->poc_speech);
            EXPECT_FALSE(info.media_list->message);
            EXPECT_EQ(info.qoe, 3);
            EXPECT_STREQ(info.area_id, "area");
            EXPECT_STREQ(info.seu_id, "seu");
            EXPECT_STREQ(info.flow_id, "flow");
            EXPECT_STREQ(info.inviting_user, "sip:alice");
            EXPECT_TRUE(info.is_emergency_flag);
            EXPECT_TRUE(info.is_one_many_one_flag);
            EXPECT_STREQ(info.expiry_time, "3600");
            EXPECT_TRUE(info.is_full_duplex);
            ASSERT_EQ(info.num_of_conf_participants, 2);
            ASSERT_NE(info.conf_participant_entry, nullptr);
            const ims_xdm_conf_participant_s &bob = info.conf_participant_entry[0];
            EXPECT_STREQ(bob.contact_list_entry.uri, "sip:bob");
            EXPECT_STREQ(bob.contact_list_entry.disp_name, "Bob");
            EXPECT_TRUE(bob.contact_list_entry.stt);
            EXPECT_FALSE(bob.contact_list_entry.active);
            EXPECT_EQ(bob.contact_list_entry.type, 5);
            EXPECT_TRUE(bob.contact_list_entry.auto_join);
            EXPECT_STREQ(bob.contact_list_entry.status.rank, "first");
            EXPECT_EQ(bob.user_state, 4);
            ASSERT_NE(bob.media_info, nullptr);
            EXPECT_TRUE(bob.media_info->file_transfer);
            EXPECT_EQ(bob.user_qoe, -1);
            EXPECT_EQ(info.conf_participant_entry[1].media_info, nullptr);
            released = info.conf_participant_entry;
        });
    expect_released(released);
}

} // namespace
} // namespace test
