// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/number_plan.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/parties.hpp"
#include "sim/ptt/values.hpp"

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

// Whom a uri reaches: a slot, or a party of the network.
struct PttContact {
    std::string uri;
    std::string display_name;
    int slot = -1;
    const PttParty *party = nullptr; // unless it is a slot
    std::string group_uri;           // through which it is reached
    bool anonymous = false;
    std::int32_t session = 0; // its own, when it is reached within a call

    bool operator==(const PttContact &) const = default;
};

// The uris of the members of the group with this uri; nothing when there is no such group.
using ParticipantsOf =
    std::function<std::optional<std::vector<std::string>>(std::string_view group_uri)>;

// The push-to-talk server's: who the parties and the groups are.
class PttDirectory {
  public:
    static constexpr std::string_view kGroupHost = "groups.invalid";

    explicit PttDirectory(const NumberPlan &plan) : plan_(plan) {}

    // Groups that somebody else keeps. The built-in ones go before them.
    void add_groups(ParticipantsOf groups) { sources_.push_back(std::move(groups)); }

    std::string uri_of(int slot) const { return to_uri(plan_.number_of(slot)); }
    int slots() const { return plan_.slots(); }

    Answer<PttContact> contact(std::string_view uri, std::string_view name) const;
    // The members of a group but for this slot itself.
    Answer<std::vector<PttContact>> members(int slot, const std::string &group_uri) const;
    // All whom these peers mean, groups replaced by their members; none twice, this slot not.
    Answer<std::vector<PttContact>> resolve(int slot, const std::vector<PttPeer> &peers) const;

    // An originator that is not left empty must be the slot itself.
    std::optional<Refusal> not_oneself(int slot, const PttPeer &originator) const;

  private:
    std::optional<std::vector<std::string>> participants(std::string_view group_uri) const;
    std::optional<std::vector<std::string>> built_in(std::string_view group_uri) const;

    const NumberPlan &plan_;
    std::vector<ParticipantsOf> sources_;
};

} // namespace sim
