// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/floor.hpp"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <utility>
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
    std::int32_t connected_count() const;
    PttParticipant *find(int who) {
        const auto found = participants.find(who);
        return found == participants.end() ? nullptr : &found->second;
    }
};

// What a slot has of push-to-talk.
struct PttLine {
    std::int32_t next_session = 1;
    std::map<std::int32_t, PttRef> sessions;
    std::int32_t channel = 0;
    PttChannelMode channel_mode = PttChannelMode::kTalkAndListen;
    std::int32_t next_advertisement = 1;
    Timer keep_alive;
};

// The calls and the sessions that slots have in them as they stand, and who is told of them: what
// the parts of the push-to-talk model share.
class PttSessions {
  public:
    using Sink = std::function<void(int slot, const PttEvent &event)>;

    // A slot's session: the call and the slot's part in it.
    struct Place {
        PttCall &call;
        PttParticipant &self;
    };

    PttSessions(int slots, Sink sink) : sink_(std::move(sink)), lines_(slots) {}

    PttLine &operator[](int slot) { return lines_[slot]; }
    const PttLine &operator[](int slot) const { return lines_[slot]; }
    std::map<int, PttCall> &calls() { return calls_; }
    const std::map<int, PttCall> &calls() const { return calls_; }
    PttCall *find(int call);
    PttParticipant *find(PttRef ref);

    // What requests stand on: the session in the state that they need, or the refusal.
    Answer<Place> existing(int slot, std::int32_t session);
    Answer<Place> connected(int slot, std::int32_t session);

    void emit(int slot, const PttEvent &event) const { sink_(slot, event); }
    void emit(const PttParticipant &participant, const PttEvent &event) const;
    // Tells the others in a group.
    void tell_status(const PttCall &call, const PttParticipant &participant,
                     std::string_view status) const;

  private:
    Place place_of(PttRef ref);

    Sink sink_;
    PerSlot<PttLine> lines_;
    std::map<int, PttCall> calls_;
};

} // namespace sim
