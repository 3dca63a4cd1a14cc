// SPDX-License-Identifier: Apache-2.0
// Calls to groups that are made for them.
#include "sim/ptt/model.hpp"

#include "sim/ptt/media.hpp"

#include <algorithm>

namespace sim {

namespace {

constexpr std::size_t kMostParticipants = 16;

std::string escaped(std::string_view text) {
    std::string xml;
    for (const char letter : text) {
        switch (letter) {
        case '&':
            xml += "&amp;";
            break;
        case '<':
            xml += "&lt;";
            break;
        case '"':
            xml += "&quot;";
            break;
        default:
            xml += letter;
        }
    }
    return xml;
}

// The participants as RFC 4826 lists them.
PttContent resource_list(const PttCall &call) {
    std::string xml = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                      "<resource-lists xmlns=\"urn:ietf:params:xml:ns:resource-lists\"><list>";
    for (const auto &[who, participant] : call.participants)
        xml += fmt::format("<entry uri=\"{}\"/>", escaped(participant.uri()));
    return {xml + "</list></resource-lists>", "application/resource-lists+xml", "recipient-list"};
}

} // namespace

Answer<std::vector<PttContact>> PttCalls::contacts_of(int slot,
                                                      const std::vector<PttUser> &users) const {
    std::vector<PttContact> contacts;
    for (const auto &user : users) {
        const auto meant = directory_.resolve(slot, {user.peer});
        if (!meant)
            return meant.refusal();
        for (PttContact contact : *meant) {
            if (std::ranges::find(contacts, contact.uri, &PttContact::uri) != contacts.end())
                return refuse(Result::kInvalidArgument, "{} is named twice", contact.uri);
            contact.anonymous = user.anonymous;
            contacts.push_back(std::move(contact));
        }
    }
    if (contacts.size() >= kMostParticipants)
        return refuse(Result::kTooMany, "a call has at most {} participants", kMostParticipants);
    return contacts;
}

Answer<std::int32_t> PttCalls::make_ad_hoc_call(int slot, const PttAdHocRequest &request) {
    if (auto refusal = cannot_place(slot, request.offer))
        return *refusal;
    if (request.users.empty())
        return refuse(Result::kInvalidArgument, "nobody is to be called");
    const auto contacts = contacts_of(slot, request.users);
    if (!contacts)
        return contacts.refusal();
    PttCall &call = add_call(slot, PttCallType::kAdHoc, request.offer);
    call.uri = fmt::format("sip:adhoc-{}@{}", next_ad_hoc_++, PttDirectory::kGroupHost);
    call.name = request.subject;
    for (const auto &contact : *contacts)
        add_participant(call, contact);
    return call.participants.at(call.owner).session;
}

Answer<PttSessions::Place> PttCalls::owned_ad_hoc(int slot, std::int32_t session) {
    auto place = sessions_.connected(slot, session);
    if (!place)
        return place;
    if (place->call.type != PttCallType::kAdHoc)
        return refuse(Result::kWrongState, "session {} is no call to an ad hoc group", session);
    if (place->call.owner != place->self.ref.who)
        return refuse(Result::kWrongState, "session {} was not placed here", session);
    return place;
}

Status PttCalls::add_users(int slot, const PttAddRequest &request) {
    const auto place = owned_ad_hoc(slot, request.session);
    if (!place)
        return place.refusal();
    auto &[call, self] = *place;
    if (auto refusal = bad_seconds(request.answer_time, "the time to answer"))
        return *refusal;
    const auto contacts = contacts_of(slot, request.users);
    if (!contacts)
        return contacts.refusal();
    if (call.participants.size() + contacts->size() > kMostParticipants)
        return refuse(Result::kTooMany, "a call has at most {} participants", kMostParticipants);
    for (const auto &[who, participant] : call.participants)
        if (std::ranges::find(*contacts, participant.contact.uri, &PttContact::uri) !=
            contacts->end())
            return refuse(Result::kInvalidArgument, "{} takes part or is being asked to",
                          participant.contact.uri);
    for (const auto &contact : *contacts) {
        PttParticipant &added = add_participant(call, contact);
        added.automatic = request.automatic;
        if (request.answer_time != 0)
            added.answer_time = std::chrono::seconds(request.answer_time);
        added.contents = request.contents;
        added.step = timers_.after(kRouteTime, [this, ref = added.ref] { invite(ref); });
    }
    return Done{};
}

Status PttCalls::remove_users(int slot, std::int32_t session, const std::vector<PttPeer> &users) {
    const auto place = owned_ad_hoc(slot, session);
    if (!place)
        return place.refusal();
    const auto contacts = directory_.resolve(slot, users);
    if (!contacts)
        return contacts.refusal();
    std::vector<PttRef> removed;
    for (const auto &contact : *contacts) {
        const auto found = std::ranges::find_if(place->call.participants, [&](const auto &entry) {
            return entry.second.contact.uri == contact.uri;
        });
        if (found == place->call.participants.end())
            return refuse(Result::kInvalidArgument, "{} does not take part in session {}",
                          contact.uri, session);
        removed.push_back(found->second.ref);
    }
    for (const PttRef ref : removed)
        leave(ref, PttEndReason::kRemoved, PttEndReason::kRemoved);
    return Done{};
}

PttGroupAdvertisement PttCalls::advertisement_of(const PttCall &call,
                                                 const PttParticipant &invited) const {
    PttGroupAdvertisement advertisement;
    advertisement.subject = call.name;
    advertisement.call_info = call.uri;
    const auto owner = call.participants.find(call.owner);
    if (owner != call.participants.end())
        advertisement.remote = to_peer(owner->second.uri(), owner->second.name());
    advertisement.contents = {resource_list(call)};
    advertisement.contents.insert(advertisement.contents.end(), invited.contents.begin(),
                                  invited.contents.end());
    return advertisement;
}

void PttCalls::advertise(int slot, PttGroupAdvertisement advertisement) {
    advertisement.number = sessions_[slot].next_advertisement++;
    sessions_.emit(slot, advertisement);
}

} // namespace sim
