// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "tpdu/tpdu.hpp"

#include <cstdint>
#include <deque>
#include <map>
#include <optional>
#include <utility>
#include <variant>
#include <vector>

namespace sim {

// What a message is to the service centre that holds it.
using MessageId = std::uint64_t;

// What a slot is to receive or has received.
struct Mail {
    std::variant<tpdu::Deliver, tpdu::StatusReport> content;
    std::optional<MessageId> message; // whose fate it decides
    bool more_follow = false;
    Timer patience; // for the report, once it is delivered

    bool is_status_report() const { return std::holds_alternative<tpdu::StatusReport>(content); }
};

// The network's mailbox of one slot: what is stored until the slot is there, and what has been
// delivered and waits for the slot's report.
class Mailbox {
  public:
    void store(Mail mail) { stored_.push_back(std::move(mail)); }
    // Before all that is stored already.
    void store_first(std::vector<Mail> mails);
    bool stores_more() const { return !stored_.empty(); }
    // The oldest, which is no longer stored.
    std::optional<Mail> take_stored();

    // The number of the next mail that is delivered, from 1.
    std::int32_t next_number() { return next_number_++; }
    void await_report(std::int32_t number, Mail mail);
    // The mail with this number, or the oldest for 0, which no longer waits.
    std::optional<std::pair<std::int32_t, Mail>> take_delivered(std::int32_t number);
    // All of it, oldest first.
    std::vector<Mail> take_all_delivered();

    bool has_delivered(MessageId message) const;
    void discard_stored(MessageId message);

  private:
    std::int32_t next_number_ = 1;
    std::deque<Mail> stored_;
    std::map<std::int32_t, Mail> delivered_; // by number
};

} // namespace sim
