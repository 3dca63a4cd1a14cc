// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/model.hpp"
#include "sim/ptt/recorder.hpp"

#include <cstdint>
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
// As the "v" member of a tuple.
inline Variant carried(const Variant &content) {
    return Variant(g_variant_new_variant(content.get()));
}

} // namespace sim::ptt_wire
