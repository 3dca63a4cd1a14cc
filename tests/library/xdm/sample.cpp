// SPDX-License-Identifier: Apache-2.0
#include "tests/library/xdm/sample.hpp"

namespace test {
namespace {

ims_xdm_member_entry_s alice() {
    ims_xdm_member_entry_s entry{};
    set_inline(entry.uri, "sip:alice@example.org");
    entry.disp_name = text("Alice");
    entry.status = {text("site"), text("lead"), text("first")};
    entry.stt = true;
    entry.active = true;
    entry.type = 5;
    return entry;
}

ims_xdm_member_entry_s bob() {
    ims_xdm_member_entry_s entry{};
    set_inline(entry.uri, "sip:bob@example.org");
    entry.auto_join = true;
    entry.type = 1;
    return entry;
}

ims_xdm_member_entry_s g_contacts[] = {alice(), bob()};
char *g_contact_lists[] = {text("friends"), nullptr};
char *g_ext_ref[] = {text("http://example.org/lists/1")};
char *g_entry_ref[] = {text("entry 1"), text("entry 2")};

ims_xdm_media_list_s g_media{true, false, true, false, true, true, false};
ims_xdm_supported_service_s g_plain_service{-4, nullptr, nullptr};
ims_xdm_supported_service_s g_service{3, &g_media, &g_plain_service};

ims_xdm_schedule_s g_open_end{text("18:00"), nullptr, nullptr};
ims_xdm_schedule_s g_schedule{text("08:00"), text("12:00"), &g_open_end};

ims_xdm_member_list_s g_no_members{};
ims_xdm_age_restriction_s g_from_65{text("65"), nullptr, nullptr};

ims_xdm_identity_entries_s g_entries{g_contacts, 1};
char *g_url_texts[] = {text("http://example.org/lists/2")};
ims_xdm_identity_urls_s g_urls{g_url_texts, 1};
char *g_domain_texts[] = {text("example.org"), text("example.com")};
ims_xdm_domain_list_s g_allowed_domains{g_domain_texts, 2};
ims_xdm_contact_list_s g_excepted_contacts{&g_contacts[1], 1};
ims_xdm_identity_domains_s g_domains{&g_allowed_domains, nullptr, nullptr, &g_excepted_contacts};
void *g_identities[] = {&g_entries, &g_urls, &g_domains};

ims_xdm_group_rule_s rule(const char *id, int type, void **identity, ims_xdm_group_rule_s *next) {
    ims_xdm_group_rule_s rule{};
    set_inline(rule.rule_id, id);
    rule.rule_identity_type = type;
    rule.identity = identity;
    rule.next = next;
    return rule;
}

// No identity goes with type 3, even where there is a record.
ims_xdm_group_rule_s g_nobody = rule("nobody", 3, &g_identities[0], nullptr);
ims_xdm_group_rule_s g_by_domain =
    rule("by domain", IMS_XDM_IDENTITY_DOMAINS, &g_identities[2], &g_nobody);
ims_xdm_group_rule_s g_by_list =
    rule("by list", IMS_XDM_IDENTITY_URLS, &g_identities[1], &g_by_domain);

ims_xdm_group_rule_s first_rule() {
    ims_xdm_group_rule_s first =
        rule("by name", IMS_XDM_IDENTITY_ENTRIES, &g_identities[0], &g_by_list);
    first.media_list = &g_media;
    first.is_list_member = true;
    first.allow_conf_state = true;
    first.join_handling = true;
    first.allow_sub_conf = true;
    first.allow_media_handling = true;
    first.block_group_adver_send = true;
    first.remove_media_handling = true;
    first.allow_hndl_multiple_streams = true;
    return first;
}

ims_xdm_member_list_s members() {
    return {g_contact_lists, 2, g_contacts, 2, g_ext_ref, 1, g_entry_ref, 2};
}
ims_xdm_session_policy_s policy() {
    return {2, 3600, &g_no_members, &g_schedule};
}
ims_xdm_age_restriction_s ages() {
    return {text("6"), text("14"), &g_from_65};
}

ims_xdm_member_list_s g_members = members();
ims_xdm_session_policy_s g_policy = policy();
ims_xdm_age_restriction_s g_ages = ages();
ims_xdm_group_rule_s g_rules = first_rule();

ims_xdm_group_properties_s properties() {
    ims_xdm_group_properties_s properties{};
    set_inline(properties.display_name, "Team é");
    set_inline(properties.subject, "What we do");
    properties.is_searchable = true;
    properties.max_participants = 12;
    properties.as_id = text("as-1");
    properties.area_id = text("area-1");
    properties.auto_grp_advertisements = true;
    properties.group_qoe = -3;
    properties.group_active_policy = &g_policy;
    properties.supported_services = &g_service;
    properties.age_restrictions = &g_ages;
    return properties;
}
ims_xdm_group_properties_s g_properties = properties();

ims_xdm_group_info_s group() {
    ims_xdm_group_info_s group{};
    set_inline(group.group_uri, "sip:team@example.org");
    group.channel_id = text("channel 9");
    group.version = text("7");
    group.group_properties = &g_properties;
    group.group_member_list = &g_members;
    group.group_rule_set = &g_rules;
    return group;
}

// The parts that both directions share, with what "type" stands for in each.
std::string alice_as(const char *type) {
    return std::string{"{'uri': <'sip:alice@example.org'>, 'disp_name': <'Alice'>, "
                       "'stt': <true>, 'active': <true>, 'type': <"} +
           type +
           ">, 'auto_join': <false>, 'status_v': <{'assign': <'site'>, 'position': <'lead'>, "
           "'rank': <'first'>}>}";
}
std::string bob_as(const char *type) {
    return std::string{"{'uri': <'sip:bob@example.org'>, 'stt': <false>, 'active': <false>, "
                       "'type': <"} +
           type + ">, 'auto_join': <true>, 'status_v': <@a{sv} {}>}";
}

const std::string kAliceSent = alice_as("true");
const std::string kAliceAnswered = alice_as("int64 5");
const std::string kBobSent = bob_as("false");
const std::string kBobAnswered = bob_as("int64 1");

// Every second flag, or none.
std::string action(const std::string &flag) {
    const char *const keys[] = {"allow_conf_state",
                                "allow_invite_users_dynamically",
                                "join_handling",
                                "allow_init_conf",
                                "allow_sub_conf",
                                "allow_private_message",
                                "allow_media_handling",
                                "allow_anonymity",
                                "block_group_adver_send",
                                "is_key_participant",
                                "remove_media_handling",
                                "allow_expelling",
                                "allow_hndl_multiple_streams",
                                "allow_ltd_participating_info"};
    std::string entries;
    bool is_even = true;
    for (const char *key : keys) {
        entries += (entries.empty() ? "'" : ", '") + std::string{key} + "': <" +
                   (is_even ? flag : "false") + ">";
        is_even = !is_even;
    }
    return "<{" + entries + "}>";
}

// "rule_condition" and "rule_action", with and without the suffix "_v" of what the service answers.
std::string rule_as(const char *suffix, const char *id, const std::string &identity, int type,
                    const char *media, const char *flags) {
    return std::string{"{'rule_id': <'"} + id + "'>, 'rule_condition" + suffix +
           "': <{'rule_identity': <" + identity + ">, 'rule_identity_type" + suffix + "': <int64 " +
           std::to_string(type) + ">, 'rule_media_list': <" + media + ">, 'is_list_member': <" +
           flags + ">}>, 'rule_action" + suffix + "': " + action(flags) + "}";
}

constexpr const char *kAllMedia =
    "{'audio': <true>, 'video': <false>, 'message': <true>, 'file_transfer': <false>, "
    "'group_advertisement': <true>, 'pager_mode': <true>, 'poc_speech': <false>}";
constexpr const char *kFirstMedia =
    "{'audio': <true>, 'video': <false>, 'message': <true>, 'file_transfer': <false>}";

std::string services() {
    return std::string{"<[{'service_enabler': <int64 3>, 'media_list_v': <["} + kAllMedia +
           "]>}, {'service_enabler': <int64 -4>, 'media_list_v': <@aa{sv} []>}]>";
}

std::string properties_as(const char *policy_key, const std::string &policy) {
    return std::string{"<{'display_name': <'Team é'>, 'subject': <'What we do'>, "
                       "'is_searchable': <true>, 'inv_members': <false>, "
                       "'max_participants': <int64 12>, 'as_id': <'as-1'>, "
                       "'area_id': <'area-1'>, 'auto_grp_advertisements': <true>, "
                       "'group_qoe': <int64 -3>, '"} +
           policy_key + "': <" + policy + ">, 'supported_services': " + services() +
           ", 'age_restrictions': <" + kSentAges + ">}>";
}

std::string group_as(const std::string &properties, const std::string &members,
                     const std::string &rules) {
    return "{'group_uri': <'sip:team@example.org'>, 'channel_id': <'channel 9'>, "
           "'version': <'7'>, 'group_properties': " +
           properties + ", 'group_member_list': <" + members + ">, 'group_rule_set': <" + rules +
           ">}";
}

std::string policy_as(const std::string &participants) {
    return "{'min_participants': <int64 2>, 'max_duration': <int64 3600>, 'participants': <" +
           participants +
           ">, 'schedule': <[{'start_time': <'08:00'>, 'end_time': <'12:00'>}, "
           "{'start_time': <'18:00'>}]>}";
}

const std::string kNoMembersSent =
    "{'contact_lists': <{'contact_lists_v': <@aa{sv} []>, 'num_of_ct_lists': <int64 0>}>, "
    "'contacts': <{'contacts_v': <@aa{sv} []>, 'num_of_contacts': <int64 0>}>, "
    "'ext_ref_url': <{'contact_ref_ct_list': <@aa{sv} []>, 'num_of_ct_lists_ref': <int64 0>}>, "
    "'entry_ref_url': <{'entry_ref_contacts_v': <@aa{sv} []>, 'num_of_ct_ref': <int64 0>}>}";

} // namespace

const ims_xdm_member_entry_s kAlice = alice();
const ims_xdm_member_list_s kMembers = members();
const ims_xdm_session_policy_s kPolicy = policy();
const ims_xdm_age_restriction_s kAges = ages();
const ims_xdm_group_rule_s kRules = first_rule();
const ims_xdm_group_info_s kGroup = group();

const std::string kSentMembers =
    "{'contact_lists': <{'contact_lists_v': <[{'contact_lists': <'friends'>}, {}]>, "
    "'num_of_ct_lists': <int64 2>}>, "
    "'contacts': <{'contacts_v': <[" +
    kAliceSent + ", " + kBobSent +
    "]>, 'num_of_contacts': <int64 2>}>, "
    "'ext_ref_url': <{'contact_ref_ct_list': "
    "<[{'contact_ref_ct_list': <'http://example.org/lists/1'>}]>, "
    "'num_of_ct_lists_ref': <int64 1>}>, "
    "'entry_ref_url': <{'entry_ref_contacts_v': <[{'contact_ref_contact': <'entry 1'>}, "
    "{'contact_ref_contact': <'entry 2'>}]>, 'num_of_ct_ref': <int64 2>}>}";
const std::string kSentPolicy = policy_as(kNoMembersSent);
const std::string kSentAges = "[{'from_age': <'6'>, 'to_age': <'14'>}, {'from_age': <'65'>}]";
const std::string kSentRules =
    "[" +
    rule_as("", "by name", "{'contacts': <[" + kAliceSent + "]>, 'num_of_contacts': <int64 1>}", 1,
            kFirstMedia, "true") +
    ", " +
    rule_as("", "by list",
            "{'contacts_v': <[{'contacts': <'http://example.org/lists/2'>}]>, "
            "'num_of_contact_list_url': <int64 1>}",
            2, "@a{sv} {}", "false") +
    ", " +
    rule_as("", "by domain",
            "{'allow_domain_id': <{'num_of_domain_id': <int64 2>, 'contacts_v': "
            "<[{'contacts': <'example.org'>}, {'contacts': <'example.com'>}]>}>, "
            "'allow_contact_id': <@a{sv} {}>, 'except_domain_id': <@a{sv} {}>, "
            "'except_contact_id': <{'num_of_contact_id': <int64 1>, 'contacts': <[" +
                kBobSent + "]>}>}",
            4, "@a{sv} {}", "false") +
    ", " + rule_as("", "nobody", "@a{sv} {}", 3, "@a{sv} {}", "false") + "]";
const std::string kSentGroup =
    group_as(properties_as("group_active_policy", kSentPolicy), kSentMembers, kSentRules);

const std::string kAnsweredMembers =
    "{'contact_list': <{'contact_lists_v': <[{'contact_lists': <'friends'>}, {}]>, "
    "'num_of_ct_lists': <int64 2>}>, "
    "'contacts': <{'contacts_v': <[" +
    kAliceAnswered + ", " + kBobAnswered +
    "]>, 'num_of_contacts': <int64 2>}>, "
    "'ext_ref_ct_lists': <{'contact_ref_ct_list_v': "
    "<[{'contact_ref_ct_list': <'http://example.org/lists/1'>}]>, "
    "'num_of_ct_lists': <int64 1>}>, "
    "'entry_ref_contacts': <{'contact_ref_contact_v': <[{'contact_ref_contact': <'entry 1'>}, "
    "{'contact_ref_contact': <'entry 2'>}]>, 'num_of_ct_ref': <int64 2>}>}";
const std::string kAnsweredRules =
    "[" +
    rule_as("_v", "by name",
            "{'contacts': <[" + kAliceAnswered + "]>, 'num_of_contacts': <int64 1>}", 1, kAllMedia,
            "true") +
    ", " +
    rule_as("_v", "by list",
            "{'ref_ct_list_url': <[{'ref_ct_list_url': <'http://example.org/lists/2'>}]>, "
            "'num_of_contact_list_url': <int64 1>}",
            2, "@a{sv} {}", "false") +
    ", " +
    rule_as("_v", "by domain",
            "{'allow_domain_id': <{'num_of_domain_id': <int64 2>, 'domain_id_v': "
            "<[{'domain_id': <'example.org'>}, {'contacts': <'example.com'>}]>}>, "
            "'except_contact_id': <{'num_of_contact_id': <int64 1>, 'contacts_v': <[" +
                kBobAnswered + "]>}>}",
            4, "@a{sv} {}", "false") +
    ", " + rule_as("_v", "nobody", "@a{sv} {}", 3, "@a{sv} {}", "false") + "]";
const std::string kAnsweredGroup =
    group_as(properties_as("group_session_active_policy", policy_as(kAnsweredMembers)),
             kAnsweredMembers, kAnsweredRules);

} // namespace test
