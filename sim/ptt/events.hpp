// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/ptt/values.hpp"

#include <cstdint>
#include <string>
#include <variant>
#include <vector>

// What a slot is told about push-to-talk: one record a signal, members in the signal's order. The
// seven signals about the floor share one.
namespace sim {

struct PttCallIncoming {
    bool crisis = false;
    bool automatic = false; // it is answered without being asked
    bool takes_floor = false;
    bool group = false;
    std::string caller_uri;
    std::string caller_name;
    std::string called_uri;
    std::string group_uri;
    std::string group_name;
    std::string others; // uris
    std::int32_t session = 0;
    PttCallType type = PttCallType::kOneToOne;
    FourIntegers media{};
    FourIntegers terms{};
};
struct PttCallInProgress {
    std::int32_t session = 0;
};
struct PttCallAlerting {
    std::int32_t session = 0;
};
struct PttCallEstablished {
    std::int32_t session = 0;
    PttCallType type = PttCallType::kOneToOne;
    bool placed_here = false;
    std::string uri;
    bool crisis = false;
    FourIntegers media{};
    bool automatic = false;
    FourIntegers terms{};
    PttPeer peer;
};
struct PttCallEnded {
    std::int32_t session = 0;
    PttEndReason reason = PttEndReason::kEndedHere;
};
enum class PttFloorKind { kGranted, kRejected, kIdle, kQueuePosition, kCanceled, kTaken, kTimeout };
struct PttFloorEvent {
    PttFloorKind kind = PttFloorKind::kIdle; // which signal, no member of it
    std::int32_t session = 0;
    FourIntegers media{};
    std::int32_t priority = 0;
    std::string speaker_uri;
    std::int32_t participants = 0;
    std::string speaker_name;
    std::int32_t position = 0;
    std::int32_t seconds = 0;
    PttFloorCause cause = PttFloorCause::kNone;
    std::string text;
};
struct PttModifyRequest {
    bool changes_media = false;
    bool changes_terms = false;
    std::int32_t session = 0;
    std::int32_t reference = 0;
    FourIntegers media{};
    FourIntegers terms{};
};
struct PttModifyStatus {
    bool accepted = false;
    bool changes_media = false;
    bool changes_terms = false;
    std::int32_t session = 0;
    std::int32_t reference = 0;
    FourIntegers media{};
    FourIntegers terms{};
};
struct PttCrisisInitiated {
    std::int32_t session = 0;
};
struct PttContent {
    std::string bytes;
    std::string type;
    std::string disposition;
};
struct PttGroupAdvertisement {
    std::int32_t number = 0; // from 1 in each slot
    std::string subject;
    std::string call_info;
    PttPeer remote;
    std::vector<PttContent> contents;
};
struct PttParticipantInfo {
    std::int32_t session = 0;
    std::string uri;
    std::string status;
};
struct PttIncomingMessage {
    std::int32_t number = 0; // from 1 in each slot
    PttPeer originator;
    std::string message_id;
    std::int32_t notices = 0;
    std::string content_type;
    std::string text;
    std::vector<PttPeer> route; // whose uris and names alone travel
    std::string group_uri;
    std::int32_t session = 0;
    std::int32_t lifetime = 0;
    std::int32_t reference = 0;
    PttPeer target;
};
struct PttMessageNotice {
    std::int32_t number = 0; // of the message that was sent
    PttPeer from;
    std::string message_id;
    PttNotice notice = PttNotice::kDelivered;
    std::int32_t code = 0; // of SIP, when it failed
    PttPeer originator;
};
struct PttFileAttributes {
    std::string name;
    std::string description;
    std::int32_t size = 0;
    bool push = false;
    std::int32_t start = 0;
    std::int32_t end = 0;
    std::string transfer_id;
    std::string content_type;
    std::string file_type;
};
struct PttIncomingFile {
    std::int32_t number = 0; // from 1 in each slot
    PttPeer originator;
    PttFileAttributes attributes;
    std::int32_t session = 0;
    PttPeer target;
};
struct PttFileProgress {
    std::int32_t number = 0;
    std::int32_t bytes = 0;
    std::int32_t total = 0;
    std::int32_t party = 0; // of the sender's, from 1; 0 for a receiver
};
struct PttFileTerminated {
    std::int32_t number = 0;
    PttFileEnd reason = PttFileEnd::kComplete;
    std::int32_t party = 0;
};

using PttEvent =
    std::variant<PttCallIncoming, PttCallInProgress, PttCallAlerting, PttCallEstablished,
                 PttCallEnded, PttFloorEvent, PttModifyRequest, PttModifyStatus, PttCrisisInitiated,
                 PttGroupAdvertisement, PttParticipantInfo, PttIncomingMessage, PttMessageNotice,
                 PttIncomingFile, PttFileProgress, PttFileTerminated>;

} // namespace sim
