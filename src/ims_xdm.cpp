// SPDX-License-Identifier: Apache-2.0
// Group documents: the requests, and the records of the five that read.
#include "ims_xdm.h"

#include "frame.hpp"
#include "xdm_records.hpp"
#include "xdm_replies.hpp"

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Xdm";

// A text in a buffer that the application may not have ended.
template <std::size_t Size>
class Bounded {
  public:
    explicit Bounded(const char (&text)[Size]) noexcept { copy_bounded(copy_, Size, text); }
    const char *get() const noexcept { return copy_; }

  private:
    char copy_[Size];
};

// Missing parts are worth a line each and stop nothing.
void report_missing_parts(const ims_xdm_group_info_s &group) noexcept {
    if (group.group_properties == nullptr)
        log_error(named("__create_group_properties_variant"), "group_properties is NULL");
    else if (group.group_properties->supported_services == nullptr)
        log_error(named("__create_supported_services_variant"), "supported_services is NULL");
    if (group.group_member_list == nullptr)
        log_error(named("__create_group_member_info_variant"), "participants is NULL");
}

void free_group_info(ims_xdm_group_info_s *group) noexcept {
    const Site site = named("__free_group_info");
    if (group == nullptr) {
        log_error(site, "No Group Info Present");
        return;
    }
    if (group->group_properties == nullptr)
        log_error(site, "No Group Properties Info Present");
    if (group->group_member_list == nullptr)
        log_error(site, "No Group Members List Info Present");
    if (group->group_rule_set == nullptr)
        log_error(site, "No Group Rule Info Present");
    release_new(kGroupInfo, group);
}

// A reply of a result and a record; a result other than 0 brings no record, but a line about its
// subject.
template <Literal Subject, auto Deliver>
constexpr auto kFetched = [](const Completion &done, std::int32_t result, const Variant &record) {
    if (result != 0) {
        log_error(done.site(), "Failed to fetch %s Info: %d", Subject.text, result);
        return done(result);
    }
    Deliver(done, record.get());
};

// A record that is released as it was read.
template <const auto &Table>
constexpr auto kRecord = [](const Completion &done, GVariant *dictionary) {
    Received<Table> received{dictionary};
    done(0, &received.record);
};

} // namespace

int ims_xdm_create_group(ims_h handle, const ims_xdm_group_info_s *group, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle, group}))
        return refused;
    report_missing_parts(*group);
    return request(handle, kInterface, "XdmCreateGroup",
                   pack<"(@a{sv})">(write_record(kGroupInfo, group)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_delete_group(ims_h handle, const char *group_uri, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle, group_uri}))
        return refused;
    return request(handle, kInterface, "XdmDeleteGroup", pack<"(s)">(group_uri),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

constexpr auto kGroup = [](const Completion &done, GVariant *dictionary) {
    ims_xdm_group_info_s *group = read_new(dictionary, kGroupInfo);
    done(0, group);
    free_group_info(group);
};

int ims_xdm_fetch_shared_group(ims_h handle, const ims_xdm_group_info_s *group,
                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group}))
        return refused;
    return request(
        handle, kInterface, "XdmFetchSharedGroup",
        pack<"(ss)">(Bounded{group->group_uri}.get(), group->channel_id),
        {answer<"on_response_xdm_fetch_shared_group", "(i@a{sv})", kFetched<"group", kGroup>>,
         callback, user_data});
}

constexpr auto kGroups = [](const Completion &done, GVariant *dictionary) {
    Received<kSharedGroups> received{dictionary};
    ims_xdm_shared_group_list_s &list = received.record;
    done(0, &list);
    for (std::int32_t at = 0; list.groups != nullptr && at < list.count; ++at)
        free_group_info(std::exchange(list.groups[at], nullptr));
};

int ims_xdm_fetch_all_shared_groups(ims_h handle, const char *text, ims_response_cb callback,
                                    void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(
        handle, kInterface, "XdmFetchAllSharedGroups", pack<"(s)">(text),
        {answer<"on_response_xdm_fetch_all_shared_groups", "(i@a{sv})", kFetched<"group", kGroups>>,
         callback, user_data});
}

int ims_xdm_fetch_all_participant_groups(ims_h handle, const char *text, ims_response_cb callback,
                                         void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "XdmFetchAllParticipantGroups", pack<"(s)">(text),
                   {answer<"on_response_xdm_fetch_all_participant_groups", "(i@a{sv})",
                           kFetched<"participant group", kRecord<kParticipantGroups>>>,
                    callback, user_data});
}

int ims_xdm_fetch_shared_user_profile(ims_h handle, const char *text, ims_response_cb callback,
                                      void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "XdmFetchSharedUserProfile", pack<"(s)">(text),
                   {answer<"on_response_xdm_fetch_shared_user_profile", "(i@a{sv})",
                           kFetched<"shared user profile", kRecord<kUserProfile>>>,
                    callback, user_data});
}

int ims_xdm_add_user_to_shared_group(ims_h handle, const char *group_uri,
                                     const ims_xdm_member_list_s *members, ims_response_cb callback,
                                     void *user_data) {
    if (const int refused = admit({handle, group_uri, members}))
        return refused;
    return request(handle, kInterface, "XdmAddUserToSharedGroup",
                   pack<"(s@a{sv})">(group_uri, write_record(kMemberList, members)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_remove_user_from_shared_group(ims_h handle, const char *group_uri,
                                          const ims_xdm_member_list_s *members,
                                          ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, members}))
        return refused;
    return request(handle, kInterface, "XdmRemoveUserFromSharedGroup",
                   pack<"(s@a{sv})">(group_uri, write_record(kMemberList, members)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_add_group_rule(ims_h handle, const char *group_uri, const ims_xdm_group_rule_s *rules,
                           ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, rules}))
        return refused;
    return request(handle, kInterface, "XdmAddGroupRule",
                   pack<"(s@aa{sv})">(group_uri, write_chain(kGroupRule, rules)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_rule(ims_h handle, const char *group_uri,
                              const ims_xdm_group_rule_s *rules, ims_response_cb callback,
                              void *user_data) {
    if (const int refused = admit({handle, group_uri, rules}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupRule",
                   pack<"(s@aa{sv})">(group_uri, write_chain(kGroupRule, rules)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_delete_group_rule(ims_h handle, const char *group_uri, const char *rule_id,
                              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, rule_id}))
        return refused;
    return request(handle, kInterface, "XdmDeleteGroupRule", pack<"(ss)">(group_uri, rule_id),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_display_name(ims_h handle, const char *group_uri, const char *display_name,
                                      ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, display_name}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupDisplayName",
                   pack<"(ss)">(group_uri, display_name),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_subject(ims_h handle, const char *group_uri, const char *subject,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, subject}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupSubject", pack<"(ss)">(group_uri, subject),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_searchable(ims_h handle, const char *group_uri, bool searchable,
                                    ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupSearchable",
                   pack<"(sb)">(group_uri, searchable),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_invite_members(ims_h handle, const char *group_uri, bool invite_members,
                                        ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupInviteMembers",
                   pack<"(sb)">(group_uri, invite_members),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_max_participants(ims_h handle, const char *group_uri,
                                          int32_t max_participants, ims_response_cb callback,
                                          void *user_data) {
    if (const int refused = admit({handle, group_uri}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupMaxParticipants",
                   pack<"(si)">(group_uri, max_participants),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_auto_advertisements(ims_h handle, const char *group_uri,
                                             bool auto_advertisements, ims_response_cb callback,
                                             void *user_data) {
    if (const int refused = admit({handle, group_uri}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupAutoAdvertisements",
                   pack<"(sb)">(group_uri, auto_advertisements),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_qoe(ims_h handle, const char *group_uri, int32_t qoe,
                             ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupQoe", pack<"(si)">(group_uri, qoe),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_session_active_policy(ims_h handle, const char *group_uri,
                                               const ims_xdm_session_policy_s *policy,
                                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, policy}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupSessionActivePolicy",
                   pack<"(s@a{sv})">(group_uri, write_record(kSessionPolicy, policy)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_session_service_list(ims_h handle, const char *group_uri,
                                              const ims_xdm_session_service_s *service,
                                              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, service}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupSessionServiceList",
                   pack<"(s@a{sv})">(group_uri, write_record(kSessionService, service)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_group_age_restriction(ims_h handle, const char *group_uri,
                                         const ims_xdm_age_restriction_s *restrictions,
                                         ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, group_uri, restrictions}))
        return refused;
    return request(handle, kInterface, "XdmModifyGroupAgeRestriction",
                   pack<"(s@aa{sv})">(group_uri, write_chain(kAgeRestriction, restrictions)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

// Here the type of the member is sent, not its active flag again.
int ims_xdm_modify_group_attributes(ims_h handle, const ims_xdm_group_attributes_s *attributes,
                                    ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, attributes}))
        return refused;
    const ims_xdm_member_entry_s *member = attributes->member;
    if (member == nullptr)
        return IMS_ERROR_INVALID_PARAMETER;
    return request(handle, kInterface, "XdmModifyGroupAttributes",
                   pack<"(sssbbib@a{sv})">(attributes->group_uri, Bounded{member->uri}.get(),
                                           member->disp_name, member->stt, member->active,
                                           member->type, member->auto_join,
                                           write_record(kMemberStatus, &member->status)),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_modify_default_group(ims_h handle, const ims_xdm_default_group_s *default_group,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, default_group}))
        return refused;
    return request(handle, kInterface, "XdmModifyDefaultGroup",
                   pack<"(ssb)">(default_group->group_list_name, default_group->group_uri,
                                 default_group->is_default_group),
                   {answer<"on_response_xdm_common_response">, callback, user_data});
}

int ims_xdm_get_participant_info(ims_h handle, const char *text, ims_response_cb callback,
                                 void *user_data) {
    if (const int refused = admit({handle, text}))
        return refused;
    return request(handle, kInterface, "XdmGetParticipantInfo", pack<"(s)">(text),
                   {answer<"on_response_xdm_get_participant_info", "(i@a{sv})",
                           kFetched<"conf participant", kRecord<kParticipantInfo>>>,
                    callback, user_data});
}
