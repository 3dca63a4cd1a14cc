// SPDX-License-Identifier: Apache-2.0
#include "sim/ptt/files.hpp"

#include <algorithm>

namespace sim {

namespace {

using namespace std::chrono_literals;

constexpr auto kOfferTime = 300ms;
constexpr auto kPartyDecidesFile = 500ms;
constexpr auto kStepTime = 250ms;
constexpr auto kOfferPatience = 60s;
constexpr std::int32_t kSmallestStep = 128 * 1024;
constexpr std::int32_t kMostSteps = 16;

// What crosses, as RFC 5547 counts: from 1, both ends included.
struct Part {
    std::int32_t first;
    std::int32_t last;
};

Part part_of(const PttFileAttributes &attributes) {
    return {std::max(attributes.start, 1), attributes.end == 0 ? attributes.size : attributes.end};
}

} // namespace

PttFiles::PttFiles(const PttDirectory &directory, PttCalls &calls, Timers &timers,
                   const Registrations &registrations, PttCalls::Sink sink)
    : directory_(directory), calls_(calls), timers_(timers), registrations_(registrations),
      sink_(std::move(sink)), next_number_(directory.slots(), 1) {}

std::int32_t PttFiles::Transfer::bytes() const {
    const Part part = part_of(attributes);
    return part.last - part.first + 1;
}

std::optional<Refusal> PttFiles::bad_attributes(const PttFileAttributes &attributes) const {
    if (attributes.name.empty())
        return refuse(Result::kInvalidArgument, "the attributes name no file");
    const Part part = part_of(attributes);
    // Of an empty file the first byte is past the last.
    const bool possible = attributes.start >= 0 && attributes.size >= 0 && part.last >= 0 &&
                          part.last <= attributes.size && part.first <= std::max(part.last, 1);
    if (!possible)
        return refuse(Result::kInvalidArgument, "{} to {} is no part of a file of {} bytes",
                      attributes.start, attributes.end, attributes.size);
    const auto same = [&](const auto &entry) {
        return entry.second.attributes.transfer_id == attributes.transfer_id;
    };
    if (std::ranges::any_of(transfers_, same))
        return refuse(Result::kDuplicate, "there is a transfer \"{}\"", attributes.transfer_id);
    return std::nullopt;
}

Answer<PttFileReceipt> PttFiles::offer(int slot, PttFileOffer offer) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    if (auto refusal = directory_.not_oneself(slot, offer.originator))
        return *refusal;
    if (auto refusal = bad_attributes(offer.attributes))
        return *refusal;
    if (offer.session != 0 && !offer.targets.empty())
        return refuse(Result::kInvalidArgument,
                      "a file goes to a session or to targets, and both are there");
    const auto contacts = offer.session == 0 ? directory_.resolve(slot, offer.targets)
                                             : calls_.others(slot, offer.session, kPttFiles);
    if (!contacts)
        return contacts.refusal();
    if (contacts->empty())
        return refuse(Result::kWrongState, "nobody else takes part in session {}", offer.session);
    const int id = next_transfer_++;
    Transfer &transfer = transfers_[id];
    transfer.sender = slot;
    transfer.number = next_number_[slot]++;
    transfer.originator = to_peer(calls_.uri_in(slot, offer.session), {});
    transfer.attributes = std::move(offer.attributes);
    if (transfer.attributes.transfer_id.empty())
        transfer.attributes.transfer_id = fmt::format("transfer-{}", id);
    std::int32_t party = 0;
    for (const auto &contact : *contacts) {
        Leg &leg = transfer.legs[++party];
        leg.to = contact;
        leg.timer = timers_.after(kOfferTime, [this, ref = LegRef{id, party}] { present(ref); });
    }
    return PttFileReceipt{transfer.number, party};
}

PttFiles::Leg *PttFiles::find(LegRef ref) {
    const auto transfer = transfers_.find(ref.transfer);
    if (transfer == transfers_.end())
        return nullptr;
    const auto leg = transfer->second.legs.find(ref.party);
    return leg == transfer->second.legs.end() ? nullptr : &leg->second;
}

void PttFiles::present(LegRef ref) {
    if (find(ref)->to.slot >= 0)
        present_to_slot(ref);
    else
        present_to_party(ref);
}

void PttFiles::present_to_slot(LegRef ref) {
    Leg &leg = *find(ref);
    const Transfer &transfer = transfers_.at(ref.transfer);
    if (!registrations_.registered(leg.to.slot))
        return finish(ref, PttFileEnd::kUnreachable, PttFileEnd::kUnreachable);
    leg.number = next_number_[leg.to.slot]++;
    sink_(leg.to.slot, PttIncomingFile{leg.number, transfer.originator, transfer.attributes,
                                       leg.to.session, to_peer(leg.to.uri, leg.to.display_name)});
    expect_answer(ref);
}

void PttFiles::expect_answer(LegRef ref) {
    find(ref)->timer = timers_.after_unscaled(
        kOfferPatience, [this, ref] { finish(ref, PttFileEnd::kNoAnswer, PttFileEnd::kNoAnswer); });
}

void PttFiles::present_to_party(LegRef ref) {
    Leg &leg = *find(ref);
    const auto end_with = [&](PttFileEnd why) {
        leg.timer = timers_.after(kPartyDecidesFile, [this, ref, why] { finish(ref, why, why); });
    };
    switch (leg.to.party->welcome) {
    case PttWelcome::kTakes:
        leg.timer = timers_.after(kPartyDecidesFile, [this, ref] { run(ref); });
        return;
    case PttWelcome::kBusy:
    case PttWelcome::kDeclines:
        return end_with(PttFileEnd::kRejected);
    case PttWelcome::kNeverAnswers:
        return expect_answer(ref);
    case PttWelcome::kNobody:
        return end_with(PttFileEnd::kUnreachable);
    case PttWelcome::kFails:
        return end_with(PttFileEnd::kNetworkFailure);
    }
}

Answer<PttFiles::LegRef> PttFiles::offered(int slot, std::int32_t session,
                                           const std::string &transfer_id) const {
    for (const auto &[id, transfer] : transfers_)
        for (const auto &[party, leg] : transfer.legs) {
            if (leg.to.slot != slot || leg.number == 0 || leg.to.session != session ||
                transfer.attributes.transfer_id != transfer_id)
                continue;
            if (leg.running)
                return refuse(Result::kWrongState, "transfer \"{}\" has been accepted",
                              transfer_id);
            return LegRef{id, party};
        }
    return refuse(Result::kUnknownRecord, "nobody has offered transfer \"{}\" in session {}",
                  transfer_id, session);
}

Answer<PttFileReceipt> PttFiles::accept(int slot, std::int32_t session,
                                        const std::string &transfer_id) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    const auto ref = offered(slot, session, transfer_id);
    if (!ref)
        return ref.refusal();
    run(*ref);
    return PttFileReceipt{find(*ref)->number, transfers_.at(ref->transfer).bytes()};
}

Answer<PttFileReceipt> PttFiles::reject(int slot, std::int32_t session,
                                        const std::string &transfer_id) {
    if (auto refusal = registrations_.radio_off(slot))
        return *refusal;
    const auto ref = offered(slot, session, transfer_id);
    if (!ref)
        return ref.refusal();
    const PttFileReceipt receipt{find(*ref)->number, transfers_.at(ref->transfer).bytes()};
    finish(*ref, PttFileEnd::kRejected, PttFileEnd::kRejected);
    return receipt;
}

Answer<PttFileReceipt> PttFiles::cancel(int slot, std::int32_t number) {
    std::vector<LegRef> cancelled;
    bool sent = false;
    for (const auto &[id, transfer] : transfers_)
        for (const auto &[party, leg] : transfer.legs) {
            const bool sends = transfer.sender == slot && transfer.number == number;
            if (!sends && (leg.to.slot != slot || leg.number != number))
                continue;
            if (!sends && !leg.running)
                return refuse(Result::kWrongState, "transfer {} has not been accepted: reject it",
                              number);
            sent = sends;
            cancelled.push_back({id, party});
        }
    if (cancelled.empty())
        return refuse(Result::kUnknownRecord, "slot {} has no transfer {}", slot, number);
    const auto to_sender = sent ? PttFileEnd::kCancelledHere : PttFileEnd::kCancelledByPeer;
    const auto to_receiver = sent ? PttFileEnd::kCancelledByPeer : PttFileEnd::kCancelledHere;
    for (const LegRef ref : cancelled)
        finish(ref, to_sender, to_receiver);
    return PttFileReceipt{number, static_cast<std::int32_t>(cancelled.size())};
}

void PttFiles::run(LegRef ref) {
    Leg &leg = *find(ref);
    leg.running = true;
    leg.timer = timers_.after(kStepTime, [this, ref] { step(ref); });
}

void PttFiles::step(LegRef ref) {
    Leg &leg = *find(ref);
    const Transfer &transfer = transfers_.at(ref.transfer);
    const std::int32_t total = transfer.bytes();
    const std::int32_t part = std::max(kSmallestStep, total / kMostSteps + 1);
    leg.done = total - leg.done > part ? leg.done + part : total;
    sink_(transfer.sender, PttFileProgress{transfer.number, leg.done, total, ref.party});
    if (leg.number != 0)
        sink_(leg.to.slot, PttFileProgress{leg.number, leg.done, total, 0});
    if (leg.done == total)
        finish(ref, PttFileEnd::kComplete, PttFileEnd::kComplete);
    else
        leg.timer = timers_.after(kStepTime, [this, ref] { step(ref); });
}

void PttFiles::finish(LegRef ref, PttFileEnd to_sender, PttFileEnd to_receiver) {
    Transfer &transfer = transfers_.at(ref.transfer);
    const auto node = transfer.legs.extract(ref.party);
    const Leg &leg = node.mapped();
    sink_(transfer.sender, PttFileTerminated{transfer.number, to_sender, ref.party});
    if (leg.number != 0)
        sink_(leg.to.slot, PttFileTerminated{leg.number, to_receiver, 0});
    if (transfer.legs.empty())
        transfers_.erase(ref.transfer);
}

void PttFiles::drop_transfers(int slot) {
    std::vector<LegRef> lost;
    for (const auto &[id, transfer] : transfers_)
        for (const auto &[party, leg] : transfer.legs)
            if (transfer.sender == slot || (leg.to.slot == slot && leg.number != 0))
                lost.push_back({id, party});
    for (const LegRef ref : lost)
        finish(ref, PttFileEnd::kNetworkFailure, PttFileEnd::kNetworkFailure);
}

} // namespace sim
