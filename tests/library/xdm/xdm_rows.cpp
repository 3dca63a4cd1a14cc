// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/xdm_rows.hpp"

#include "tests/library/xdm/sample.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

const char *const kUri = "sip:team@example.org";
const char *const kText = "a text";
const char *const kNoText = nullptr;
constexpr bool kOn = true;
constexpr bool kOff = false;
constexpr int32_t kNumber = -12;

const ims_xdm_session_service_s kService{7, true, false, true, false, true, false, true};
const ims_xdm_group_attributes_s kAttributes{"sip:team@example.org", &kAlice};
const ims_xdm_default_group_s kDefault{"my groups", "sip:team@example.org", true};

// What it says is looked at elsewhere.
void expect_some(void *data) {
    EXPECT_NE(data, nullptr);
}

void expect_the_group(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_STREQ(static_cast<ims_xdm_group_info_s *>(data)->group_uri, kUri);
}

// The parts that a spoilt record points to have to last as long as the call.
std::vector<BadText> bad_documents() {
    using Document = ims_xdm_group_info_s;
    return {spoilt<Document>("group_uri",
                             [](Document &group) { set_inline(group.group_uri, kNotUtf8); }),
            bad_text<&Document::channel_id>(),
            spoilt<Document>("a reference of the members",
                             [](Document &group) {
                                 static char *references[] = {text("good"), text(kNotUtf8)};
                                 static ims_xdm_member_list_s members = kMembers;
                                 members.entry_ref = references;
                                 group.group_member_list = &members;
                             }),
            spoilt<Document>("a rank of an identity of a rule", [](Document &group) {
                static ims_xdm_member_entry_s member = kAlice;
                member.status.rank = text(kNotUtf8);
                static ims_xdm_identity_entries_s entries{&member, 1};
                static void *cell = &entries;
                static ims_xdm_group_rule_s rule = kRules;
                rule.identity = &cell;
                group.group_rule_set = &rule;
            })};
}

std::vector<BadText> bad_attributes() {
    using Attributes = ims_xdm_group_attributes_s;
    return {spoilt<Attributes>("group_uri",
                               [](Attributes &record) {
                                   record = {kNotUtf8, &kAlice};
                               }),
            spoilt<Attributes>("position", [](Attributes &record) {
                static ims_xdm_member_entry_s member = kAlice;
                member.status.position = text(kNotUtf8);
                record = {"sip:team@example.org", &member};
            })};
}

std::string with_group(const std::string &value) {
    return "('sip:team@example.org', " + value + ")";
}

std::vector<RequestRow> flag_and_number_rows() {
    return {
        {.function = request<ims_xdm_modify_group_searchable, kUri, kOff>(),
         .method = "XdmModifyGroupSearchable",
         .type = "(sb)",
         .arguments = with_group("false")},
        {.function = request<ims_xdm_modify_group_invite_members, kUri, kOn>(),
         .method = "XdmModifyGroupInviteMembers",
         .type = "(sb)",
         .arguments = with_group("true")},
        {.function = request<ims_xdm_modify_group_max_participants, kUri, kNumber>(),
         .method = "XdmModifyGroupMaxParticipants",
         .type = "(si)",
         .arguments = with_group("-12")},
        {.function = request<ims_xdm_modify_group_auto_advertisements, kUri, kOn>(),
         .method = "XdmModifyGroupAutoAdvertisements",
         .type = "(sb)",
         .arguments = with_group("true")},
        {.function = request<ims_xdm_modify_group_qoe, kUri, kNumber>(),
         .method = "XdmModifyGroupQoe",
         .type = "(si)",
         .arguments = with_group("-12")},
    };
}

std::vector<RequestRow> text_rows() {
    return {
        {.function = request<ims_xdm_delete_group, kUri>(),
         .method = "XdmDeleteGroup",
         .type = "(s)",
         .arguments = "('sip:team@example.org',)"},
        {.function = request<ims_xdm_delete_group_rule, kUri, kText>(),
         .method = "XdmDeleteGroupRule",
         .type = "(ss)",
         .arguments = with_group("'a text'")},
        {.function = request<ims_xdm_modify_group_display_name, kUri, kText>(),
         .method = "XdmModifyGroupDisplayName",
         .type = "(ss)",
         .arguments = with_group("'a text'")},
        {.function = request<ims_xdm_modify_group_subject, kUri, kText>(),
         .method = "XdmModifyGroupSubject",
         .type = "(ss)",
         .arguments = with_group("'a text'")},
    };
}

std::vector<RequestRow> record_rows() {
    return {
        {.function = request<ims_xdm_create_group, kGroup>(),
         .method = "XdmCreateGroup",
         .type = "(a{sv})",
         .arguments = "(" + kSentGroup + ",)",
         .bad_texts = bad_documents()},
        {.function = request<ims_xdm_add_user_to_shared_group, kUri, kMembers>(),
         .method = "XdmAddUserToSharedGroup",
         .type = "(sa{sv})",
         .arguments = with_group(kSentMembers)},
        {.function = request<ims_xdm_remove_user_from_shared_group, kUri, kMembers>(),
         .method = "XdmRemoveUserFromSharedGroup",
         .type = "(sa{sv})",
         .arguments = with_group(kSentMembers)},
        {.function = request<ims_xdm_add_group_rule, kUri, kRules>(),
         .method = "XdmAddGroupRule",
         .type = "(saa{sv})",
         .arguments = with_group(kSentRules)},
        {.function = request<ims_xdm_modify_group_rule, kUri, kRules>(),
         .method = "XdmModifyGroupRule",
         .type = "(saa{sv})",
         .arguments = with_group(kSentRules)},
        {.function = request<ims_xdm_modify_group_session_active_policy, kUri, kPolicy>(),
         .method = "XdmModifyGroupSessionActivePolicy",
         .type = "(sa{sv})",
         .arguments = with_group(kSentPolicy)},
        {.function = request<ims_xdm_modify_group_session_service_list, kUri, kService>(),
         .method = "XdmModifyGroupSessionServiceList",
         .type = "(sa{sv})",
         .arguments = with_group("{'group_app': <int64 7>, 'group_media_list': <{'audio': <true>, "
                                 "'video': <false>, 'message': <true>, 'file_transfer': <false>, "
                                 "'group_advertisement': <true>, 'pager_mode': <false>, "
                                 "'poc_speech': <true>}>}")},
        {.function = request<ims_xdm_modify_group_age_restriction, kUri, kAges>(),
         .method = "XdmModifyGroupAgeRestriction",
         .type = "(saa{sv})",
         .arguments = with_group(kSentAges)},
        // Here "type" is the type of the member, as a number.
        {.function = request<ims_xdm_modify_group_attributes, kAttributes>(),
         .method = "XdmModifyGroupAttributes",
         .type = "(sssbbiba{sv})",
         .arguments =
             "('sip:team@example.org', 'sip:alice@example.org', 'Alice', true, true, 5, false, "
             "{'assign': <'site'>, 'position': <'lead'>, 'rank': <'first'>})",
         .bad_texts = bad_attributes()},
        {.function = request<ims_xdm_modify_default_group, kDefault>(),
         .method = "XdmModifyDefaultGroup",
         .type = "(ssb)",
         .arguments = "('my groups', 'sip:team@example.org', true)"},
    };
}

std::vector<RequestRow> reading_rows() {
    std::vector<RequestRow> rows{
        {.function = request<ims_xdm_fetch_shared_group, kGroup>(),
         .method = "XdmFetchSharedGroup",
         .type = "(ss)",
         .arguments = with_group("'channel 9'"),
         .reply = "(0, " + kAnsweredGroup + ")",
         .check_data = expect_the_group,
         .refused_message = "Failed to fetch group Info: "},
        {.function = request<ims_xdm_fetch_all_shared_groups, kNoText>(),
         .method = "XdmFetchAllSharedGroups",
         .type = "(s)",
         .arguments = "('',)",
         .checked = Checked::kHandle,
         .reply = "(0, {'version': <'1'>})",
         .check_data = expect_some,
         .refused_message = "Failed to fetch group Info: "},
        {.function = request<ims_xdm_fetch_all_participant_groups, kNoText>(),
         .method = "XdmFetchAllParticipantGroups",
         .type = "(s)",
         .arguments = "('',)",
         .checked = Checked::kHandle,
         .reply = "(0, {'version': <'1'>})",
         .check_data = expect_some,
         .refused_message = "Failed to fetch participant group Info: "},
        {.function = request<ims_xdm_fetch_shared_user_profile, kText>(),
         .method = "XdmFetchSharedUserProfile",
         .type = "(s)",
         .arguments = "('a text',)",
         .checked = Checked::kHandle,
         .reply = "(0, {'gender': <'x'>})",
         .check_data = expect_some,
         .refused_message = "Failed to fetch shared user profile Info: "},
        {.function = request<ims_xdm_get_participant_info, kText>(),
         .method = "XdmGetParticipantInfo",
         .type = "(s)",
         .arguments = "('a text',)",
         .reply = "(0, {'qoe': <int64 1>})",
         .check_data = expect_some,
         .refused_message = "Failed to fetch conf participant Info: "},
    };
    for (RequestRow &row : rows) {
        row.reply_type = "(ia{sv})";
        row.handler = "on_response_" + without_prefix(row.function.name);
    }
    return rows;
}

} // namespace

std::vector<RequestRow> xdm_request_rows() {
    return requests_of(
        {.unit = "ims_xdm.cpp",
         .interface = "org.kelvo.ims.Xdm",
         .handler = "on_response_xdm_common_response"},
        joined({record_rows(), text_rows(), flag_and_number_rows(), reading_rows()}));
}

} // namespace test
