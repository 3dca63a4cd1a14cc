// SPDX-License-Identifier: Apache-2.0
#include "sim/group/edits.hpp"

#include <algorithm>
#include <functional>
#include <unordered_map>
#include <unordered_set>

namespace sim {

namespace {

using Problem = std::optional<std::string>;

template <typename T, typename Name>
Status add_all(std::vector<T> &entries, const std::vector<T> &added, Name name,
               std::string_view what) {
    std::unordered_set<std::string> names;
    for (const auto &entry : entries)
        names.insert(std::invoke(name, entry));
    for (const auto &entry : added)
        if (!names.insert(std::invoke(name, entry)).second)
            return refuse(Result::kDuplicate, "the group has the {} \"{}\" already", what,
                          std::invoke(name, entry));
    entries.insert(entries.end(), added.begin(), added.end());
    return Done{};
}

template <typename T, typename Name>
Status remove_all(std::vector<T> &entries, const std::vector<T> &removed, Name name,
                  std::string_view what) {
    std::unordered_set<std::string> names;
    for (const auto &entry : removed)
        names.insert(std::invoke(name, entry));
    for (const auto &entry : entries)
        names.erase(std::invoke(name, entry));
    if (!names.empty())
        return refuse(Result::kUnknownRecord, "the group has no {} \"{}\"", what, *names.begin());
    for (const auto &entry : removed)
        names.insert(std::invoke(name, entry));
    std::erase_if(entries,
                  [&](const auto &entry) { return names.contains(std::invoke(name, entry)); });
    return Done{};
}

// Does the same to each of the four lists of members. The first refusal counts.
template <typename Members, typename Action>
Status for_each_list(Members &members, const GroupMembers &other, Action act) {
    if (other == GroupMembers())
        return refuse(Result::kInvalidArgument, "nobody is named");
    constexpr auto kText = std::identity();
    for (const auto &status :
         {act(members.contact_lists, other.contact_lists, kText, "contact list"),
          act(members.contacts, other.contacts, &GroupMember::uri, "member"),
          act(members.external_lists, other.external_lists, kText, "external contact list"),
          act(members.entry_references, other.entry_references, kText, "entry reference")})
        if (!status)
            return status;
    return Done{};
}

template <typename T, typename Name>
Problem find_repeated(const std::vector<T> &entries, Name name, std::string_view what) {
    std::unordered_set<std::string_view> names;
    for (const auto &entry : entries) {
        const std::string &text = std::invoke(name, entry);
        if (text.empty())
            return fmt::format("a {} has no name", what);
        if (!names.insert(text).second)
            return fmt::format("the {} \"{}\" comes twice", what, text);
    }
    return std::nullopt;
}

Problem find_contradiction(const GroupMembers &members) {
    constexpr auto kText = std::identity();
    for (const auto &problem :
         {find_repeated(members.contact_lists, kText, "contact list"),
          find_repeated(members.contacts, &GroupMember::uri, "member"),
          find_repeated(members.external_lists, kText, "external contact list"),
          find_repeated(members.entry_references, kText, "entry reference")})
        if (problem)
            return problem;
    return std::nullopt;
}

Problem find_contradiction(std::monostate) {
    return std::nullopt;
}

Problem find_contradiction(const RuleContacts &identity) {
    return find_repeated(identity.contacts, &GroupMember::uri, "member");
}

Problem find_contradiction(const RuleContactLists &identity) {
    return find_repeated(identity.urls, std::identity(), "contact list");
}

Problem find_contradiction(const RuleDomains &identity) {
    for (const auto &domains : {identity.allowed_domains, identity.except_domains})
        if (domains)
            if (auto problem = find_repeated(domains->names, std::identity(), "domain"))
                return problem;
    for (const auto &contacts : {identity.allowed_contacts, identity.except_contacts})
        if (contacts)
            if (auto problem = find_repeated(contacts->members, &GroupMember::uri, "member"))
                return problem;
    return std::nullopt;
}

Problem find_contradiction(const GroupProperties &properties) {
    const auto &policy = properties.active_policy;
    if (policy && policy->participants)
        if (auto problem = find_contradiction(*policy->participants))
            return problem;
    std::unordered_set<std::int32_t> enablers;
    for (const auto &service : properties.supported_services)
        if (!enablers.insert(service.service_enabler).second)
            return fmt::format("the service {} comes twice", service.service_enabler);
    return std::nullopt;
}

} // namespace

Status add_members(GroupDocument &group, const GroupMembers &added) {
    return for_each_list(made(group.members), added,
                         [](auto &entries, const auto &more, auto name, std::string_view what) {
                             return add_all(entries, more, name, what);
                         });
}

Status remove_members(GroupDocument &group, const GroupMembers &removed) {
    return for_each_list(made(group.members), removed,
                         [](auto &entries, const auto &gone, auto name, std::string_view what) {
                             return remove_all(entries, gone, name, what);
                         });
}

Status replace_contact(GroupDocument &group, const GroupMember &contact) {
    auto &contacts = made(group.members).contacts;
    const auto found = std::ranges::find(contacts, contact.uri, &GroupMember::uri);
    if (found == contacts.end())
        return refuse(Result::kUnknownRecord, "the group has no member \"{}\"", contact.uri);
    *found = contact;
    return Done{};
}

Status add_rules(GroupDocument &group, const std::vector<GroupRule> &added) {
    if (added.empty())
        return refuse(Result::kInvalidArgument, "no rule came");
    return add_all(group.rules, added, &GroupRule::id, "rule");
}

Status replace_rules(GroupDocument &group, const std::vector<GroupRule> &rules) {
    if (rules.empty())
        return refuse(Result::kInvalidArgument, "no rule came");
    if (auto problem = find_repeated(rules, &GroupRule::id, "rule"))
        return refuse(Result::kInvalidArgument, "{}", *problem);
    std::unordered_map<std::string, GroupRule *> kept;
    for (auto &rule : group.rules)
        kept.emplace(rule.id, &rule);
    for (const auto &rule : rules) {
        const auto found = kept.find(rule.id);
        if (found == kept.end())
            return refuse(Result::kUnknownRecord, "the group has no rule \"{}\"", rule.id);
        *found->second = rule;
    }
    return Done{};
}

Status delete_rule(GroupDocument &group, const std::string &id) {
    if (std::erase_if(group.rules, [&](const auto &rule) { return rule.id == id; }) == 0)
        return refuse(Result::kUnknownRecord, "the group has no rule \"{}\"", id);
    return Done{};
}

Status set_active_policy(GroupDocument &group, const SessionPolicy &policy) {
    made(group.properties).active_policy = policy;
    return Done{};
}

Status set_service(GroupDocument &group, const SessionService &service) {
    auto &services = made(group.properties).supported_services;
    const auto found =
        std::ranges::find(services, service.application, &SupportedService::service_enabler);
    if (found == services.end())
        services.push_back({service.application, service.media});
    else
        found->media = service.media;
    return Done{};
}

Status set_age_restrictions(GroupDocument &group, const std::vector<AgeRestriction> &restrictions) {
    made(group.properties).age_restrictions = restrictions;
    return Done{};
}

std::optional<std::string> find_contradiction(const GroupDocument &group) {
    if (group.uri.empty())
        return "\"group_uri\" is missing or empty";
    if (group.members)
        if (auto problem = find_contradiction(*group.members))
            return problem;
    if (group.properties)
        if (auto problem = find_contradiction(*group.properties))
            return problem;
    if (auto problem = find_repeated(group.rules, &GroupRule::id, "rule"))
        return problem;
    for (const auto &rule : group.rules)
        if (auto problem = std::visit(
                [](const auto &identity) { return find_contradiction(identity); }, rule.identity))
            return fmt::format("in the rule \"{}\" {}", rule.id, *problem);
    return std::nullopt;
}

} // namespace sim
