// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/messages.hpp"

#include "sim/ptt/media.hpp"

#include <memory>

namespace sim {

namespace {

using namespace std::chrono_literals;

constexpr auto kDeliveryTime = 300ms;
constexpr auto kNoticeTime = 200ms;
constexpr auto kReadingTime = 1s;
constexpr std::int32_t kUsualLifetime = 60;
constexpr std::size_t kMostKept = 1000; // received messages a slot

const PttPeer kNetwork{1, "sip:ptt@ims-sim.invalid", "ims-sim", false};

std::int32_t bit(PttNotice notice) {
    return static_cast<std::int32_t>(notice);
}

std::int32_t sip_status(PttWelcome welcome) {
    switch (welcome) {
    case PttWelcome::kTakes:
        return 200;
    case PttWelcome::kBusy:
        return 486;
    case PttWelcome::kDeclines:
        return 603;
    case PttWelcome::kNeverAnswers:
        return 408;
    case PttWelcome::kNobody:
        return 404;
    case PttWelcome::kFails:
        return 503;
    }
    return 500;
}

} // namespace

PttMessages::PttMessages(const PttDirectory &directory, PttCalls &calls, Timers &timers,
                         const Registrations &registrations, PttCalls::Sink sink)
    : directory_(directory), calls_(calls), registrations_(registrations), sink_(std::move(sink)),
      errands_(timers), boxes_(directory.slots()) {}

Answer<std::vector<PttContact>> PttMessages::receivers(int slot, const PttMessage &message) {
    if (message.session == 0)
        return directory_.resolve(slot, message.targets);
    if (!message.targets.empty())
        return refuse(Result::kInvalidArgument,
                      "a message goes to a session or to targets, and both are there");
    auto others = calls_.others(slot, message.session, kPttMessages);
    if (others && others->empty())
        return refuse(Result::kWrongState, "nobody else takes part in session {}", message.session);
    return others;
}

Answer<PttMessageReceipt> PttMessages::send(int slot, PttMessage message) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    constexpr std::int32_t kAllNotices = 3;
    if (message.notices < 0 || message.notices > kAllNotices)
        return refuse(Result::kInvalidArgument,
                      "notices are 1 (delivered) and 2 (read) added up, not {}", message.notices);
    if (auto refusal = bad_seconds(message.lifetime, "a lifetime"))
        return *refusal;
    if (auto refusal = directory_.not_oneself(slot, message.originator))
        return *refusal;
    const auto contacts = receivers(slot, message);
    if (!contacts)
        return contacts.refusal();
    if (message.message_id.empty())
        message.message_id = fmt::format("message-{}", next_id_++);
    if (message.content_type.empty())
        message.content_type = "text/plain";
    message.originator =
        to_peer(calls_.uri_in(slot, message.session), message.originator.display_name);
    const std::int32_t number = boxes_[slot].next_sent++;
    const auto session = message.session;
    const auto sent = std::make_shared<const Sent>(Sent{slot, number, std::move(message)});
    for (const auto &contact : *contacts)
        errands_.after(kDeliveryTime, [this, sent, contact] { deliver(*sent, contact); });
    return PttMessageReceipt{number, session, static_cast<std::int32_t>(contacts->size())};
}

void PttMessages::deliver(const Sent &sent, const PttContact &to) {
    if (to.slot >= 0)
        deliver_to_slot(sent, to);
    else
        deliver_to_party(sent, to);
}

void PttMessages::deliver_to_slot(const Sent &sent, const PttContact &to) {
    constexpr std::int32_t kTemporarilyUnavailable = 480;
    if (!registrations_.registered(to.slot))
        return tell(sent, to, PttNotice::kFailed, kTemporarilyUnavailable);
    const PttMessage &message = sent.message;
    PttIncomingMessage incoming;
    incoming.originator = message.originator;
    incoming.message_id = message.message_id;
    incoming.notices = message.notices;
    incoming.content_type = message.content_type;
    incoming.text = message.text;
    incoming.route = {kNetwork};
    if (!to.group_uri.empty())
        incoming.route.push_back(to_peer(to.group_uri, {}, true));
    incoming.group_uri = to.group_uri;
    incoming.session = to.session;
    incoming.lifetime = message.lifetime;
    incoming.reference = message.reference;
    incoming.target = to_peer(to.uri, to.display_name);
    receive(to.slot, std::move(incoming),
            {message.originator, to.uri, message.message_id, sent.slot, sent.number,
             message.notices, 0});
}

void PttMessages::receive(int slot, PttIncomingMessage message, Received received) {
    Box &here = boxes_[slot];
    message.number = here.next_received++;
    here.received[message.number] = std::move(received);
    if (here.received.size() > kMostKept)
        here.received.erase(here.received.begin());
    sink_(slot, message);
}

void PttMessages::deliver_to_party(const Sent &sent, const PttContact &to) {
    const PttWelcome welcome = to.party->welcome;
    if (welcome == PttWelcome::kNeverAnswers)
        return errands_.after_waiting(
            seconds_or(sent.message.lifetime, kUsualLifetime), [this, sent, to] {
                tell(sent, to, PttNotice::kFailed, sip_status(PttWelcome::kNeverAnswers));
            });
    if (welcome != PttWelcome::kTakes)
        return tell(sent, to, PttNotice::kFailed, sip_status(welcome));
    tell_if_wanted(sent, to, PttNotice::kDelivered);
    errands_.after(kReadingTime, [this, sent, to] { tell_if_wanted(sent, to, PttNotice::kRead); });
    if (to.party->habit == PttHabit::kEchoes)
        errands_.after(kReadingTime, [this, sent, to] { echo(sent, to); });
}

void PttMessages::echo(const Sent &sent, const PttContact &from) {
    if (!registrations_.registered(sent.slot))
        return;
    PttIncomingMessage back;
    back.originator = to_peer(from.uri, from.display_name);
    back.message_id = fmt::format("message-{}", next_id_++);
    back.content_type = sent.message.content_type;
    back.text = sent.message.text;
    back.route = {kNetwork};
    back.reference = sent.message.reference;
    back.target = sent.message.originator;
    receive(sent.slot, back, {back.originator, {}, back.message_id, -1, 0, 0, 0});
}

void PttMessages::tell(const Sent &sent, const PttContact &from, PttNotice notice,
                       std::int32_t code) {
    sink_(sent.slot,
          PttMessageNotice{sent.number, to_peer(from.uri, from.display_name),
                           sent.message.message_id, notice, code, sent.message.originator});
}

void PttMessages::tell_if_wanted(const Sent &sent, const PttContact &from, PttNotice notice) {
    if ((sent.message.notices & bit(notice)) != 0)
        tell(sent, from, notice);
}

Answer<std::int32_t> PttMessages::notify(int slot, const PttNoticeRequest &request) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (request.notice != PttNotice::kDelivered && request.notice != PttNotice::kRead)
        return refuse(Result::kInvalidArgument, "a notice is 1 (delivered) or 2 (read), not {}",
                      request.notice);
    const auto found = boxes_[slot].received.find(request.number);
    if (found == boxes_[slot].received.end())
        return refuse(Result::kUnknownRecord, "slot {} has received no message {}", slot,
                      request.number);
    Received &received = found->second;
    if (!request.message_id.empty() && request.message_id != received.message_id)
        return refuse(Result::kInvalidArgument, "message {} has the id \"{}\", not \"{}\"",
                      request.number, received.message_id, request.message_id);
    if (!request.originator.uri.empty() && request.originator.uri != received.originator.uri)
        return refuse(Result::kInvalidArgument, "message {} is from {}, not from {}",
                      request.number, received.originator.uri, request.originator.uri);
    if ((received.told & bit(request.notice)) != 0)
        return refuse(Result::kWrongState, "this notice of message {} has been sent",
                      request.number);
    received.told |= bit(request.notice);
    if (received.sender < 0 || (received.wanted & bit(request.notice)) == 0)
        return 0;
    const PttMessageNotice told{
        received.sent_number, to_peer(received.reader, {}), received.message_id, request.notice, 0,
        received.originator};
    errands_.after(kNoticeTime, [this, sender = received.sender, told] { sink_(sender, told); });
    return 1;
}

} // namespace sim
