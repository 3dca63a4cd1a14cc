// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/address.hpp"
#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"
#include "tpdu/timestamp.hpp"
#include "tpdu/user_data.hpp"
#include "tpdu/validity.hpp"

#include <cstdint>
#include <optional>
#include <variant>

/// The messages of the short message transfer layer (3GPP TS 23.040) as plain records.
///
/// Decoding never throws and never reads past what it is given. It refuses a message whose fields
/// contradict each other or its size (octets after the last field included) and accepts reserved
/// values that can be ignored. Encoding refuses whatever would not decode to the same record.
namespace tpdu {

/// A message that a device sends.
struct Submit {
    bool reject_duplicates = false;       ///< TP-RD
    bool status_report_request = false;   ///< TP-SRR
    bool reply_path = false;              ///< TP-RP
    std::uint8_t message_reference = 0;   ///< TP-MR
    Address destination{};                ///< TP-DA
    std::uint8_t protocol_identifier = 0; ///< TP-PID
    std::uint8_t data_coding = 0;         ///< TP-DCS; see decode_data_coding()
    Validity validity{};                  ///< TP-VPF and TP-VP
    UserData user_data{};                 ///< TP-UDHI, TP-UDL and TP-UD

    friend bool operator==(const Submit &, const Submit &) = default;
};

/// A message that a device receives.
struct Deliver {
    bool more_messages = false;            ///< TP-MMS (whose bit means the opposite)
    bool loop_prevention = false;          ///< TP-LP
    bool status_report_indication = false; ///< TP-SRI
    bool reply_path = false;               ///< TP-RP
    Address originator{};                  ///< TP-OA
    std::uint8_t protocol_identifier = 0;  ///< TP-PID
    std::uint8_t data_coding = 0;          ///< TP-DCS
    Timestamp service_centre_time{};       ///< TP-SCTS
    UserData user_data{};                  ///< TP-UDHI, TP-UDL and TP-UD

    friend bool operator==(const Deliver &, const Deliver &) = default;
};

/// What a report may or may not carry; TP-PI follows from what is there.
struct ReportParameters {
    std::optional<std::uint8_t> protocol_identifier{}; ///< TP-PID
    std::optional<std::uint8_t> data_coding{}; ///< TP-DCS; 0 where user data comes without it
    std::optional<UserData> user_data{};       ///< TP-UDHI, TP-UDL and TP-UD

    friend bool operator==(const ReportParameters &, const ReportParameters &) = default;
};

/// What became of a submitted message.
struct StatusReport {
    bool more_messages = false;         ///< TP-MMS (whose bit means the opposite)
    bool loop_prevention = false;       ///< TP-LP
    bool for_command = false;           ///< TP-SRQ: the result of a command, not of a submission
    std::uint8_t message_reference = 0; ///< TP-MR of the message in question
    Address recipient{};                ///< TP-RA
    Timestamp service_centre_time{};    ///< TP-SCTS
    Timestamp discharge_time{};         ///< TP-DT
    std::uint8_t status = 0;            ///< TP-ST; see status.hpp
    ReportParameters parameters{};

    friend bool operator==(const StatusReport &, const StatusReport &) = default;
};

/// A device's answer to a received message.
struct DeliverReport {
    std::optional<std::uint8_t> failure_cause{}; ///< TP-FCS: given in the error form only
    ReportParameters parameters{};

    friend bool operator==(const DeliverReport &, const DeliverReport &) = default;
};

/// The service centre's answer to a submitted message.
struct SubmitReport {
    std::optional<std::uint8_t> failure_cause{}; ///< TP-FCS: given in the error form only
    Timestamp service_centre_time{};             ///< TP-SCTS
    ReportParameters parameters{};

    friend bool operator==(const SubmitReport &, const SubmitReport &) = default;
};

/// The two forms of a report. The octets do not say which one it is; the layer below does.
enum class ReportKind : std::uint8_t { kAck, kError };

/// The form that a report's second octet speaks for: failure causes begin at 0x80, and the
/// parameter indicator of an acknowledgement stays below unless a future version extends it.
ReportKind likely_report_kind(OctetView octets);

Result<Octets> encode(const Submit &submit);
Result<Octets> encode(const Deliver &deliver);
Result<Octets> encode(const StatusReport &report);
Result<Octets> encode(const DeliverReport &report);
Result<Octets> encode(const SubmitReport &report);

Result<Submit> decode_submit(OctetView octets);
Result<Deliver> decode_deliver(OctetView octets);
Result<StatusReport> decode_status_report(OctetView octets);
Result<DeliverReport> decode_deliver_report(OctetView octets, ReportKind kind);
Result<SubmitReport> decode_submit_report(OctetView octets, ReportKind kind);

using FromMobile = std::variant<Submit, DeliverReport>;
using ToMobile = std::variant<Deliver, SubmitReport, StatusReport>;

/// Any message that a device sends; reports in their likely form. SMS-COMMAND is not supported.
Result<FromMobile> decode_from_mobile(OctetView octets);

/// Any message that a device receives; reports in their likely form.
Result<ToMobile> decode_to_mobile(OctetView octets);

} // namespace tpdu
