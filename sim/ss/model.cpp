// SPDX-License-Identifier: Apache-2.0
#include "sim/ss/model.hpp"

#include <algorithm>
#include <numeric>

namespace sim {

namespace {

constexpr std::string_view kBarringPassword = "0000";
constexpr std::int32_t kShortestNoReply = 5;
constexpr std::int32_t kLongestNoReply = 30;
constexpr std::int32_t kDefaultNoReply = 20;
constexpr ServiceClass kClasses[] = {ServiceClass::kVoice, ServiceClass::kVideo};

// Positions in the tables that a request means: one, or several at once. None when there is no
// such value.
using Positions = std::vector<std::size_t>;

Positions range(std::size_t first, std::size_t last) {
    Positions positions(last - first + 1);
    std::iota(positions.begin(), positions.end(), first);
    return positions;
}

Positions classes_of(ServiceClass service) {
    const auto value = static_cast<std::int32_t>(service);
    if (value < 0 || value > static_cast<std::int32_t>(ServiceClass::kBoth))
        return {};
    return value == 0 || service == ServiceClass::kBoth
               ? range(0, 1)
               : Positions{static_cast<std::size_t>(value - 1)};
}

Positions conditions_of(ForwardCondition condition) {
    if (condition < ForwardCondition::kUnconditional ||
        condition > ForwardCondition::kAllConditional)
        return {};
    if (condition == ForwardCondition::kAll)
        return range(0, 3);
    if (condition == ForwardCondition::kAllConditional)
        return range(1, 3);
    return Positions{static_cast<std::size_t>(condition)};
}

Positions barrings_of(BarringType type) {
    if (type < BarringType::kAllOutgoing || type > BarringType::kAll)
        return {};
    return type == BarringType::kAll ? range(0, 4) : Positions{static_cast<std::size_t>(type)};
}

Refusal bad_condition(ForwardCondition condition) {
    return refuse(Result::kInvalidArgument,
                  "a condition is 0 (unconditional), 1 (busy), 2 (no reply), 3 (not reachable), 4 "
                  "(all) or 5 (all but unconditional), not {}",
                  static_cast<std::int32_t>(condition));
}

Refusal bad_barring_type(BarringType type) {
    return refuse(Result::kInvalidArgument,
                  "a barring type is 0 (outgoing), 1 (international), 2 (international except "
                  "home), 3 (incoming), 4 (incoming when roaming) or 5 (all), not {}",
                  static_cast<std::int32_t>(type));
}

// ITU-T E.164: codes of one digit (1, 7), of two, and all others of three.
std::string_view country_code(std::string_view number) {
    constexpr std::string_view kTwoDigits[] = {
        "20", "27", "30", "31", "32", "33", "34", "36", "39", "40", "41", "43", "44", "45", "46",
        "47", "48", "49", "51", "52", "53", "54", "55", "56", "57", "58", "60", "61", "62", "63",
        "64", "65", "66", "81", "82", "84", "86", "90", "91", "92", "93", "94", "95", "98"};
    if (!number.starts_with('+'))
        return {};
    const auto digits = number.substr(1);
    if (digits.starts_with('1') || digits.starts_with('7'))
        return digits.substr(0, 1);
    const bool two = std::ranges::find(kTwoDigits, digits.substr(0, 2)) != std::end(kTwoDigits);
    return digits.substr(0, two ? 2 : 3);
}

// Both numbers say their country, and it is not the same.
bool is_international(std::string_view called, std::string_view own) {
    const auto there = country_code(called);
    const auto here = country_code(own);
    return !there.empty() && !here.empty() && there != here;
}

std::string_view name_of(CallType type) {
    return type == CallType::kVideo ? "video" : "voice";
}

} // namespace

SupplementaryServices::SupplementaryServices(const NumberPlan &plan,
                                             const Registrations &registrations)
    : plan_(plan), registrations_(registrations), slots_(plan.slots()) {}

const SupplementaryServices::Services &SupplementaryServices::services(int slot,
                                                                       CallType type) const {
    return slots_[slot][type == CallType::kVideo ? 1 : 0];
}

std::optional<Refusal> SupplementaryServices::bad_query(int slot, ServiceClass service) const {
    if (auto refusal = registrations_.radio_off(slot))
        return refusal;
    if (classes_of(service).empty())
        return refuse(Result::kInvalidArgument,
                      "a class is 1 (voice), 2 (video), 3 or 0 (both), "
                      "not {}",
                      static_cast<std::int32_t>(service));
    return std::nullopt;
}

std::optional<Refusal> SupplementaryServices::bad_change(int slot, ServiceClass service,
                                                         std::int32_t status) const {
    if (auto refusal = bad_query(slot, service))
        return refusal;
    if (status != 0 && status != 1)
        return refuse(Result::kInvalidArgument, "a status is 0 (off) or 1 (on), not {}", status);
    return std::nullopt;
}

Status SupplementaryServices::set_waiting(int slot, const WaitingEntry &wanted) {
    if (auto refusal = bad_change(slot, wanted.service, wanted.status))
        return *refusal;
    for (const auto position : classes_of(wanted.service))
        slots_[slot][position].waiting = wanted.status == 1;
    return Done{};
}

Answer<std::vector<WaitingEntry>> SupplementaryServices::waiting(int slot,
                                                                 ServiceClass service) const {
    if (auto refusal = bad_query(slot, service))
        return *refusal;
    std::vector<WaitingEntry> entries;
    for (const auto position : classes_of(service))
        entries.push_back({kClasses[position], slots_[slot][position].waiting ? 1 : 0});
    return entries;
}

Answer<SupplementaryServices::Forwarding>
SupplementaryServices::to_forwarding(int slot, const ForwardingEntry &wanted) const {
    if (wanted.uri_length < 0 || static_cast<std::size_t>(wanted.uri_length) != wanted.uri.size())
        return refuse(Result::kInvalidArgument, "the length says {}, and the uri has {} bytes",
                      wanted.uri_length, wanted.uri.size());
    const std::int32_t time = wanted.no_reply_time == 0 ? kDefaultNoReply : wanted.no_reply_time;
    const bool timed = wanted.condition == ForwardCondition::kNoReply ||
                       wanted.condition > ForwardCondition::kNotReachable;
    if (timed && (time < kShortestNoReply || time > kLongestNoReply || time % 5 != 0))
        return refuse(Result::kInvalidArgument,
                      "a time is {} to {} seconds in steps of 5, or 0 for {}, not {}",
                      kShortestNoReply, kLongestNoReply, kDefaultNoReply, time);
    Forwarding forwarding{wanted.status == 1, time, wanted.uri_type, wanted.uri, {}};
    if (wanted.uri.empty())
        return forwarding;
    const auto type = wanted.uri.starts_with("sip:") ? UriType::kSip : UriType::kNumber;
    if (type != wanted.uri_type)
        return refuse(Result::kInvalidArgument,
                      "\"{}\" is of uri type {} (0 number or tel:, 1 sip:), not {}", wanted.uri,
                      static_cast<std::int32_t>(type), static_cast<std::int32_t>(wanted.uri_type));
    const auto number = parse_number(wanted.uri);
    if (!number)
        return number.refusal();
    if (is_emergency(*number) || same_number(*number, plan_.number_of(slot)))
        return refuse(Result::kInvalidArgument, "calls of slot {} cannot be forwarded to {}", slot,
                      *number);
    forwarding.number = *number;
    return forwarding;
}

Status SupplementaryServices::set_forwarding(int slot, const ForwardingEntry &wanted) {
    if (auto refusal = bad_change(slot, wanted.service, wanted.status))
        return *refusal;
    const auto conditions = conditions_of(wanted.condition);
    if (conditions.empty())
        return bad_condition(wanted.condition);
    const auto forwarding = to_forwarding(slot, wanted);
    if (!forwarding)
        return forwarding.refusal();

    std::vector<Forwarding *> places;
    for (const auto position : classes_of(wanted.service))
        for (const auto condition : conditions)
            places.push_back(&slots_[slot][position].forwarding[condition]);
    const bool keeps = !forwarding->active || forwarding->uri.empty();
    if (forwarding->active && keeps &&
        std::ranges::any_of(places, [](const auto *place) { return place->uri.empty(); }))
        return refuse(Result::kInvalidArgument, "there is no uri to forward to, and none is kept");
    for (Forwarding *place : places)
        if (keeps)
            place->active = forwarding->active;
        else
            *place = *forwarding;
    return Done{};
}

Answer<std::vector<ForwardingEntry>>
SupplementaryServices::forwarding(int slot, ServiceClass service,
                                  ForwardCondition condition) const {
    if (auto refusal = bad_query(slot, service))
        return *refusal;
    const auto conditions = conditions_of(condition);
    if (conditions.empty())
        return bad_condition(condition);
    std::vector<ForwardingEntry> entries;
    for (const auto position : classes_of(service))
        for (const auto index : conditions) {
            const auto &place = slots_[slot][position].forwarding[index];
            const auto which = static_cast<ForwardCondition>(index);
            const bool timed = which == ForwardCondition::kNoReply;
            entries.push_back(
                {kClasses[position], place.active ? 1 : 0, which, timed ? place.no_reply_time : 0,
                 static_cast<std::int32_t>(place.uri.size()), place.uri_type, place.uri});
        }
    return entries;
}

Status SupplementaryServices::set_barring(int slot, const BarringEntry &wanted,
                                          std::string_view password) {
    if (auto refusal = bad_change(slot, wanted.service, wanted.status))
        return *refusal;
    const auto types = barrings_of(wanted.type);
    if (types.empty())
        return bad_barring_type(wanted.type);
    if (wanted.type == BarringType::kAll && wanted.status == 1)
        return refuse(Result::kInvalidArgument, "type 5 (all) can only be switched off");
    if (password != kBarringPassword)
        return refuse(Result::kWrongPassword, "that is not the barring password");
    for (const auto position : classes_of(wanted.service))
        for (const auto type : types)
            slots_[slot][position].barring[type] = wanted.status == 1;
    return Done{};
}

Answer<std::vector<BarringEntry>> SupplementaryServices::barring(int slot, ServiceClass service,
                                                                 BarringType type) const {
    if (auto refusal = bad_query(slot, service))
        return *refusal;
    const auto types = barrings_of(type);
    if (types.empty())
        return bad_barring_type(type);
    std::vector<BarringEntry> entries;
    for (const auto position : classes_of(service))
        for (const auto index : types)
            entries.push_back({kClasses[position], slots_[slot][position].barring[index] ? 1 : 0,
                               static_cast<BarringType>(index)});
    return entries;
}

bool SupplementaryServices::may_wait(int slot, CallType type) const {
    return services(slot, type).waiting;
}

std::optional<Refusal> SupplementaryServices::bars_outgoing(int slot, std::string_view number,
                                                            CallType type) const {
    const auto &bars = services(slot, type).barring;
    const auto barred = [&](BarringType which) { return bars[static_cast<std::size_t>(which)]; };
    if (barred(BarringType::kAllOutgoing))
        return refuse(Result::kBarred, "outgoing {} calls of slot {} are barred", name_of(type),
                      slot);
    if ((barred(BarringType::kInternational) || barred(BarringType::kInternationalExceptHome)) &&
        is_international(number, plan_.number_of(slot)))
        return refuse(Result::kBarred, "international {} calls of slot {} are barred",
                      name_of(type), slot);
    return std::nullopt;
}

bool SupplementaryServices::bars_incoming(int slot, CallType type) const {
    return services(slot, type).barring[static_cast<std::size_t>(BarringType::kAllIncoming)];
}

std::optional<std::string>
SupplementaryServices::forward_target(int slot, ForwardCondition condition, CallType type) const {
    const auto &place = services(slot, type).forwarding[static_cast<std::size_t>(condition)];
    return place.active ? std::optional(place.number) : std::nullopt;
}

std::optional<std::chrono::seconds> SupplementaryServices::no_reply_time(int slot,
                                                                         CallType type) const {
    const auto &place =
        services(slot, type).forwarding[static_cast<std::size_t>(ForwardCondition::kNoReply)];
    return place.active ? std::optional(std::chrono::seconds(place.no_reply_time)) : std::nullopt;
}

} // namespace sim
