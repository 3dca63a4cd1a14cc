// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/result.hpp"
#include "sim/group/answers.hpp"
#include "sim/ptt/call.hpp"
#include "sim/ptt/change.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/floor_control.hpp"
#include "sim/registration/registrations.hpp"

#include <chrono>
#include <cstdint>
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

// The push-to-talk calls of all slots: who takes part, and who is told. A request that makes no
// sense in the present state is refused and changes nothing. What a slot may ask when is the
// device's; the calls themselves are the server's.
class PttCalls {
  public:
    using Sink = PttSessions::Sink;

    PttCalls(const PttDirectory &directory, Timers &timers, const Registrations &registrations,
             Sink sink);

    // The parts: who speaks, and what is negotiated while a call goes on.
    PttFloorControl &floor() { return floor_; }
    PttChanges &changes() { return changes_; }

    // Setting up and ending
    Answer<std::int32_t> make_call(int slot, const PttCallRequest &request);
    Status answer(int slot, const PttModifyRequest &request);
    Status reject(int slot, std::int32_t session, PttRejectReason reason);
    Status end(int slot, std::int32_t session, PttEndScope scope);
    Status convert_to_crisis(int slot, std::int32_t session);
    Status set_channel(int slot, std::int32_t channel, PttChannelMode mode);
    Status keep_alive(int slot, std::int32_t seconds);
    // The group calls that a slot takes part in, as those who ask about participants are told.
    std::vector<ParticipantInfo> running(int slot) const;
    // The radio is off.
    void drop_calls(int slot);

    // Ad hoc groups
    Answer<std::int32_t> make_ad_hoc_call(int slot, const PttAdHocRequest &request);
    Status add_users(int slot, const PttAddRequest &request);
    Status remove_users(int slot, std::int32_t session, const std::vector<PttPeer> &users);
    // Somebody tells a slot of a group.
    void advertise(int slot, PttGroupAdvertisement advertisement);

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

    PttCall *running_call(std::string_view uri);
    Answer<PttSessions::Place> owned_ad_hoc(int slot, std::int32_t session);

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

    void practise_habit(PttCall &call, PttParticipant &participant);
    Answer<std::vector<PttContact>> contacts_of(int slot, const std::vector<PttUser> &users) const;
    PttGroupAdvertisement advertisement_of(const PttCall &call,
                                           const PttParticipant &invited) const;

    const PttDirectory &directory_;
    Timers &timers_;
    const Registrations &registrations_;
    PttSessions sessions_;
    PttFloorControl floor_;
    PttChanges changes_;
    int next_call_ = 1;
    int next_ad_hoc_ = 1;
};

} // namespace sim
