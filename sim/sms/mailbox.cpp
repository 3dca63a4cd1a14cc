// SPDX-License-Identifier: Apache-2.0
// What slots receive: at once, or once they are there again.
#include "sim/sms/service_centre.hpp"

#include <iterator>

namespace sim {

namespace {

constexpr std::chrono::seconds kReportTime{30};

IncomingKind kind_of(const std::variant<tpdu::Deliver, tpdu::StatusReport> &content) {
    return std::holds_alternative<tpdu::Deliver>(content) ? IncomingKind::kMessage
                                                          : IncomingKind::kStatusReport;
}

} // namespace

void ServiceCentre::post(int slot, Mail mail) {
    if (registrations_.registered(slot))
        deliver(slot, std::move(mail));
    else
        boxes_[slot].stored.push_back(std::move(mail));
}

void ServiceCentre::deliver(int slot, Mail mail) {
    Mailbox &here = boxes_[slot];
    const std::int32_t number = here.next_received++;
    const bool more = mail.more_follow || !here.stored.empty();
    const auto octets = std::visit(
        [&](auto &content) {
            content.more_messages = more;
            return tpdu::encode(content).value();
        },
        mail.content);
    const IncomingKind kind = kind_of(mail.content);
    mail.patience = timers_.after_unscaled(kReportTime, [this, slot, number] {
        const auto node = boxes_[slot].delivered.extract(number);
        if (node.mapped().message)
            conclude(*node.mapped().message, message_status::kNoResponse);
    });
    here.delivered.emplace(number, std::move(mail));
    sink_(slot, IncomingSms{octets, number, kind});
}

void ServiceCentre::deliver_stored(int slot) {
    auto &stored = boxes_[slot].stored;
    while (!stored.empty()) {
        Mail mail = std::move(stored.front());
        stored.pop_front();
        deliver(slot, std::move(mail));
    }
}

// The device may have lost what it has not reported on.
void ServiceCentre::take_back(int slot) {
    Mailbox &here = boxes_[slot];
    auto delivered = std::exchange(here.delivered, {});
    std::deque<Mail> again;
    for (auto &[number, mail] : delivered) {
        mail.patience.cancel();
        if (kind_of(mail.content) == IncomingKind::kStatusReport)
            continue;
        const bool expired = mail.message && !held_.at(*mail.message).expiry.pending();
        if (expired)
            conclude(*mail.message, message_status::kExpired);
        else
            again.push_back(std::move(mail));
    }
    here.stored.insert(here.stored.begin(), std::make_move_iterator(again.begin()),
                       std::make_move_iterator(again.end()));
}

} // namespace sim
