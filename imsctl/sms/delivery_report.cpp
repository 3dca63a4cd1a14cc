// SPDX-License-Identifier: Apache-2.0
#include "imsctl/sms/delivery_report.hpp"

namespace imsctl {

tpdu::Octets delivery_report_tpdu(std::optional<std::uint8_t> failure_cause) {
    return tpdu::encode(tpdu::DeliverReport{failure_cause, {}}).value();
}

ims_sms_deliver_report_s delivery_report(const tpdu::Octets &octets, const ReportValues &values) {
    return {values.code, octets.data(), static_cast<std::int32_t>(octets.size()), values.option};
}

} // namespace imsctl
