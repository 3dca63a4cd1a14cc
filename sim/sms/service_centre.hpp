// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/errands.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/registration/registrations.hpp"
#include "sim/sms/mailbox.hpp"
#include "sim/sms/parties.hpp"
#include "tpdu/tpdu.hpp"

#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <variant>

namespace sim {

// The values of TP-ST that this service centre uses.
namespace message_status {
inline constexpr std::uint8_t kReceived = 0x00;
inline constexpr std::uint8_t kRejected = 0x42;
inline constexpr std::uint8_t kNotObtainable = 0x43;
inline constexpr std::uint8_t kExpired = 0x46;
inline constexpr std::uint8_t kNoResponse = 0x62;
inline constexpr std::uint8_t kErrorInDevice = 0x65;
} // namespace message_status

struct SubmitRequest {
    tpdu::Octets tpdu;
    std::int32_t length = 0; // as the request says it
    tpdu::Octets service_centre;
    std::int32_t option = 0;
};

struct SubmitReceipt {
    std::int32_t number = 0; // of the message, from 1 in each slot
    std::int32_t reference = 0;
};

struct ReportRequest {
    std::int32_t code = 0; // 0 for success
    tpdu::Octets tpdu;
    std::int32_t length = 0;
    std::int32_t option = 0; // the message's number, or 0 for the oldest
};

enum class IncomingKind : std::int32_t { kMessage = 0, kStatusReport = 1 };

struct IncomingSms {
    tpdu::Octets tpdu;
    std::int32_t number = 0;
    IncomingKind kind = IncomingKind::kMessage;
};
struct SendSmsAck {
    std::int32_t number = 0;
    std::int32_t cause = 0;
    std::int32_t reference = 0;
    tpdu::Octets tpdu;
    bool try_again = false;
};
struct DeliveryReportAck {
    std::int32_t number = 0;
    std::int32_t code = 0;
};
using MessageEvent = std::variant<IncomingSms, SendSmsAck, DeliveryReportAck>;

// Takes messages from the slots, keeps them while they cannot be delivered, delivers them, and
// tells the senders what became of them. The network's, but for when a slot may send.
class ServiceCentre {
  public:
    using Sink = std::function<void(int slot, const MessageEvent &event)>;

    // `epoch`: the time of day, in seconds since 1970, when the timers' network time was 0.
    ServiceCentre(const NumberPlan &plan, Timers &timers, const Registrations &registrations,
                  std::int64_t epoch, Sink sink);

    Answer<SubmitReceipt> submit(int slot, const SubmitRequest &request);
    // The number of the message that the report was taken for.
    Answer<std::int32_t> report(int slot, const ReportRequest &request);
    // A party of the network writes to a slot.
    void send_from_network(int slot, tpdu::Deliver message);

    // The slot has registered, or its radio is off.
    void deliver_stored(int slot);
    void take_back(int slot);

  private:
    using Id = MessageId;

    // What a slot has sent, from then until its fate is known.
    struct Message {
        Id id = 0;
        int sender = -1;
        std::int32_t number = 0;
        tpdu::Submit submit;
        bool more_follow = false;
        tpdu::Timestamp taken;
        bool accepted = false;
        Timer step;
        Timer expiry;
    };

    tpdu::Timestamp now() const;
    std::int64_t now_in_seconds() const;

    std::optional<Refusal> not_deliverable(int slot, const tpdu::Submit &submit) const;
    tpdu::Deliver to_deliver(int sender, const tpdu::Submit &submit, tpdu::Timestamp taken) const;
    bool is_duplicate(const Message &message) const;

    void acknowledge(Id id);
    void refuse_message(Id id, const SubmitRefusal &refusal);
    void accept(Message &message, const MessageParty *party);
    void forward_to_slot(Id id, int slot);
    void forward_to_party(Id id, const MessageParty &party);
    void echo(const Message &message);
    void expire(Id id);
    void conclude(Id id, std::uint8_t status);

    void post(int slot, Mail mail);
    void deliver(int slot, Mail mail);

    const NumberPlan &plan_;
    Timers &timers_;
    const Registrations &registrations_;
    std::int64_t epoch_;
    Sink sink_;
    PerSlot<std::int32_t> next_sent_;
    PerSlot<Mailbox> boxes_;
    Id next_id_ = 1;
    std::map<Id, Message> held_;
    Errands errands_;
};

} // namespace sim
