// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/directory.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr std::string_view kSimulatedMembers[] = {"tel:+15550221", "tel:+15550222",
                                                  "tel:+15550214"};

} // namespace

std::optional<std::vector<std::string>> PttDirectory::built_in(std::string_view group_uri) const {
    const auto name = group_uri.substr(0, group_uri.find('@'));
    if (group_uri != fmt::format("{}@{}", name, kGroupHost))
        return std::nullopt;
    std::vector<std::string> members;
    members.reserve(static_cast<std::size_t>(plan_.slots()) + std::size(kSimulatedMembers));
    for (int slot = 0; slot < plan_.slots(); ++slot)
        members.push_back(uri_of(slot));
    if (name == "sip:network")
        members.clear();
    else if (name != "sip:all" && name != "sip:mixed")
        return std::nullopt;
    if (name != "sip:all")
        members.insert(members.end(), std::begin(kSimulatedMembers), std::end(kSimulatedMembers));
    return members;
}

std::optional<std::vector<std::string>>
PttDirectory::participants(std::string_view group_uri) const {
    if (auto members = built_in(group_uri))
        return members;
    for (const auto &source : sources_)
        if (auto members = source(group_uri))
            return members;
    return std::nullopt;
}

Answer<PttContact> PttDirectory::contact(std::string_view uri, std::string_view name) const {
    const auto number = parse_number(uri);
    if (!number)
        return number.refusal();
    // Written in one way, so that one party is not taken for two.
    const auto written = to_uri(number->starts_with('+') ? *number : "+" + *number);
    PttContact contact{written, std::string(name), -1, nullptr, {}, false, 0};
    if (const auto slot = plan_.slot_of(*number)) {
        contact.slot = *slot;
        contact.uri = uri_of(*slot);
    } else
        contact.party = &ptt_party_at(*number);
    return contact;
}

Answer<std::vector<PttContact>> PttDirectory::members(int slot,
                                                      const std::string &group_uri) const {
    const auto listed = participants(group_uri);
    if (!listed)
        return refuse(Result::kUnknownRecord, "there is no group \"{}\"", group_uri);
    std::vector<PttContact> members;
    for (const auto &uri : *listed) {
        const auto found = contact(uri, {});
        // A group may list names that no number belongs to.
        PttContact member = found ? *found : PttContact{uri, {}, -1, &ptt_nobody(), {}, false, 0};
        member.group_uri = group_uri;
        if (member.slot != slot && std::ranges::find(members, member) == members.end())
            members.push_back(std::move(member));
    }
    return members;
}

Answer<std::vector<PttContact>> PttDirectory::resolve(int slot,
                                                      const std::vector<PttPeer> &peers) const {
    std::vector<PttContact> found;
    const auto add = [&](PttContact contact) {
        if (contact.slot != slot &&
            std::ranges::find(found, contact.uri, &PttContact::uri) == found.end())
            found.push_back(std::move(contact));
    };
    for (const auto &peer : peers) {
        if (peer.is_group) {
            const auto group = members(slot, peer.uri);
            if (!group)
                return group.refusal();
            std::ranges::for_each(*group, add);
            continue;
        }
        const auto one = contact(peer.uri, peer.display_name);
        if (!one)
            return one.refusal();
        add(*one);
    }
    if (found.empty())
        return refuse(Result::kInvalidArgument, "nobody but slot {} itself is meant", slot);
    return found;
}

std::optional<Refusal> PttDirectory::not_oneself(int slot, const PttPeer &originator) const {
    if (originator.uri.empty())
        return std::nullopt;
    const auto number = parse_number(originator.uri);
    if (number && same_number(*number, plan_.number_of(slot)))
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "slot {} sends as {}, not as \"{}\"", slot,
                  uri_of(slot), originator.uri);
}

} // namespace sim
