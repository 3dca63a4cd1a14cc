// SPDX-License-Identifier: Apache-2.0
// Short messages.
#include "imsctl/line/requests.hpp"
#include "imsctl/sms/delivery_report.hpp"
#include "imsctl/sms/module.hpp"
#include "imsctl/sms/send.hpp"
#include "imsctl/sms/watch.hpp"

#include <fmt/format.h>
#include <limits>

namespace imsctl {
namespace {

constexpr NamedValue kFailureCauses[] = {{"sim-full", 0xD0},
                                         {"device-error", 0xD2},
                                         {"memory-exceeded", failure_cause::kMemoryExceeded},
                                         {"application-busy", 0xD4},
                                         {"unspecified", 0xFF}};
constexpr std::int32_t kNoFailure = std::numeric_limits<std::int32_t>::min();

constexpr std::int32_t kCodeOfFailure = std::numeric_limits<std::int32_t>::min();

std::int32_t code_for(std::int32_t cause) {
    switch (cause) {
    case kNoFailure:
        return report_code::kReceived;
    case failure_cause::kMemoryExceeded:
        return report_code::kMemoryExceeded;
    default:
        return report_code::kProtocolError;
    }
}

tpdu::Octets report_tpdu(std::int32_t cause) {
    constexpr std::int32_t kLeast = 0x80;
    constexpr std::int32_t kMost = 0xFF;
    if (cause == kNoFailure)
        return delivery_report_tpdu(std::nullopt);
    if (cause < kLeast || cause > kMost)
        throw Failure(FailureKind::kUsage,
                      fmt::format("--failure: {} is not from {} to {}", cause, kLeast, kMost),
                      "try: imsctl sms report --failure memory-exceeded");
    return delivery_report_tpdu(static_cast<std::uint8_t>(cause));
}

Action prepare_report(Arguments &arguments) {
    const auto message = arguments.number(
        "MESSAGE", "which message, as the event says (default 0: the oldest without a report)", 0);
    const auto cause =
        arguments.choice("--failure", "refuse the message, and why", kFailureCauses, kNoFailure);
    const auto code = arguments.number(
        "--code", "the report code, when it is not the one that belongs to --failure",
        kCodeOfFailure);
    return [=](Invocation &run) {
        const tpdu::Octets octets = report_tpdu(*cause);
        const std::int32_t sent_code = *code == kCodeOfFailure ? code_for(*cause) : *code;
        const ims_sms_deliver_report_s report = delivery_report(octets, {sent_code, *message});
        run.request({}, with_record(ims_sms_send_deliver_report, report));
    };
}

constexpr Verb kSmsVerbs[] = {
    {"sms send", "send a text as one short message or as many as it takes",
     "sms send +15550101 'See you at 8' --report", prepare_sms_send},
    {"sms watch", "show short messages as they arrive, and answer them with delivery reports",
     "sms watch --json", prepare_sms_watch},
    {"sms report", "answer a short message with a delivery report by hand",
     "sms report 7 --failure memory-exceeded", prepare_report},
};

} // namespace

std::span<const Verb> sms_verbs() {
    return kSmsVerbs;
}

} // namespace imsctl
