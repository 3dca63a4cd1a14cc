// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/xdm_rows.hpp"

#include "tests/library/xdm/sample.hpp"

#include <gtest/gtest.h>

#include <tuple>

namespace test {
namespace {

constexpr Module kModule{"ims_xdm.cpp", "org.kelvo.ims.Xdm"};

const char *const kUri = "sip:team@example.org";
const char *const kText = "a text";
const char *const kNoText = nullptr;
constexpr char kBadText[] = "caf\xe9";
constexpr bool kOn = true;
constexpr bool kOff = false;
constexpr int32_t kNumber = -12;
const ims_xdm_group_info_s *const kGroupPointer = &kGroup;
const ims_xdm_member_list_s *const kMembersPointer = &kMembers;
const ims_xdm_group_rule_s *const kRulesPointer = &kRules;
const ims_xdm_session_policy_s *const kPolicyPointer = &kPolicy;
const ims_xdm_age_restriction_s *const kAgesPointer = &kAges;

const ims_xdm_session_service_s kService{7, true, false, true, false, true, false, true};
const ims_xdm_session_service_s *const kServicePointer = &kService;
const ims_xdm_group_attributes_s kAttributes{"sip:team@example.org", &kAlice};
const ims_xdm_group_attributes_s *const kAttributesPointer = &kAttributes;
const ims_xdm_default_group_s kDefault{"my groups", "sip:team@example.org", true};
const ims_xdm_default_group_s *const kDefaultPointer = &kDefault;

template <auto Function, typename... Arguments>
int call(ims_h handle, const std::tuple<Arguments...> &arguments, ims_response_cb callback,
         void *user_data) {
    return std::apply(
        [&](auto... argument) { return Function(handle, argument..., callback, user_data); },
        arguments);
}

// The call with one argument replaced.
template <auto Function, std::size_t Index, auto Value, const auto &...Arguments>
Variation replaced(const char *what) {
    return {what, [](ims_h handle, ims_response_cb callback, void *user_data) {
                auto arguments = std::make_tuple(Arguments...);
                std::get<Index>(arguments) = Value;
                return call<Function>(handle, arguments, callback, user_data);
            }};
}

template <auto Function, const auto &...Arguments, std::size_t... Index>
void add_variations(RequestRow &row, bool texts_are_checked, std::index_sequence<Index...>) {
    const auto add = [&]<std::size_t At>(std::integral_constant<std::size_t, At>) {
        using Argument = std::tuple_element_t<At, std::tuple<std::decay_t<decltype(Arguments)>...>>;
        if constexpr (std::is_pointer_v<Argument>) {
            if (texts_are_checked || !std::is_same_v<Argument, const char *>)
                row.missing_pointers.push_back(
                    replaced<Function, At, nullptr, Arguments...>("an argument"));
        }
        if constexpr (std::is_same_v<Argument, const char *>)
            row.bad_texts.push_back(replaced<Function, At, kBadText, Arguments...>("an argument"));
    };
    (add(std::integral_constant<std::size_t, Index>{}), ...);
}

// f(handle, arguments..., callback, user_data) with a reply of the result alone
template <auto Function, const auto &...Arguments>
RequestRow xdm_row(const char *function, const char *method, const char *type,
                   const std::string &sent, bool texts_are_checked = true) {
    RequestRow row = named_row<Function>(kModule, function, method, type, sent.c_str());
    row.handler = "on_response_xdm_common_response";
    row.call = [](ims_h handle, ims_response_cb callback, void *user_data) {
        return call<Function>(handle, std::make_tuple(Arguments...), callback, user_data);
    };
    row.missing_pointers = {{"handle", [](ims_h, ims_response_cb callback, void *user_data) {
                                 return call<Function>(nullptr, std::make_tuple(Arguments...),
                                                       callback, user_data);
                             }}};
    add_variations<Function, Arguments...>(row, texts_are_checked,
                                           std::index_sequence_for<decltype(Arguments)...>{});
    return row;
}

RequestRow reading(RequestRow row, const char *subject, const std::string &answer,
                   void (*check_data)(void *)) {
    row.handler = "on_response_" + row.function.substr(sizeof "ims_" - 1);
    row.reply_type = "(ia{sv})";
    row.reply = "(0, " + answer + ")";
    row.check_data = check_data;
    row.refused_message = std::string{"Failed to fetch "} + subject + " Info: ";
    return row;
}

// What it says is looked at elsewhere.
void expect_some(void *data) {
    EXPECT_NE(data, nullptr);
}

void expect_the_group(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_STREQ(static_cast<ims_xdm_group_info_s *>(data)->group_uri, kUri);
}

template <typename Record>
void set_bad(Record &record, char *Record::*field) {
    record.*field = text(kNotUtf8);
}

std::vector<Variation> bad_documents() {
    return {{"group_uri",
             [](ims_h handle, ims_response_cb callback, void *user_data) {
                 ims_xdm_group_info_s group = kGroup;
                 set_inline(group.group_uri, kNotUtf8);
                 return ims_xdm_create_group(handle, &group, callback, user_data);
             }},
            {"channel_id",
             [](ims_h handle, ims_response_cb callback, void *user_data) {
                 ims_xdm_group_info_s group = kGroup;
                 set_bad(group, &ims_xdm_group_info_s::channel_id);
                 return ims_xdm_create_group(handle, &group, callback, user_data);
             }},
            {"a reference of the members",
             [](ims_h handle, ims_response_cb callback, void *user_data) {
                 ims_xdm_group_info_s group = kGroup;
                 ims_xdm_member_list_s members = kMembers;
                 char *references[] = {text("good"), text(kNotUtf8)};
                 members.entry_ref = references;
                 group.group_member_list = &members;
                 return ims_xdm_create_group(handle, &group, callback, user_data);
             }},
            {"a rank of an identity of a rule",
             [](ims_h handle, ims_response_cb callback, void *user_data) {
                 ims_xdm_group_info_s group = kGroup;
                 ims_xdm_group_rule_s rule = kRules;
                 ims_xdm_member_entry_s member = kAlice;
                 set_bad(member.status, &ims_xdm_member_status_s::rank);
                 ims_xdm_identity_entries_s entries{&member, 1};
                 void *cell = &entries;
                 rule.identity = &cell;
                 group.group_rule_set = &rule;
                 return ims_xdm_create_group(handle, &group, callback, user_data);
             }}};
}

RequestRow create_row() {
    RequestRow create = xdm_row<ims_xdm_create_group, kGroupPointer>(
        "ims_xdm_create_group", "XdmCreateGroup", "(a{sv})", "(" + kSentGroup + ",)");
    create.bad_texts = bad_documents();
    return create;
}

RequestRow attributes_row() {
    // Here "type" is the type of the member, as a number.
    RequestRow attributes = xdm_row<ims_xdm_modify_group_attributes, kAttributesPointer>(
        "ims_xdm_modify_group_attributes", "XdmModifyGroupAttributes", "(sssbbiba{sv})",
        "('sip:team@example.org', 'sip:alice@example.org', 'Alice', true, true, 5, false, "
        "{'assign': <'site'>, 'position': <'lead'>, 'rank': <'first'>})");
    attributes.bad_texts = {
        {"group_uri",
         [](ims_h handle, ims_response_cb callback, void *user_data) {
             const ims_xdm_group_attributes_s record{kNotUtf8, &kAlice};
             return ims_xdm_modify_group_attributes(handle, &record, callback, user_data);
         }},
        {"position", [](ims_h handle, ims_response_cb callback, void *user_data) {
             ims_xdm_member_entry_s member = kAlice;
             set_bad(member.status, &ims_xdm_member_status_s::position);
             const ims_xdm_group_attributes_s record{"sip:team@example.org", &member};
             return ims_xdm_modify_group_attributes(handle, &record, callback, user_data);
         }}};
    return attributes;
}

std::string with_group(const std::string &value) {
    return "('sip:team@example.org', " + value + ")";
}

std::vector<RequestRow> flag_and_number_rows() {
    return {
        xdm_row<ims_xdm_modify_group_searchable, kUri, kOff>("ims_xdm_modify_group_searchable",
                                                             "XdmModifyGroupSearchable", "(sb)",
                                                             with_group("false")),
        xdm_row<ims_xdm_modify_group_invite_members, kUri, kOn>(
            "ims_xdm_modify_group_invite_members", "XdmModifyGroupInviteMembers", "(sb)",
            with_group("true")),
        xdm_row<ims_xdm_modify_group_max_participants, kUri, kNumber>(
            "ims_xdm_modify_group_max_participants", "XdmModifyGroupMaxParticipants", "(si)",
            with_group("-12")),
        xdm_row<ims_xdm_modify_group_auto_advertisements, kUri, kOn>(
            "ims_xdm_modify_group_auto_advertisements", "XdmModifyGroupAutoAdvertisements", "(sb)",
            with_group("true")),
        xdm_row<ims_xdm_modify_group_qoe, kUri, kNumber>(
            "ims_xdm_modify_group_qoe", "XdmModifyGroupQoe", "(si)", with_group("-12")),
    };
}

std::vector<RequestRow> text_rows() {
    return {
        xdm_row<ims_xdm_delete_group, kUri>("ims_xdm_delete_group", "XdmDeleteGroup", "(s)",
                                            "('sip:team@example.org',)"),
        xdm_row<ims_xdm_delete_group_rule, kUri, kText>(
            "ims_xdm_delete_group_rule", "XdmDeleteGroupRule", "(ss)", with_group("'a text'")),
        xdm_row<ims_xdm_modify_group_display_name, kUri, kText>("ims_xdm_modify_group_display_name",
                                                                "XdmModifyGroupDisplayName", "(ss)",
                                                                with_group("'a text'")),
        xdm_row<ims_xdm_modify_group_subject, kUri, kText>("ims_xdm_modify_group_subject",
                                                           "XdmModifyGroupSubject", "(ss)",
                                                           with_group("'a text'")),
    };
}

std::vector<RequestRow> record_rows() {
    return {
        create_row(),
        xdm_row<ims_xdm_add_user_to_shared_group, kUri, kMembersPointer>(
            "ims_xdm_add_user_to_shared_group", "XdmAddUserToSharedGroup", "(sa{sv})",
            with_group(kSentMembers)),
        xdm_row<ims_xdm_remove_user_from_shared_group, kUri, kMembersPointer>(
            "ims_xdm_remove_user_from_shared_group", "XdmRemoveUserFromSharedGroup", "(sa{sv})",
            with_group(kSentMembers)),
        xdm_row<ims_xdm_add_group_rule, kUri, kRulesPointer>(
            "ims_xdm_add_group_rule", "XdmAddGroupRule", "(saa{sv})", with_group(kSentRules)),
        xdm_row<ims_xdm_modify_group_rule, kUri, kRulesPointer>(
            "ims_xdm_modify_group_rule", "XdmModifyGroupRule", "(saa{sv})", with_group(kSentRules)),
        xdm_row<ims_xdm_modify_group_session_active_policy, kUri, kPolicyPointer>(
            "ims_xdm_modify_group_session_active_policy", "XdmModifyGroupSessionActivePolicy",
            "(sa{sv})", with_group(kSentPolicy)),
        xdm_row<ims_xdm_modify_group_session_service_list, kUri, kServicePointer>(
            "ims_xdm_modify_group_session_service_list", "XdmModifyGroupSessionServiceList",
            "(sa{sv})",
            with_group("{'group_app': <int64 7>, 'group_media_list': <{'audio': <true>, "
                       "'video': <false>, 'message': <true>, 'file_transfer': <false>, "
                       "'group_advertisement': <true>, 'pager_mode': <false>, "
                       "'poc_speech': <true>}>}")),
        xdm_row<ims_xdm_modify_group_age_restriction, kUri, kAgesPointer>(
            "ims_xdm_modify_group_age_restriction", "XdmModifyGroupAgeRestriction", "(saa{sv})",
            with_group(kSentAges)),
        attributes_row(),
        xdm_row<ims_xdm_modify_default_group, kDefaultPointer>(
            "ims_xdm_modify_default_group", "XdmModifyDefaultGroup", "(ssb)",
            "('my groups', 'sip:team@example.org', true)"),
    };
}

std::vector<RequestRow> reading_rows() {
    return {
        reading(xdm_row<ims_xdm_fetch_shared_group, kGroupPointer>("ims_xdm_fetch_shared_group",
                                                                   "XdmFetchSharedGroup", "(ss)",
                                                                   with_group("'channel 9'")),
                "group", kAnsweredGroup, expect_the_group),
        reading(xdm_row<ims_xdm_fetch_all_shared_groups, kNoText>("ims_xdm_fetch_all_shared_groups",
                                                                  "XdmFetchAllSharedGroups", "(s)",
                                                                  "('',)", false),
                "group", "{'version': <'1'>}", expect_some),
        reading(xdm_row<ims_xdm_fetch_all_participant_groups, kNoText>(
                    "ims_xdm_fetch_all_participant_groups", "XdmFetchAllParticipantGroups", "(s)",
                    "('',)", false),
                "participant group", "{'version': <'1'>}", expect_some),
        reading(xdm_row<ims_xdm_fetch_shared_user_profile, kText>(
                    "ims_xdm_fetch_shared_user_profile", "XdmFetchSharedUserProfile", "(s)",
                    "('a text',)", false),
                "shared user profile", "{'gender': <'x'>}", expect_some),
        reading(xdm_row<ims_xdm_get_participant_info, kText>(
                    "ims_xdm_get_participant_info", "XdmGetParticipantInfo", "(s)", "('a text',)"),
                "conf participant", "{'qoe': <int64 1>}", expect_some),
    };
}

} // namespace

std::vector<RequestRow> xdm_request_rows() {
    std::vector<RequestRow> all;
    for (const auto &some : {record_rows(), text_rows(), flag_and_number_rows(), reading_rows()})
        all.insert(all.end(), some.begin(), some.end());
    return all;
}

} // namespace test
