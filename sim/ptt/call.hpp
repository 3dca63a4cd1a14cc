// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/floor.hpp"

#include <chrono>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

namespace sim {

// A participant's name across calls. Both come and go; this stays safe to keep.
struct PttRef {
    int call = 0;
    int who = 0;
    bool operator==(const PttRef &) const = default;
};

enum class PttPhase { kInvited, kAlerting, kConnecting, kConnected };

// One party of a call as long as it is asked to take part or does.
struct PttParticipant {
    PttRef ref;
    PttContact contact;
    PttPhase phase = PttPhase::kInvited;
    std::int32_t session = 0; // the slot's name for the call; none for a party of the network
    bool placed = false;
    FourIntegers media{};
    FourIntegers terms{};
    bool automatic = false; // does not ring
    bool listens_only = false;
    std::chrono::seconds answer_time{};
    std::vector<PttContent> contents; // that come with the invitation
    std::int32_t told_position = 0;
    Timer step; // what the network or its party does next
    Timer patience;

    bool connected() const { return phase == PttPhase::kConnected; }
    bool is_slot() const { return contact.slot >= 0; }
    std::string uri() const {
        return contact.anonymous ? "sip:anonymous@anonymous.invalid" : contact.uri;
    }
    std::string name() const { return contact.anonymous ? "" : contact.display_name; }
};

// Other media that one participant has offered and others have yet to answer.
struct PttChange {
    int asker = 0;
    PttModifyRequest request;
    std::set<int> waiting;
    bool accepted = false;
    FourIntegers common{};
    Timer patience;
};

struct PttCall {
    int id = 0;
    PttCallType type = PttCallType::kOneToOne;
    std::string uri; // the group's
    std::string name;
    int owner = 0;
    int crisis_by = 0; // who has declared it one
    bool crisis = false;
    bool automatic = false;
    bool takes_floor = false;
    bool alerted = false;
    bool established = false;
    FourIntegers media{};
    FourIntegers terms{};
    std::chrono::seconds answer_time{};
    std::map<int, PttParticipant> participants;
    int next_participant = 1;
    Timer step;
    PttFloor floor;
    Timer talk_limit;
    std::optional<PttChange> change;

    bool is_group() const { return type != PttCallType::kOneToOne; }
    PttParticipant *find(int who) {
        const auto found = participants.find(who);
        return found == participants.end() ? nullptr : &found->second;
    }
};

} // namespace sim
