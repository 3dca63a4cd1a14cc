// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <variant>
#include <vector>

// The documents of push-to-talk groups. Neither a text nor a part that is not set travels to
// clients; they send an empty dictionary for such a part.
namespace sim {

using OptionalText = std::optional<std::string>;

struct GroupMedia {
    bool audio = false;
    bool video = false;
    bool message = false;
    bool file_transfer = false;
    bool group_advertisement = false;
    bool pager_mode = false;
    bool poc_speech = false;
    bool operator==(const GroupMedia &) const = default;
};

// The media of a rule. Only the first four are ever written.
struct RuleMedia {
    GroupMedia flags{};
    bool operator==(const RuleMedia &) const = default;
};

// What a member, or a user in a company, is.
struct MemberStatus {
    OptionalText assign{};
    OptionalText position{};
    OptionalText rank{};
    bool operator==(const MemberStatus &) const = default;
};

struct GroupMember {
    std::string uri{};
    OptionalText disp_name{};
    bool stt = false;
    bool active = false;
    std::int32_t type = 0;
    bool auto_join = false;
    MemberStatus status{};
    bool operator==(const GroupMember &) const = default;
};

struct GroupMembers {
    std::vector<std::string> contact_lists{};
    std::vector<GroupMember> contacts{};
    std::vector<std::string> external_lists{};
    std::vector<std::string> entry_references{};
    bool operator==(const GroupMembers &) const = default;
};

struct GroupSchedule {
    OptionalText start_time{};
    OptionalText end_time{};
    bool operator==(const GroupSchedule &) const = default;
};

struct SessionPolicy {
    std::int32_t min_participants = 0;
    std::int32_t max_duration = 0;
    std::optional<GroupMembers> participants{};
    std::vector<GroupSchedule> schedule{};
    bool operator==(const SessionPolicy &) const = default;
};

struct SupportedService {
    std::int32_t service_enabler = 0;
    std::optional<GroupMedia> media{};
    bool operator==(const SupportedService &) const = default;
};

// A supported service as it is set alone.
struct SessionService {
    std::int32_t application = 0;
    std::optional<GroupMedia> media{};
};

struct AgeRestriction {
    OptionalText from_age{};
    OptionalText to_age{};
    bool operator==(const AgeRestriction &) const = default;
};

struct GroupProperties {
    std::string display_name{};
    std::string subject{};
    bool is_searchable = false;
    bool inv_members = false;
    std::int32_t max_participants = 0;
    OptionalText as_id{};
    OptionalText area_id{};
    bool auto_grp_advertisements = false;
    std::int32_t group_qoe = 0;
    std::optional<SessionPolicy> active_policy{};
    std::vector<SupportedService> supported_services{};
    std::vector<AgeRestriction> age_restrictions{};
    bool operator==(const GroupProperties &) const = default;
};

struct RuleContacts {
    std::vector<GroupMember> contacts{};
    bool operator==(const RuleContacts &) const = default;
};

struct RuleContactLists {
    std::vector<std::string> urls{};
    bool operator==(const RuleContactLists &) const = default;
};

struct DomainNames {
    std::vector<std::string> names{};
    bool operator==(const DomainNames &) const = default;
};

struct DomainContacts {
    std::vector<GroupMember> members{};
    bool operator==(const DomainContacts &) const = default;
};

struct RuleDomains {
    std::optional<DomainNames> allowed_domains{};
    std::optional<DomainContacts> allowed_contacts{};
    std::optional<DomainNames> except_domains{};
    std::optional<DomainContacts> except_contacts{};
    bool operator==(const RuleDomains &) const = default;
};

// Whom a rule is about. Its types are 1, 2 and 4; any other holds nothing.
using RuleIdentity = std::variant<std::monostate, RuleContacts, RuleContactLists, RuleDomains>;

struct GroupRule {
    static constexpr std::size_t kActions = 14;

    std::string id{};
    RuleIdentity identity{};
    std::int32_t identity_type = 0;
    std::optional<RuleMedia> media{};
    bool is_list_member = false;
    std::array<bool, kActions> actions{};
    bool operator==(const GroupRule &) const = default;
};

struct GroupDocument {
    std::string uri{};
    OptionalText channel_id{};
    OptionalText version{};
    std::optional<GroupProperties> properties{};
    std::optional<GroupMembers> members{};
    std::vector<GroupRule> rules{};
    bool operator==(const GroupDocument &) const = default;
};

} // namespace sim
