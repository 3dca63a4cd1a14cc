// SPDX-License-Identifier: Apache-2.0
#include "tpdu/cursor.hpp"
#include "tpdu/pdu.hpp"
#include "tpdu/pdu_layout.hpp"

namespace tpdu {

namespace {

using detail::Writer;

unsigned bit_if(bool condition, unsigned bit) {
    return condition ? bit : 0;
}

unsigned header_bit(const UserData &user_data) {
    return bit_if(user_data.header.has_value(), detail::kHeaderBit);
}

unsigned header_bit(const ReportParameters &parameters) {
    return parameters.user_data ? header_bit(*parameters.user_data) : 0;
}

unsigned indicators(const ReportParameters &parameters) {
    return bit_if(parameters.protocol_identifier.has_value(), detail::kProtocolIdentifierPresent) |
           bit_if(parameters.data_coding.has_value(), detail::kDataCodingPresent) |
           bit_if(parameters.user_data.has_value(), detail::kUserDataPresent);
}

void write_parameters(Writer &out, const ReportParameters &parameters,
                      const detail::UserDataLimit &limit) {
    if (parameters.protocol_identifier)
        out.octet(*parameters.protocol_identifier);
    if (parameters.data_coding)
        out.octet(*parameters.data_coding);
    if (parameters.user_data) {
        detail::write_user_data(out, *parameters.user_data, parameters.data_coding.value_or(0),
                                limit);
    }
}

void write_failure_cause(Writer &out, const std::optional<std::uint8_t> &cause) {
    if (!cause)
        return;
    if (*cause < detail::kFirstFailureCause) {
        out.fail(ErrorKind::kOutOfRange, "TP-FCS",
                 "cannot be " + std::to_string(*cause) + ": values below 128 are reserved");
    }
    out.octet(*cause);
}

} // namespace

Result<Octets> encode(const Submit &submit) {
    Writer out;
    out.octet(detail::kTypeSubmit | bit_if(submit.reject_duplicates, detail::kRejectDuplicatesBit) |
              detail::validity_format(submit.validity) << detail::kValidityFormatShift |
              bit_if(submit.status_report_request, detail::kStatusReportRequestBit) |
              header_bit(submit.user_data) | bit_if(submit.reply_path, detail::kReplyPathBit));
    out.octet(submit.message_reference);
    detail::write_address(out, submit.destination, "TP-DA");
    out.octet(submit.protocol_identifier);
    out.octet(submit.data_coding);
    detail::write_validity(out, submit.validity);
    detail::write_user_data(out, submit.user_data, submit.data_coding, detail::kSubmitLimit);
    return std::move(out).finish();
}

Result<Octets> encode(const Deliver &deliver) {
    Writer out;
    out.octet(detail::kTypeDeliver | bit_if(!deliver.more_messages, detail::kNoMoreMessagesBit) |
              bit_if(deliver.loop_prevention, detail::kLoopPreventionBit) |
              bit_if(deliver.status_report_indication, detail::kStatusReportIndicationBit) |
              header_bit(deliver.user_data) | bit_if(deliver.reply_path, detail::kReplyPathBit));
    detail::write_address(out, deliver.originator, "TP-OA");
    out.octet(deliver.protocol_identifier);
    out.octet(deliver.data_coding);
    detail::write_timestamp(out, deliver.service_centre_time, "TP-SCTS");
    detail::write_user_data(out, deliver.user_data, deliver.data_coding, detail::kDeliverLimit);
    return std::move(out).finish();
}

Result<Octets> encode(const StatusReport &report) {
    Writer out;
    out.octet(detail::kTypeStatusReport |
              bit_if(!report.more_messages, detail::kNoMoreMessagesBit) |
              bit_if(report.loop_prevention, detail::kLoopPreventionBit) |
              bit_if(report.for_command, detail::kStatusReportQualifierBit) |
              header_bit(report.parameters));
    out.octet(report.message_reference);
    detail::write_address(out, report.recipient, "TP-RA");
    detail::write_timestamp(out, report.service_centre_time, "TP-SCTS");
    detail::write_timestamp(out, report.discharge_time, "TP-DT");
    if (report.status >= detail::kFirstReservedStatus) {
        out.fail(ErrorKind::kOutOfRange, "TP-ST",
                 "cannot be " + std::to_string(report.status) + ": values above 127 are reserved");
    }
    out.octet(report.status);
    // A status report without parameters ends here, without even the indicator.
    if (const unsigned present = indicators(report.parameters); present != 0)
        out.octet(present);
    write_parameters(out, report.parameters, detail::kStatusReportLimit);
    return std::move(out).finish();
}

Result<Octets> encode(const DeliverReport &report) {
    Writer out;
    out.octet(detail::kTypeDeliverReport | header_bit(report.parameters));
    write_failure_cause(out, report.failure_cause);
    out.octet(indicators(report.parameters));
    write_parameters(out, report.parameters,
                     report.failure_cause ? detail::kDeliverErrorLimit : detail::kDeliverAckLimit);
    return std::move(out).finish();
}

Result<Octets> encode(const SubmitReport &report) {
    Writer out;
    out.octet(detail::kTypeSubmitReport | header_bit(report.parameters));
    write_failure_cause(out, report.failure_cause);
    out.octet(indicators(report.parameters));
    detail::write_timestamp(out, report.service_centre_time, "TP-SCTS");
    write_parameters(out, report.parameters,
                     report.failure_cause ? detail::kSubmitErrorLimit : detail::kSubmitAckLimit);
    return std::move(out).finish();
}

} // namespace tpdu
