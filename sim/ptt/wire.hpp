// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/result.hpp"
#include "sim/bus/form.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/model.hpp"
#include "sim/ptt/recorder.hpp"

#include <cstdint>
#include <string_view>
#include <vector>

// Push-to-talk's values inside variants: dictionaries whose integers are 64-bit, lists of them,
// sets of four. What comes in is refused when it is anything else, or holds keys that do not exist.
namespace sim::ptt_wire {

// A member of a tuple: its content, in however many variants.
Answer<FourIntegers> four_integers(const Variant &content);
Answer<std::vector<std::int32_t>> integers(const Variant &content);
Answer<PttPeer> peer(const Variant &content);
Answer<std::vector<PttPeer>> peers(const Variant &content);
// Their uris and names alone.
Answer<std::vector<PttPeer>> names(const Variant &content);
Answer<std::vector<PttUser>> users(const Variant &content, std::int32_t count);
// None when the dictionary is empty.
Answer<std::vector<PttContent>> contents(const Variant &content);
Answer<PttFileAttributes> attributes(const Variant &content);

Variant peer(const PttPeer &peer);
Variant route(const std::vector<PttPeer> &parties);
Variant attributes(const PttFileAttributes &attributes);
Variant recording(const PttRecordingInfo &info);
Variant floor_status(const std::vector<PttFloorStatus> &statuses);
Variant advertisement(const PttGroupAdvertisement &advertisement);

} // namespace sim::ptt_wire

// How these values travel as members of a tuple: in a variant, unless it is said otherwise.
namespace sim::wire {

inline GVariant *carried(const Variant &content) {
    return g_variant_new_variant(content.get());
}

template <>
struct Form<FourIntegers> {
    static constexpr std::string_view kSignature = "v";
    static Answer<FourIntegers> read(const Variant &member) {
        return ptt_wire::four_integers(member);
    }
    static void write(Tuple &tuple, const FourIntegers &set) { tuple.put(wire::write(set)); }
};

template <>
struct Form<PttPeer> {
    static constexpr std::string_view kSignature = "v";
    static Answer<PttPeer> read(const Variant &member) { return ptt_wire::peer(member); }
    static void write(Tuple &tuple, const PttPeer &peer) {
        tuple.put(carried(ptt_wire::peer(peer)));
    }
};

// What a slot names are targets, what it is told is a route.
template <>
struct Form<std::vector<PttPeer>> {
    static constexpr std::string_view kSignature = "v";
    static Answer<std::vector<PttPeer>> read(const Variant &member) {
        return ptt_wire::peers(member);
    }
    static void write(Tuple &tuple, const std::vector<PttPeer> &parties) {
        tuple.put(carried(ptt_wire::route(parties)));
    }
};

template <>
struct Form<PttFileAttributes> {
    static constexpr std::string_view kSignature = "v";
    static Answer<PttFileAttributes> read(const Variant &member) {
        return ptt_wire::attributes(member);
    }
    static void write(Tuple &tuple, const PttFileAttributes &attributes) {
        tuple.put(carried(ptt_wire::attributes(attributes)));
    }
};

template <>
struct Form<PttRecordingInfo> {
    static constexpr std::string_view kSignature = "a{sv}";
    static void write(Tuple &tuple, const PttRecordingInfo &info) {
        tuple.put(ptt_wire::recording(info).get());
    }
};

template <>
struct Form<std::vector<PttFloorStatus>> {
    static constexpr std::string_view kSignature = "aa{sv}";
    static void write(Tuple &tuple, const std::vector<PttFloorStatus> &statuses) {
        tuple.put(ptt_wire::floor_status(statuses).get());
    }
};

} // namespace sim::wire
