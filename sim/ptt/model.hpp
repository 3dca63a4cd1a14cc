// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/call.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/events.hpp"
#include "sim/registration/registrations.hpp"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace sim {

// What one who places a call asks for, whatever the kind of call.
struct PttOffer {
    bool crisis = false;
    bool automatic = false;
    bool takes_floor = false;
    FourIntegers media{};
    FourIntegers terms{};
    std::string caller_name{};
    std::int32_t answer_time = 0; // seconds; 0 for the usual
};

struct PttCallRequest {
    PttOffer offer;
    std::string called;
    PttCallType type = PttCallType::kOneToOne;
};

struct PttUser {
    PttPeer peer;
    bool anonymous = false;
};

struct PttAdHocRequest {
    PttOffer offer;
    std::string subject;
    std::vector<PttUser> users;
};

struct PttAddRequest {
    std::int32_t session = 0;
    bool automatic = false;
    std::vector<PttUser> users;
    std::int32_t answer_time = 0;
    std::vector<PttContent> contents;
};

struct PttFloorRequest {
    std::int32_t session = 0;
    FourIntegers media{};
    std::int32_t priority = 0;
    std::int32_t patience = 0;
    std::string name;
};

struct PttFloorStatus {
    std::int32_t session = 0;
    PttFloorState state = PttFloorState::kIdle;
    std::int32_t participants = 0;
    std::string speaker_uri;
    bool operator==(const PttFloorStatus &) const = default;
};

// A group call that a slot takes part in, for whoever wants to know.
struct PttRunningCall {
    struct Participant {
        std::string uri;
        std::string display_name;
        bool connected = false; // else being asked
    };
    std::int32_t session = 0;
    PttCallType type = PttCallType::kGroup;
    std::string uri;
    std::string name;
    std::string placed_by; // uri
    bool crisis = false;
    FourIntegers media{};
    std::vector<Participant> participants;
};

// The push-to-talk calls of all slots: who takes part, who speaks, and who is told. A request that
// makes no sense in the present state is refused and changes nothing.
class PttCalls {
  public:
    using Sink = std::function<void(int slot, const PttEvent &event)>;

    PttCalls(const PttDirectory &directory, Timers &timers, const Registrations &registrations,
             Sink sink);

    // Setting up and ending
    Answer<std::int32_t> make_call(int slot, const PttCallRequest &request);
    Status answer(int slot, const PttModifyRequest &request);
    Status reject(int slot, std::int32_t session, PttRejectReason reason);
    Status end(int slot, std::int32_t session, PttEndScope scope);
    Status convert_to_crisis(int slot, std::int32_t session);
    Status set_channel(int slot, std::int32_t channel, PttChannelMode mode);
    Status keep_alive(int slot, std::int32_t seconds);
    std::vector<PttRunningCall> running(int slot) const;
    // The radio is off.
    void drop_calls(int slot);

    // Ad hoc groups
    Answer<std::int32_t> make_ad_hoc_call(int slot, const PttAdHocRequest &request);
    Status add_users(int slot, const PttAddRequest &request);
    Status remove_users(int slot, std::int32_t session, const std::vector<PttPeer> &users);
    // Somebody tells a slot of a group.
    void advertise(int slot, PttGroupAdvertisement advertisement);

    // The floor
    Status request_floor(int slot, const PttFloorRequest &request);
    Status release_floor(int slot, std::int32_t session);
    // Of these sessions; of all when none is named.
    Answer<std::vector<PttFloorStatus>> floor_status(int slot,
                                                     const std::vector<std::int32_t> &sessions);

    // Change of the media and of the terms
    Status modify(int slot, const PttModifyRequest &request);
    Status accept_modify(int slot, const PttModifyRequest &request);
    Status reject_modify(int slot, std::int32_t session);

    // Who takes part beside this slot, under the names known in the call; refused when the call
    // does not have these media.
    Answer<std::vector<PttContact>> others(int slot, std::int32_t session, PttMedia media);
    // Under which the others know this slot: its own where there is no such session.
    std::string uri_in(int slot, std::int32_t session);
    Answer<std::string> talking_to(int slot, std::int32_t session);

  private:
    static constexpr std::chrono::milliseconds kAcceptTime{200};
    static constexpr std::chrono::milliseconds kRouteTime{500};
    static constexpr std::size_t kMostSessions = 4; // of a slot

    struct Line {
        std::int32_t next_session = 1;
        std::map<std::int32_t, PttRef> sessions;
        std::int32_t channel = 0;
        PttChannelMode channel_mode = PttChannelMode::kTalkAndListen;
        std::int32_t next_advertisement = 1;
        Timer keep_alive;
    };
    // A slot's session: the call and the slot's part in it.
    struct Place {
        PttCall &call;
        PttParticipant &self;
    };

    PttCall *find(int call);
    PttParticipant *find(PttRef ref);
    PttCall *running_call(std::string_view uri);
    Answer<Place> existing(int slot, std::int32_t session);
    Answer<Place> connected(int slot, std::int32_t session);
    Answer<Place> owned_ad_hoc(int slot, std::int32_t session);

    std::optional<Refusal> cannot_place(int slot, const PttOffer &offer);
    PttCall &add_call(int slot, PttCallType type, const PttOffer &offer);
    PttParticipant &add_participant(PttCall &call, const PttContact &contact);
    void open_session(PttCall &call, PttParticipant &participant);
    Answer<std::vector<PttContact>> called_by(int slot, const PttCallRequest &request,
                                              PttCall &call);
    std::int32_t join(PttCall &call, int slot, const PttOffer &offer);
    void proceed(int call);
    void invite_all(int call);
    void invite(PttRef ref);
    void invite_slot(PttCall &call, PttParticipant &participant);
    void invite_party(PttCall &call, PttParticipant &participant);
    void alert(PttCall &call, PttParticipant &participant);
    void expect_answer(PttParticipant &participant);
    void connect(PttRef ref);
    void enter(PttCall &call, PttParticipant &participant);
    std::string others_text(const PttCall &call, const PttParticipant &except) const;

    void leave(PttRef ref, PttEndReason here, PttEndReason there);
    void wind_up(int call, bool owner_left, PttEndReason there);
    void leave_all(int slot, PttEndReason reason);
    void leave_channel(int slot);
    static std::string channel_uri(std::int32_t channel);

    void emit(const PttParticipant &participant, const PttEvent &event) const;
    void tell_status(const PttCall &call, const PttParticipant &participant,
                     std::string_view status) const;

    std::optional<Refusal> cannot_speak(const Place &place, const PttFloorRequest &request) const;
    void ask_floor(PttCall &call, PttParticipant &participant, FloorWish wish,
                   std::chrono::seconds patience);
    void grant_floor(PttCall &call, FloorWish wish);
    void pass_floor_on(PttCall &call);
    void cut_off(PttRef ref);
    void stop_waiting(PttRef ref);
    // From one who has it or waits for it; of others nothing is taken.
    void cancel_floor(PttCall &call, const PttParticipant &speaker, PttFloorCause cause);
    void forget_speaker(PttCall &call, int who);
    void tell_positions(PttCall &call);
    void tell_floor(const PttCall &call, const PttParticipant &participant) const;
    PttFloorEvent floor_event(PttFloorKind kind, const PttCall &call,
                              const PttParticipant &participant,
                              PttFloorCause cause = PttFloorCause::kNone) const;
    std::int32_t connected_count(const PttCall &call) const;

    void practise_habit(PttCall &call, PttParticipant &participant);
    void party_talks(PttRef ref);
    void party_asks_video(PttRef ref);
    void party_answers_change(PttRef ref);

    void offer_change(PttCall &call, PttParticipant &asker, const PttModifyRequest &request);
    void settle_change(PttCall &call, int who, std::optional<FourIntegers> accepted);
    void conclude_change(PttCall &call);
    void tell_change(PttParticipant &participant, const PttModifyRequest &request, bool accepted);

    Answer<std::vector<PttContact>> contacts_of(int slot, const std::vector<PttUser> &users) const;
    PttGroupAdvertisement advertisement_of(const PttCall &call,
                                           const PttParticipant &invited) const;

    const PttDirectory &directory_;
    Timers &timers_;
    const Registrations &registrations_;
    Sink sink_;
    PerSlot<Line> lines_;
    std::map<int, PttCall> calls_;
    int next_call_ = 1;
    int next_ad_hoc_ = 1;
};

} // namespace sim
