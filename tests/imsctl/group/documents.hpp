// SPDX-License-Identifier: Apache-2.0
// A group document as imsctl takes it, as it sends it and as a service answers it.
#pragma once

#include <string>

namespace test {

inline constexpr const char *kGroupJson =
    R"({"group_uri":"sip:team@example.org","channel_id":"9","version":null,)"
    R"("group_properties":{"display_name":"Team","subject":"","is_searchable":true,)"
    R"("inv_members":false,"max_participants":12,"as_id":null,"area_id":null,)"
    R"("auto_grp_advertisements":false,"group_qoe":-3,)"
    R"("group_active_policy":{"min_participants":2,"max_duration":3600,"participants":null,)"
    R"("schedule":[{"start_time":"08:00","end_time":null}]},)"
    R"("supported_services":[{"service_enabler":3,"media_list":{"audio":true,"video":false,)"
    R"("message":false,"file_transfer":false,"group_advertisement":false,"pager_mode":false,)"
    R"("poc_speech":true}},{"service_enabler":4,"media_list":null}],)"
    R"("age_restrictions":[{"from_age":"6","to_age":"14"}]},)"
    R"("group_member_list":{"contact_lists":["friends",null],"contacts":[)"
    R"({"uri":"sip:alice@example.org","disp_name":"Alice","status":{"assign":null,)"
    R"("position":"lead","rank":null},"auto_join":true,"stt":false,"active":true,"type":5}],)"
    R"("ext_ref":[],"entry_ref":[]},)"
    R"("group_rule_set":[{"rule_id":"lists","rule_identity_type":2,)"
    R"("identity":{"urls":["http://example.org/1"]},"media_list":null,"is_list_member":true,)"
    R"("allow_conf_state":true,"allow_invite_users_dynamically":false,"join_handling":false,)"
    R"("allow_init_conf":false,"allow_sub_conf":false,"allow_private_message":false,)"
    R"("allow_media_handling":false,"allow_anonymity":false,"block_group_adver_send":false,)"
    R"("is_key_participant":false,"remove_media_handling":false,"allow_expelling":false,)"
    R"("allow_hndl_multiple_streams":false,"allow_ltd_participating_info":false}]})";

inline const std::string kActions =
    "{'allow_conf_state': <true>, 'allow_invite_users_dynamically': <false>, "
    "'join_handling': <false>, 'allow_init_conf': <false>, 'allow_sub_conf': <false>, "
    "'allow_private_message': <false>, 'allow_media_handling': <false>, "
    "'allow_anonymity': <false>, 'block_group_adver_send': <false>, "
    "'is_key_participant': <false>, 'remove_media_handling': <false>, "
    "'allow_expelling': <false>, 'allow_hndl_multiple_streams': <false>, "
    "'allow_ltd_participating_info': <false>}";

inline const std::string kProperties =
    "'display_name': <'Team'>, 'subject': <''>, 'is_searchable': <true>, "
    "'inv_members': <false>, 'max_participants': <int64 12>, "
    "'auto_grp_advertisements': <false>, 'group_qoe': <int64 -3>";

inline const std::string kServicesAndAges =
    "'supported_services': <[{'service_enabler': <int64 3>, 'media_list_v': "
    "<[{'audio': <true>, 'video': <false>, 'message': <false>, 'file_transfer': <false>, "
    "'group_advertisement': <false>, 'pager_mode': <false>, 'poc_speech': <true>}]>}, "
    "{'service_enabler': <int64 4>, 'media_list_v': <@aa{sv} []>}]>, "
    "'age_restrictions': <[{'from_age': <'6'>, 'to_age': <'14'>}]>";

inline const std::string kMemberFields =
    "'uri': <'sip:alice@example.org'>, 'disp_name': <'Alice'>, 'stt': <false>, 'active': <true>";

inline const std::string kGroupSent =
    "({'group_uri': <'sip:team@example.org'>, 'channel_id': <'9'>, 'group_properties': <{" +
    kProperties +
    ", 'group_active_policy': <{'min_participants': <int64 2>, 'max_duration': <int64 3600>, "
    "'participants': <@a{sv} {}>, 'schedule': <[{'start_time': <'08:00'>}]>}>, " +
    kServicesAndAges +
    "}>, 'group_member_list': <{'contact_lists': <{'contact_lists_v': "
    "<[{'contact_lists': <'friends'>}, {}]>, 'num_of_ct_lists': <int64 2>}>, "
    "'contacts': <{'contacts_v': <[{" +
    kMemberFields +
    ", 'type': <true>, 'auto_join': <true>, 'status_v': <{'position': <'lead'>}>}]>, "
    "'num_of_contacts': <int64 1>}>, 'ext_ref_url': <{'contact_ref_ct_list': <@aa{sv} []>, "
    "'num_of_ct_lists_ref': <int64 0>}>, 'entry_ref_url': <{'entry_ref_contacts_v': "
    "<@aa{sv} []>, 'num_of_ct_ref': <int64 0>}>}>, 'group_rule_set': <[{'rule_id': <'lists'>, "
    "'rule_condition': <{'rule_identity': <{'contacts_v': <[{'contacts': "
    "<'http://example.org/1'>}]>, 'num_of_contact_list_url': <int64 1>}>, "
    "'rule_identity_type': <int64 2>, 'rule_media_list': <@a{sv} {}>, "
    "'is_list_member': <true>}>, 'rule_action': <" +
    kActions + ">}]>},)";

// The dictionary alone.
inline const std::string kGroupAnswered =
    "{'group_uri': <'sip:team@example.org'>, 'channel_id': <'9'>, 'group_properties': <{" +
    kProperties +
    ", 'group_session_active_policy': <{'min_participants': <int64 2>, "
    "'max_duration': <int64 3600>, 'schedule': <[{'start_time': <'08:00'>}]>}>, " +
    kServicesAndAges +
    "}>, 'group_member_list': <{'contact_list': <{'contact_lists_v': "
    "<[{'contact_lists': <'friends'>}, {}]>, 'num_of_ct_lists': <int64 2>}>, "
    "'contacts': <{'contacts_v': <[{" +
    kMemberFields +
    ", 'type': <int64 5>, 'auto_join': <true>, 'status_v': <{'position': <'lead'>}>}]>, "
    "'num_of_contacts': <int64 1>}>}>, 'group_rule_set': <[{'rule_id': <'lists'>, "
    "'rule_condition_v': <{'rule_identity': <{'ref_ct_list_url': <[{'ref_ct_list_url': "
    "<'http://example.org/1'>}]>, 'num_of_contact_list_url': <int64 1>}>, "
    "'rule_identity_type_v': <int64 2>, 'is_list_member': <true>}>, 'rule_action_v': <" +
    kActions + ">}]>}";

} // namespace test
