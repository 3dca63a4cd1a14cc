// SPDX-License-Identifier: Apache-2.0
#include "failure.hpp"

#include <fmt/format.h>
#include <ims.h>

namespace imsctl {

std::string_view to_string(FailureKind kind) {
    switch (kind) {
    case FailureKind::kUsage:
        return "usage";
    case FailureKind::kNotSupported:
        return "not-supported";
    case FailureKind::kRefused:
        return "refused";
    case FailureKind::kUnreachable:
        return "unreachable";
    case FailureKind::kService:
        return "service";
    case FailureKind::kTimeout:
        return "timeout";
    case FailureKind::kInvalid:
        return "invalid";
    case FailureKind::kSession:
        return "session";
    case FailureKind::kCallEnded:
        return "call-ended";
    case FailureKind::kNotSent:
        return "not-sent";
    case FailureKind::kOutput:
        return "output";
    case FailureKind::kInput:
        return "input";
    case FailureKind::kProfile:
        return "profile";
    }
    return "unknown";
}

Json Failure::to_json() const {
    Json error = {{"kind", std::string(to_string(kind))}, {"message", what()}};
    if (!hint.empty())
        error["hint"] = hint;
    add_json(error, details);
    return error;
}

Failure connect_failure(int code, int slot) {
    if (code != IMS_ERROR_OPERATION_FAILED)
        return library_failure(code);
    return {FailureKind::kUnreachable,
            fmt::format("no IMS service for slot {}: the system bus or the service is not running, "
                        "the slot does not exist, or the service did not register this program",
                        slot),
            "try: ims-sim run -- imsctl call list   (a stand-in service), or another --slot"};
}

Failure bus_break_failure() {
    return {FailureKind::kUnreachable, "the connection to the system bus broke"};
}

Failure library_failure(int code) {
    switch (code) {
    case IMS_ERROR_NOT_SUPPORTED:
        return {FailureKind::kNotSupported, "the IMS feature is switched off on this device"};
    case IMS_ERROR_PERMISSION_DENIED:
        return {FailureKind::kRefused, "refused: this user may not use the IMS service"};
    case IMS_ERROR_INVALID_PARAMETER:
        return {FailureKind::kInvalid,
                "the library did not take an argument: is every text valid UTF-8?"};
    case IMS_ERROR_OPERATION_FAILED:
        return {FailureKind::kUnreachable,
                "the service could not be reached, did not answer, or reported a failure"};
    default:
        return {FailureKind::kUnreachable, fmt::format("the library failed with {}", code)};
    }
}

Failure response_failure(int result) {
    const Fields details = {{"result", std::int64_t{result}}};
    switch (result) {
    case IMS_RESPONSE_FAILED:
        return {FailureKind::kUnreachable,
                "the service could not be reached or did not answer properly", "", details};
    case IMS_RESPONSE_ACCESS_DENIED:
        return {FailureKind::kRefused, "refused: this user may not make this request", "", details};
    default:
        return {FailureKind::kService, fmt::format("the service answered with result {}", result),
                "the service's own log says why", details};
    }
}

} // namespace imsctl
