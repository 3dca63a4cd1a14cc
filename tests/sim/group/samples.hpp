// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/group/records.hpp"

namespace sim::test {

inline GroupMember sample_member(const std::string &uri) {
    return {uri, "Ann \"ä\"", true, false, 1, true, {"lead", "north", "2"}};
}

inline GroupMembers sample_members() {
    return {{"friends", "family"},
            {sample_member("tel:+15550100"), {.uri = "sip:bob@example.org"}},
            {"http://xcap.example.org/lists/a"},
            {"http://xcap.example.org/entries/1", "http://xcap.example.org/entries/2",
             "http://xcap.example.org/entries/3"}};
}

// A rule of each type, and of one that holds nothing.
inline std::vector<GroupRule> sample_rules() {
    GroupRule entries{.id = "entries",
                      .identity = RuleContacts{{sample_member("sip:carol@example.org")}},
                      .identity_type = 1,
                      .media = RuleMedia{{.audio = true, .file_transfer = true}}};
    entries.actions[0] = entries.actions[13] = true;
    const GroupRule lists{.id = "lists",
                          .identity = RuleContactLists{{"http://xcap.example.org/lists/b"}},
                          .identity_type = 2,
                          .is_list_member = true};
    const GroupRule domains{.id = "domains",
                            .identity =
                                RuleDomains{DomainNames{{"example.org", "example.net"}},
                                            std::nullopt, DomainNames{},
                                            DomainContacts{{sample_member("sip:dan@example.org")}}},
                            .identity_type = 4};
    return {entries, lists, domains, {.id = "nobody", .identity_type = 3}};
}

inline SessionPolicy sample_policy() {
    return {2, 3600, sample_members(), {{"08:00", "12:00"}, {"13:00", std::nullopt}}};
}

inline GroupProperties sample_properties() {
    return {
        .display_name = "Crew",
        .subject = "Night shift",
        .is_searchable = true,
        .inv_members = false,
        .max_participants = 12,
        .as_id = "as1",
        .area_id = "area 7",
        .auto_grp_advertisements = true,
        .group_qoe = -3,
        .active_policy = sample_policy(),
        .supported_services = {{1, GroupMedia{.audio = true, .poc_speech = true}}, {2, {}}},
        .age_restrictions = {{"18", "65"}, {std::nullopt, "12"}},
    };
}

// With every part and every key.
inline GroupDocument sample_group(const std::string &uri = "sip:crew@example.org") {
    return {uri, "channel 5", "7", sample_properties(), sample_members(), sample_rules()};
}

} // namespace sim::test
