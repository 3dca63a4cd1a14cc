// SPDX-License-Identifier: Apache-2.0
#include "sim/sms/service_centre.hpp"

#include <algorithm>
#include <utility>
#include <vector>

namespace sim {

namespace {

using namespace std::chrono_literals;

constexpr auto kAcknowledgeTime = 300ms;
constexpr auto kForwardTime = 200ms;
constexpr auto kPartyTime = 500ms;
constexpr auto kStatusReportTime = 200ms;
constexpr auto kEchoTime = 1s;
constexpr auto kReportTime = 30s;
constexpr auto kDefaultLifetime = std::chrono::hours(48);

constexpr SubmitRefusal kDuplicate{21, 0xC5, false};
constexpr SubmitRefusal kOutOfOrder{38, 0xFF, true};

constexpr std::int32_t kMaxCause = 127;

std::optional<Refusal> wrong_length(std::int32_t length, std::size_t octets) {
    if (length >= 0 && static_cast<std::size_t>(length) == octets)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "the length says {}, and the TPDU has {} octets",
                  length, octets);
}

std::optional<Refusal> bad_service_centre(const tpdu::Octets &octets) {
    // Nothing at all is what a client without an address sends.
    if (octets.empty())
        return std::nullopt;
    if (const auto address = tpdu::decode_service_centre(octets); !address)
        return refuse(Result::kInvalidArgument, "the service centre's address is malformed: {}",
                      address.error().message);
    return std::nullopt;
}

std::optional<Refusal> bad_validity(const tpdu::Validity &validity) {
    const auto *end = std::get_if<tpdu::Timestamp>(&validity);
    if (!end || tpdu::is_valid(*end))
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "the validity ends at {}, which is no date and time",
                  tpdu::to_text(*end));
}

bool single_shot(const tpdu::Validity &validity) {
    const auto *enhanced = std::get_if<tpdu::EnhancedValidity>(&validity);
    return enhanced && enhanced->single_shot;
}

} // namespace

ServiceCentre::ServiceCentre(const NumberPlan &plan, Timers &timers,
                             const Registrations &registrations, std::int64_t epoch, Sink sink)
    : plan_(plan), timers_(timers), registrations_(registrations), epoch_(epoch),
      sink_(std::move(sink)), next_sent_(plan.slots(), 1), boxes_(plan.slots()), errands_(timers) {}

std::int64_t ServiceCentre::now_in_seconds() const {
    // The end of what a TPDU can say; a network that is fast enough gets there.
    constexpr std::int64_t kLatest = 4102444799;
    const double seconds = static_cast<double>(epoch_) + timers_.network_time().count();
    return seconds < static_cast<double>(kLatest) ? static_cast<std::int64_t>(seconds) : kLatest;
}

tpdu::Timestamp ServiceCentre::now() const {
    const auto time = tpdu::timestamp_from_unix(now_in_seconds());
    return time ? *time : tpdu::Timestamp{};
}

Answer<SubmitReceipt> ServiceCentre::submit(int slot, const SubmitRequest &request) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (auto refusal = wrong_length(request.length, request.tpdu.size()))
        return *refusal;
    if (auto refusal = bad_service_centre(request.service_centre))
        return *refusal;
    if (request.option != 0 && request.option != 1)
        return refuse(Result::kInvalidArgument,
                      "an option is 0, or 1 when more messages follow, not {}", request.option);
    const auto submit = tpdu::decode_submit(request.tpdu);
    if (!submit)
        return refuse(Result::kInvalidArgument, "this is no SMS-SUBMIT: {}",
                      submit.error().message);
    if (auto refusal = bad_validity(submit->validity))
        return *refusal;
    if (auto refusal = not_deliverable(slot, *submit))
        return *refusal;
    const Id id = next_id_++;
    Message &message = held_[id];
    message.id = id;
    message.sender = slot;
    message.number = next_sent_[slot]++;
    message.submit = *submit;
    message.more_follow = request.option == 1;
    message.taken = now();
    message.step = timers_.after(kAcknowledgeTime, [this, id] { acknowledge(id); });
    return SubmitReceipt{message.number, submit->message_reference};
}

// What the codec reads it does not always write: reserved values, for one.
std::optional<Refusal> ServiceCentre::not_deliverable(int slot, const tpdu::Submit &submit) const {
    const auto check = [](const tpdu::Result<tpdu::Octets> &octets) -> std::optional<Refusal> {
        if (octets)
            return std::nullopt;
        return refuse(Result::kInvalidArgument, "the message cannot be delivered: {}",
                      octets.error().message);
    };
    if (auto refusal = check(tpdu::encode(to_deliver(slot, submit, now()))))
        return refusal;
    tpdu::StatusReport report;
    report.recipient = submit.destination;
    return check(tpdu::encode(report));
}

tpdu::Deliver ServiceCentre::to_deliver(int sender, const tpdu::Submit &submit,
                                        tpdu::Timestamp taken) const {
    tpdu::Deliver deliver;
    deliver.status_report_indication = submit.status_report_request;
    deliver.reply_path = submit.reply_path;
    if (auto originator = tpdu::number_address(plan_.number_of(sender)))
        deliver.originator = *originator;
    deliver.protocol_identifier = submit.protocol_identifier;
    deliver.data_coding = submit.data_coding;
    deliver.service_centre_time = taken;
    deliver.user_data = submit.user_data;
    return deliver;
}

bool ServiceCentre::is_duplicate(const Message &message) const {
    return message.submit.reject_duplicates && std::ranges::any_of(held_, [&](const auto &entry) {
               const Message &other = entry.second;
               return other.accepted && other.sender == message.sender &&
                      other.submit.message_reference == message.submit.message_reference &&
                      other.submit.destination == message.submit.destination;
           });
}

void ServiceCentre::acknowledge(Id id) {
    Message &message = held_.at(id);
    if (registrations_.radio_off(message.sender))
        return refuse_message(id, kOutOfOrder);
    if (is_duplicate(message))
        return refuse_message(id, kDuplicate);
    const auto number = parse_number(tpdu::to_text(message.submit.destination));
    if (number && plan_.slot_of(*number))
        return accept(message, nullptr);
    const MessageParty &party = number ? message_party_at(*number) : message_nobody();
    if (party.fate == MessageFate::kRefusedByCentre)
        return refuse_message(id, party.refusal);
    accept(message, &party);
}

void ServiceCentre::refuse_message(Id id, const SubmitRefusal &refusal) {
    const auto node = held_.extract(id);
    const Message &message = node.mapped();
    const tpdu::SubmitReport report{refusal.failure_cause, message.taken, {}};
    sink_(message.sender,
          SendSmsAck{message.number, refusal.cause, message.submit.message_reference,
                     tpdu::encode(report).value(), refusal.try_again});
}

void ServiceCentre::accept(Message &message, const MessageParty *party) {
    message.accepted = true;
    const tpdu::SubmitReport report{std::nullopt, message.taken, {}};
    sink_(message.sender, SendSmsAck{message.number, 0, message.submit.message_reference,
                                     tpdu::encode(report).value(), false});
    const auto lifetime = tpdu::lifetime(message.submit.validity, now_in_seconds());
    message.expiry = timers_.after_waiting(lifetime ? *lifetime : kDefaultLifetime,
                                           [this, id = message.id] { expire(id); });
    if (party)
        message.step = timers_.after(
            kPartyTime, [this, id = message.id, party] { forward_to_party(id, *party); });
    else
        message.step = timers_.after(kForwardTime, [this, id = message.id] {
            const auto number = parse_number(tpdu::to_text(held_.at(id).submit.destination));
            forward_to_slot(id, *plan_.slot_of(*number));
        });
}

void ServiceCentre::forward_to_slot(Id id, int slot) {
    const Message &message = held_.at(id);
    if (!registrations_.registered(slot) && single_shot(message.submit.validity))
        return conclude(id, message_status::kNotObtainable);
    post(slot,
         {to_deliver(message.sender, message.submit, message.taken), id, message.more_follow, {}});
}

void ServiceCentre::forward_to_party(Id id, const MessageParty &party) {
    const Message &message = held_.at(id);
    switch (party.fate) {
    case MessageFate::kEchoed:
        echo(message);
        return conclude(id, message_status::kReceived);
    case MessageFate::kReceived:
        return conclude(id, message_status::kReceived);
    case MessageFate::kRefusedByParty:
        return conclude(id, message_status::kRejected);
    case MessageFate::kNeverReachable:
        if (single_shot(message.submit.validity))
            conclude(id, message_status::kNotObtainable);
        return; // until it expires
    case MessageFate::kRefusedByCentre:
        return; // never accepted
    }
}

void ServiceCentre::echo(const Message &message) {
    tpdu::Deliver deliver;
    deliver.originator = message.submit.destination;
    deliver.data_coding = message.submit.data_coding;
    deliver.user_data = message.submit.user_data;
    errands_.after(kEchoTime,
                   [this, slot = message.sender, deliver] { send_from_network(slot, deliver); });
}

void ServiceCentre::send_from_network(int slot, tpdu::Deliver message) {
    message.service_centre_time = now();
    post(slot, {std::move(message), std::nullopt, false, {}});
}

void ServiceCentre::expire(Id id) {
    for (auto &mailbox : boxes_) {
        // Once delivered, its fate is the receiver's to tell.
        if (mailbox.has_delivered(id))
            return;
        mailbox.discard_stored(id);
    }
    conclude(id, message_status::kExpired);
}

void ServiceCentre::conclude(Id id, std::uint8_t status) {
    const auto node = held_.extract(id);
    const Message &message = node.mapped();
    if (!message.submit.status_report_request)
        return;
    tpdu::StatusReport report;
    report.message_reference = message.submit.message_reference;
    report.recipient = message.submit.destination;
    report.service_centre_time = message.taken;
    report.discharge_time = now();
    report.status = status;
    errands_.after(kStatusReportTime, [this, slot = message.sender, report] {
        post(slot, {report, std::nullopt, false, {}});
    });
}

Answer<std::int32_t> ServiceCentre::report(int slot, const ReportRequest &request) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (request.code < 0 || request.code > kMaxCause)
        return refuse(Result::kInvalidArgument,
                      "a code is 0 (received) or a cause up to {}, not {}", kMaxCause,
                      request.code);
    if (auto refusal = wrong_length(request.length, request.tpdu.size()))
        return *refusal;
    const auto kind = request.code == 0 ? tpdu::ReportKind::kAck : tpdu::ReportKind::kError;
    if (!request.tpdu.empty())
        if (const auto decoded = tpdu::decode_deliver_report(request.tpdu, kind); !decoded)
            return refuse(Result::kInvalidArgument, "this is no SMS-DELIVER-REPORT of {}: {}",
                          request.code == 0 ? "success" : "failure", decoded.error().message);
    const auto found = boxes_[slot].take_delivered(request.option);
    if (!found)
        return request.option == 0 ? refuse(Result::kWrongState, "no message waits for a report")
                                   : refuse(Result::kWrongState, "no message {} waits for a report",
                                            request.option);
    const auto &[number, mail] = *found;
    sink_(slot, DeliveryReportAck{number, request.code});
    if (mail.message)
        conclude(*mail.message,
                 request.code == 0 ? message_status::kReceived : message_status::kErrorInDevice);
    return number;
}

void ServiceCentre::post(int slot, Mail mail) {
    if (registrations_.registered(slot))
        deliver(slot, std::move(mail));
    else
        boxes_[slot].store(std::move(mail));
}

void ServiceCentre::deliver(int slot, Mail mail) {
    Mailbox &box = boxes_[slot];
    const std::int32_t number = box.next_number();
    const bool more = mail.more_follow || box.stores_more();
    const auto octets = std::visit(
        [&](auto &content) {
            content.more_messages = more;
            return tpdu::encode(content).value();
        },
        mail.content);
    const auto kind =
        mail.is_status_report() ? IncomingKind::kStatusReport : IncomingKind::kMessage;
    mail.patience = timers_.after_unscaled(kReportTime, [this, slot, number] {
        const auto given_up = boxes_[slot].take_delivered(number);
        if (given_up->second.message)
            conclude(*given_up->second.message, message_status::kNoResponse);
    });
    box.await_report(number, std::move(mail));
    sink_(slot, IncomingSms{octets, number, kind});
}

void ServiceCentre::deliver_stored(int slot) {
    while (auto mail = boxes_[slot].take_stored())
        deliver(slot, *std::move(mail));
}

// The device may have lost what it has not reported on.
void ServiceCentre::take_back(int slot) {
    std::vector<Mail> again;
    for (Mail &mail : boxes_[slot].take_all_delivered()) {
        mail.patience.cancel();
        if (mail.is_status_report())
            continue;
        const bool expired = mail.message && !held_.at(*mail.message).expiry.pending();
        if (expired)
            conclude(*mail.message, message_status::kExpired);
        else
            again.push_back(std::move(mail));
    }
    boxes_[slot].store_first(std::move(again));
}

} // namespace sim
