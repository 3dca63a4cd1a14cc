// SPDX-License-Identifier: Apache-2.0
// What is between a text and the TPDUs that the library takes and brings.
#pragma once

#include "imsctl/output/fields.hpp"
#include "imsctl/output/values.hpp"

#include "tpdu/tpdu.hpp"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace imsctl {

inline constexpr NamedValue kMessageClasses[] = {
    {"flash", 0}, {"device", 1}, {"sim", 2}, {"terminal", 3}};

// Also what the "alphabet" of a JSON object can be.
std::string_view to_string(tpdu::Alphabet alphabet);

// What is to be sent.
struct Submission {
    tpdu::Address destination{};
    std::string text{};
    std::optional<tpdu::Octets> data{}; // instead of the text
    std::optional<tpdu::MessageClass> message_class{};
    tpdu::Validity validity{};
    bool status_report = false;
    std::uint8_t reference = 0; // of the first part; those of the others follow
};

struct SubmittedPart {
    std::uint8_t reference;
    tpdu::Octets tpdu;
};

struct Submitted {
    tpdu::Alphabet alphabet;
    std::vector<SubmittedPart> parts;
};

// As many SMS-SUBMITs as the text takes; data has to fit into one.
tpdu::Result<Submitted> compose(const Submission &submission);

// Always the same for the same message, and most likely another one for another message.
std::uint8_t usual_reference(std::string_view number, std::string_view content);

// "30s", "10m", "12h", "2d" or "1w". What the message cannot express exactly becomes longer.
tpdu::Result<tpdu::Validity> parse_validity(std::string_view text);

// What comes from the service, in one line.
std::string describe(const tpdu::StatusReport &report);
std::string describe(tpdu::OctetView octets);

} // namespace imsctl
