// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdint>
#include <string_view>

// The network's side of a message: who has a number, and what becomes of messages to it.
namespace sim {

// Why the service centre does not take a message.
struct SubmitRefusal {
    std::int32_t cause;         // of the relay layer, 3GPP TS 24.011
    std::uint8_t failure_cause; // TP-FCS
    bool try_again;
};

enum class MessageFate {
    kReceived,
    kEchoed, // received, and sent back
    kNeverReachable,
    kRefusedByParty,
    kRefusedByCentre,
};

// What becomes of a message to a number that is no slot's.
struct MessageParty {
    std::string_view number; // empty: any number
    MessageFate fate;
    SubmitRefusal refusal{};
};

const MessageParty &message_party_at(std::string_view number);
// For a destination that is no number.
const MessageParty &message_nobody();

} // namespace sim
