// SPDX-License-Identifier: Apache-2.0
#include "tpdu/status.hpp"

#include <span>

namespace tpdu {

namespace {

struct Row {
    std::uint8_t value;
    std::string_view text;
};

constexpr Row kStatuses[] = {
    {0x00, "received by the addressee"},
    {0x01, "forwarded, delivery not confirmed"},
    {0x02, "replaced by the service centre"},
    {0x20, "congestion, still trying"},
    {0x21, "addressee busy, still trying"},
    {0x22, "no response from the addressee, still trying"},
    {0x23, "service rejected, still trying"},
    {0x24, "quality of service not available, still trying"},
    {0x25, "error in the addressee's device, still trying"},
    {0x40, "remote procedure error"},
    {0x41, "incompatible destination"},
    {0x42, "connection rejected by the addressee"},
    {0x43, "not obtainable"},
    {0x44, "quality of service not available"},
    {0x45, "no interworking available"},
    {0x46, "validity period expired"},
    {0x47, "deleted by the sender"},
    {0x48, "deleted by the service centre"},
    {0x49, "message does not exist"},
    {0x60, "congestion, given up"},
    {0x61, "addressee busy, given up"},
    {0x62, "no response from the addressee, given up"},
    {0x63, "service rejected, given up"},
    {0x64, "quality of service not available, given up"},
    {0x65, "error in the addressee's device, given up"},
};

constexpr std::string_view kStatusClasses[] = {
    "completed (other status)",
    "temporary error (other status), still trying",
    "permanent error (other status)",
    "temporary error (other status), given up",
};

constexpr Row kFailureCauses[] = {
    {0x80, "telematic interworking not supported"},
    {0x81, "short message type 0 not supported"},
    {0x82, "cannot replace short message"},
    {0x8F, "unspecified protocol identifier error"},
    {0x90, "alphabet not supported"},
    {0x91, "message class not supported"},
    {0x9F, "unspecified data coding error"},
    {0xA0, "command cannot be actioned"},
    {0xA1, "command not supported"},
    {0xAF, "unspecified command error"},
    {0xB0, "message type not supported"},
    {0xC0, "service centre busy"},
    {0xC1, "no service centre subscription"},
    {0xC2, "service centre failure"},
    {0xC3, "invalid address"},
    {0xC4, "destination barred"},
    {0xC5, "duplicate rejected"},
    {0xC6, "validity period format not supported"},
    {0xC7, "validity period not supported"},
    {0xD0, "SIM storage full"},
    {0xD1, "no storage on the SIM"},
    {0xD2, "error in the device"},
    {0xD3, "memory exceeded"},
    {0xD4, "SIM application busy"},
    {0xD5, "SIM data download error"},
    {0xFF, "unspecified error"},
};

std::string_view find(std::span<const Row> rows, std::uint8_t value) {
    for (const Row &row : rows) {
        if (row.value == value)
            return row.text;
    }
    return {};
}

} // namespace

StatusClass status_class(std::uint8_t status) {
    return status < 0x80 ? static_cast<StatusClass>(status >> 5) : StatusClass::kGaveUp;
}

std::string_view describe_status(std::uint8_t status) {
    const std::string_view text = find(kStatuses, status);
    return text.empty() ? kStatusClasses[static_cast<unsigned>(status_class(status))] : text;
}

std::string_view describe_failure_cause(std::uint8_t cause) {
    const std::string_view text = find(kFailureCauses, cause);
    if (!text.empty())
        return text;
    return cause >= 0xE0 ? "application-specific error" : "unspecified error (reserved cause)";
}

} // namespace tpdu
