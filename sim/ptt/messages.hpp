// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/errands.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/model.hpp"
#include "sim/registration/registrations.hpp"

#include <cstdint>
#include <map>
#include <string>
#include <vector>

namespace sim {

struct PttMessage {
    std::int32_t session = 0; // 0: to the targets
    std::string message_id;   // empty: made by the network
    std::vector<PttPeer> targets;
    std::int32_t notices = 0; // that are wanted, added up
    std::string content_type; // empty: text/plain
    std::string text;
    std::int32_t lifetime = 0; // seconds; 0: the usual
    PttPeer originator;        // with no uri, or the slot's own
    std::int32_t reference = 0;
};

struct PttMessageReceipt {
    std::int32_t number = 0; // from 1 in each slot
    std::int32_t session = 0;
    std::int32_t parties = 0;
};

struct PttNoticeRequest {
    std::int32_t number = 0; // of the message as it was received
    std::string message_id;  // empty, or the message's own
    PttPeer originator;      // likewise
    PttNotice notice = PttNotice::kDelivered;
};

// Messages between parties and into calls, and what the senders are told of them. Nothing is
// stored for parties that cannot be reached. The server's, but for what a slot may ask when.
class PttMessages {
  public:
    PttMessages(const PttDirectory &directory, PttCalls &calls, Timers &timers,
                const Registrations &registrations, PttCalls::Sink sink);

    Answer<PttMessageReceipt> send(int slot, PttMessage message);
    // To how many the notice goes: nobody when it is not wanted.
    Answer<std::int32_t> notify(int slot, const PttNoticeRequest &request);

  private:
    struct Sent {
        int slot = -1;
        std::int32_t number = 0;
        PttMessage message;
    };
    // What a slot has received and may send notices about.
    struct Received {
        PttPeer originator;
        std::string reader; // the uri under which the sender knows the slot
        std::string message_id;
        int sender = -1; // the slot to tell; none when the network has sent it
        std::int32_t sent_number = 0;
        std::int32_t wanted = 0;
        std::int32_t told = 0; // notices that have been sent
    };
    struct Box {
        std::int32_t next_sent = 1;
        std::int32_t next_received = 1;
        std::map<std::int32_t, Received> received;
    };

    Answer<std::vector<PttContact>> receivers(int slot, const PttMessage &message);
    void deliver(const Sent &sent, const PttContact &to);
    void deliver_to_slot(const Sent &sent, const PttContact &to);
    void deliver_to_party(const Sent &sent, const PttContact &to);
    void echo(const Sent &sent, const PttContact &from);
    void tell(const Sent &sent, const PttContact &from, PttNotice notice, std::int32_t code = 0);
    void tell_if_wanted(const Sent &sent, const PttContact &from, PttNotice notice);
    void receive(int slot, PttIncomingMessage message, Received received);

    const PttDirectory &directory_;
    PttCalls &calls_;
    const Registrations &registrations_;
    PttCalls::Sink sink_;
    Errands errands_;
    PerSlot<Box> boxes_;
    std::uint64_t next_id_ = 1;
};

} // namespace sim
