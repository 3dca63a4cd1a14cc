// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/failure.hpp"

#include "imsctl/output/values.hpp"

#include <fmt/format.h>
#include <ims.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

// What the stand-in service means by its results.
constexpr NamedValue kResults[] = {
    {"an argument has no such value", 10},
    {"the application is not registered", 11},
    {"there is no such session", 12},
    {"this is no state for it", 13},
    {"the line is in use", 14},
    {"there are too many", 15},
    {"it is barred", 16},
    {"it failed otherwise", 17},
    {"wrong password", 18},
    {"there is none of this name or id", 19},
    {"the name or id is taken", 20},
};

// Another service may mean something else by a number, so that this is not the message itself.
std::string result_hint(int result) {
    for (const NamedValue &known : kResults)
        if (known.value == result)
            return fmt::format("what ims-sim means by {}: {}; the service's own log says more",
                               result, known.name);
    return "the service's own log says why";
}

} // namespace

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
    case FailureKind::kFloor:
        return "floor";
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
                result_hint(result), details};
    }
}

} // namespace imsctl
