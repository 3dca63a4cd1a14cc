// SPDX-License-Identifier: Apache-2.0
#include "tpdu/cursor.hpp"
#include "tpdu/pdu.hpp"
#include "tpdu/pdu_layout.hpp"

namespace tpdu {

namespace {

using detail::Reader;

constexpr std::string_view kMessageType = "TP-MTI";

std::uint8_t read_first_octet(Reader &in, std::uint8_t type, std::string_view message) {
    const std::uint8_t first = in.octet(kMessageType);
    const unsigned found = first & detail::kTypeMask;
    if (found != type) {
        in.fail(ErrorKind::kMalformed, kMessageType,
                "is " + std::to_string(found) + " but " + std::string(message) + " has " +
                    std::to_string(type));
    }
    return first;
}

bool has(std::uint8_t octet, std::uint8_t bit) {
    return (octet & bit) != 0;
}

/// TP-PI with its extensions. What those announce is unknown here, but stands behind all that is.
std::uint8_t read_indicators(Reader &in) {
    const std::uint8_t first = in.octet("TP-PI");
    for (std::uint8_t last = first; has(last, detail::kMoreIndicators);)
        last = in.octet("TP-PI");
    return first;
}

ReportParameters read_parameters(Reader &in, std::uint8_t present, bool with_header,
                                 const detail::UserDataLimit &limit) {
    ReportParameters parameters;
    std::string_view last_field = "TP-PI";
    if (has(present, detail::kProtocolIdentifierPresent)) {
        last_field = "TP-PID";
        parameters.protocol_identifier = in.octet(last_field);
    }
    if (has(present, detail::kDataCodingPresent)) {
        last_field = "TP-DCS";
        parameters.data_coding = in.octet(last_field);
    }
    if (has(present, detail::kUserDataPresent)) {
        last_field = "TP-UD";
        parameters.user_data =
            detail::read_user_data(in, parameters.data_coding.value_or(0), with_header, limit);
    }
    // Parameters that a later version announces with a reserved bit are left alone.
    if (!has(present, detail::kReservedIndicators))
        in.expect_end(last_field);
    return parameters;
}

std::optional<std::uint8_t> read_failure_cause(Reader &in, ReportKind kind) {
    if (kind == ReportKind::kAck)
        return std::nullopt;
    return in.octet("TP-FCS");
}

template <typename Variant, typename T>
Result<Variant> widen(Result<T> decoded) {
    if (!decoded)
        return decoded.error();
    return Variant(*std::move(decoded));
}

std::optional<std::uint8_t> type_of(OctetView octets) {
    if (octets.empty())
        return std::nullopt;
    return octets[0] & detail::kTypeMask;
}

Error missing_type() {
    return make_error(ErrorKind::kTruncated, kMessageType, "is missing: the message is empty");
}

} // namespace

ReportKind likely_report_kind(OctetView octets) {
    return octets.size() > 1 && octets[1] >= detail::kFirstFailureCause ? ReportKind::kError
                                                                        : ReportKind::kAck;
}

Result<Submit> decode_submit(OctetView octets) {
    Reader in(octets);
    Submit submit;
    const std::uint8_t first = read_first_octet(in, detail::kTypeSubmit, "an SMS-SUBMIT");
    submit.reject_duplicates = has(first, detail::kRejectDuplicatesBit);
    submit.status_report_request = has(first, detail::kStatusReportRequestBit);
    submit.reply_path = has(first, detail::kReplyPathBit);
    submit.message_reference = in.octet("TP-MR");
    submit.destination = detail::read_address(in, "TP-DA");
    submit.protocol_identifier = in.octet("TP-PID");
    submit.data_coding = in.octet("TP-DCS");
    submit.validity = detail::read_validity(in, first >> detail::kValidityFormatShift &
                                                    detail::kValidityFormatMask);
    submit.user_data = detail::read_user_data(in, submit.data_coding,
                                              has(first, detail::kHeaderBit), detail::kSubmitLimit);
    in.expect_end("TP-UD");
    return in.finish(std::move(submit));
}

Result<Deliver> decode_deliver(OctetView octets) {
    Reader in(octets);
    Deliver deliver;
    // Towards the device the reserved type is to be processed like this one.
    const bool reserved = type_of(octets) == detail::kTypeReserved;
    const std::uint8_t first = read_first_octet(
        in, reserved ? detail::kTypeReserved : detail::kTypeDeliver, "an SMS-DELIVER");
    deliver.more_messages = !has(first, detail::kNoMoreMessagesBit);
    deliver.loop_prevention = has(first, detail::kLoopPreventionBit);
    deliver.status_report_indication = has(first, detail::kStatusReportIndicationBit);
    deliver.reply_path = has(first, detail::kReplyPathBit);
    deliver.originator = detail::read_address(in, "TP-OA");
    deliver.protocol_identifier = in.octet("TP-PID");
    deliver.data_coding = in.octet("TP-DCS");
    deliver.service_centre_time = detail::read_timestamp(in, "TP-SCTS");
    deliver.user_data = detail::read_user_data(
        in, deliver.data_coding, has(first, detail::kHeaderBit), detail::kDeliverLimit);
    in.expect_end("TP-UD");
    return in.finish(std::move(deliver));
}

Result<StatusReport> decode_status_report(OctetView octets) {
    Reader in(octets);
    StatusReport report;
    const std::uint8_t first =
        read_first_octet(in, detail::kTypeStatusReport, "an SMS-STATUS-REPORT");
    report.more_messages = !has(first, detail::kNoMoreMessagesBit);
    report.loop_prevention = has(first, detail::kLoopPreventionBit);
    report.for_command = has(first, detail::kStatusReportQualifierBit);
    report.message_reference = in.octet("TP-MR");
    report.recipient = detail::read_address(in, "TP-RA");
    report.service_centre_time = detail::read_timestamp(in, "TP-SCTS");
    report.discharge_time = detail::read_timestamp(in, "TP-DT");
    report.status = in.octet("TP-ST");
    if (in.remaining() != 0) {
        const std::uint8_t present = read_indicators(in);
        report.parameters = read_parameters(in, present, has(first, detail::kHeaderBit),
                                            detail::kStatusReportLimit);
    }
    return in.finish(std::move(report));
}

Result<DeliverReport> decode_deliver_report(OctetView octets, ReportKind kind) {
    Reader in(octets);
    DeliverReport report;
    const std::uint8_t first =
        read_first_octet(in, detail::kTypeDeliverReport, "an SMS-DELIVER-REPORT");
    report.failure_cause = read_failure_cause(in, kind);
    const std::uint8_t present = read_indicators(in);
    report.parameters = read_parameters(in, present, has(first, detail::kHeaderBit),
                                        kind == ReportKind::kError ? detail::kDeliverErrorLimit
                                                                   : detail::kDeliverAckLimit);
    return in.finish(std::move(report));
}

Result<SubmitReport> decode_submit_report(OctetView octets, ReportKind kind) {
    Reader in(octets);
    SubmitReport report;
    const std::uint8_t first =
        read_first_octet(in, detail::kTypeSubmitReport, "an SMS-SUBMIT-REPORT");
    report.failure_cause = read_failure_cause(in, kind);
    const std::uint8_t present = read_indicators(in);
    report.service_centre_time = detail::read_timestamp(in, "TP-SCTS");
    report.parameters = read_parameters(in, present, has(first, detail::kHeaderBit),
                                        kind == ReportKind::kError ? detail::kSubmitErrorLimit
                                                                   : detail::kSubmitAckLimit);
    return in.finish(std::move(report));
}

Result<FromMobile> decode_from_mobile(OctetView octets) {
    const auto type = type_of(octets);
    if (!type)
        return missing_type();
    switch (*type) {
    case detail::kTypeSubmit:
        return widen<FromMobile>(decode_submit(octets));
    case detail::kTypeDeliverReport:
        return widen<FromMobile>(decode_deliver_report(octets, likely_report_kind(octets)));
    case detail::kTypeCommand:
        return make_error(ErrorKind::kUnsupported, kMessageType,
                          "is 2, an SMS-COMMAND, which is not supported");
    default:
        return make_error(ErrorKind::kMalformed, kMessageType, "is 3, a reserved value");
    }
}

Result<ToMobile> decode_to_mobile(OctetView octets) {
    const auto type = type_of(octets);
    if (!type)
        return missing_type();
    switch (*type) {
    case detail::kTypeSubmitReport:
        return widen<ToMobile>(decode_submit_report(octets, likely_report_kind(octets)));
    case detail::kTypeStatusReport:
        return widen<ToMobile>(decode_status_report(octets));
    default:
        return widen<ToMobile>(decode_deliver(octets));
    }
}

} // namespace tpdu
