// SPDX-License-Identifier: Apache-2.0
#include "sim/sms/mailbox.hpp"

#include <algorithm>
#include <iterator>

namespace sim {

void Mailbox::store_first(std::vector<Mail> mails) {
    stored_.insert(stored_.begin(), std::make_move_iterator(mails.begin()),
                   std::make_move_iterator(mails.end()));
}

std::optional<Mail> Mailbox::take_stored() {
    if (stored_.empty())
        return std::nullopt;
    Mail mail = std::move(stored_.front());
    stored_.pop_front();
    return mail;
}

void Mailbox::await_report(std::int32_t number, Mail mail) {
    delivered_.emplace(number, std::move(mail));
}

std::optional<std::pair<std::int32_t, Mail>> Mailbox::take_delivered(std::int32_t number) {
    auto node = number == 0 && !delivered_.empty() ? delivered_.extract(delivered_.begin())
                                                   : delivered_.extract(number);
    if (node.empty())
        return std::nullopt;
    return std::pair(node.key(), std::move(node.mapped()));
}

std::vector<Mail> Mailbox::take_all_delivered() {
    std::vector<Mail> mails;
    for (auto &[number, mail] : std::exchange(delivered_, {}))
        mails.push_back(std::move(mail));
    return mails;
}

bool Mailbox::has_delivered(MessageId message) const {
    return std::ranges::any_of(delivered_,
                               [&](const auto &entry) { return entry.second.message == message; });
}

void Mailbox::discard_stored(MessageId message) {
    std::erase_if(stored_, [&](const Mail &mail) { return mail.message == message; });
}

} // namespace sim
