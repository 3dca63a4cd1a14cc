// SPDX-License-Identifier: Apache-2.0
#include "imsctl/sms/short_message.hpp"

#include <algorithm>
#include <chrono>
#include <fmt/format.h>

namespace imsctl {
namespace {

struct ValidityUnit {
    char letter;
    std::int64_t minutes;
};

constexpr std::int64_t kHour = 60;
constexpr std::int64_t kDay = 24 * kHour;
constexpr ValidityUnit kValidityUnits[] = {{'m', 1}, {'h', kHour}, {'d', kDay}, {'w', 7 * kDay}};

constexpr std::int32_t kMostSeconds = 255;

tpdu::Error no_validity(std::string_view text) {
    return tpdu::make_error(
        tpdu::ErrorKind::kOutOfRange, quote(text),
        fmt::format("is not a number with s (up to {}), m, h, d or w behind it", kMostSeconds));
}

tpdu::Result<tpdu::SegmentedText> split(const Submission &submission) {
    if (!submission.data)
        return tpdu::segment(submission.text, {.reference = submission.reference});
    tpdu::UserData user_data;
    user_data.body = *submission.data;
    return tpdu::SegmentedText{tpdu::Alphabet::kEightBit, {user_data}};
}

std::string part_of(const tpdu::UserData &user_data) {
    if (!user_data.header)
        return "";
    const auto concatenation = tpdu::find_concatenation(*user_data.header);
    if (!concatenation)
        return "";
    return fmt::format(" (part {} of {})", concatenation->number, concatenation->total);
}

std::string content_of(std::uint8_t data_coding, const tpdu::UserData &user_data) {
    if (const auto text = tpdu::decode_text(data_coding, user_data.body))
        return quote(*text);
    return to_text(Binary{user_data.body});
}

struct Describe {
    std::string operator()(const tpdu::Deliver &deliver) const {
        return fmt::format("message from {}: {}{}", escape(tpdu::to_text(deliver.originator)),
                           content_of(deliver.data_coding, deliver.user_data),
                           part_of(deliver.user_data));
    }
    std::string operator()(const tpdu::SubmitReport &report) const {
        if (!report.failure_cause)
            return "taken by the service centre";
        return fmt::format("refused by the service centre: {} (cause {})",
                           tpdu::describe_failure_cause(*report.failure_cause),
                           *report.failure_cause);
    }
    std::string operator()(const tpdu::StatusReport &report) const { return describe(report); }
};

} // namespace

std::string_view to_string(tpdu::Alphabet alphabet) {
    switch (alphabet) {
    case tpdu::Alphabet::kGsm7:
        return "gsm7";
    case tpdu::Alphabet::kEightBit:
        return "8bit";
    case tpdu::Alphabet::kUcs2:
        return "ucs2";
    }
    return "unknown";
}

tpdu::Result<Submitted> compose(const Submission &submission) {
    tpdu::Submit submit;
    const auto segments = split(submission);
    if (!segments)
        return segments.error();
    submit.destination = submission.destination;
    submit.data_coding = tpdu::data_coding_for(segments->alphabet, submission.message_class);
    submit.validity = submission.validity;
    submit.status_report_request = submission.status_report;

    Submitted submitted{segments->alphabet, {}};
    submit.message_reference = submission.reference;
    for (const tpdu::UserData &part : segments->parts) {
        submit.user_data = part;
        auto octets = tpdu::encode(submit);
        if (!octets)
            return octets.error();
        submitted.parts.push_back({submit.message_reference++, *std::move(octets)});
    }
    return submitted;
}

std::uint8_t usual_reference(std::string_view number, std::string_view content) {
    // FNV-1a, folded to one octet.
    std::uint32_t hash = 2166136261u;
    for (const std::string_view text : {number, content})
        for (const char letter : text)
            hash = (hash ^ static_cast<std::uint8_t>(letter)) * 16777619u;
    return static_cast<std::uint8_t>(hash ^ (hash >> 8) ^ (hash >> 16) ^ (hash >> 24));
}

tpdu::Result<tpdu::Validity> parse_validity(std::string_view text) {
    if (text.empty())
        return no_validity(text);
    const auto count = parse_number(text.substr(0, text.size() - 1));
    if (!count || *count <= 0)
        return no_validity(text);
    if (text.back() == 's' && *count <= kMostSeconds)
        return tpdu::Validity(tpdu::EnhancedValidity{
            false, tpdu::SecondsValidity{static_cast<std::uint8_t>(*count)}});
    const auto *unit =
        std::find_if(std::begin(kValidityUnits), std::end(kValidityUnits),
                     [&](const ValidityUnit &each) { return each.letter == text.back(); });
    if (unit == std::end(kValidityUnits))
        return no_validity(text);
    const auto relative = tpdu::relative_validity(std::chrono::minutes(*count * unit->minutes));
    if (!relative)
        return relative.error();
    return tpdu::Validity(*relative);
}

std::string describe(const tpdu::StatusReport &report) {
    return fmt::format("delivery to {} (reference {}): {} (status {})",
                       escape(tpdu::to_text(report.recipient)), report.message_reference,
                       tpdu::describe_status(report.status), report.status);
}

std::string describe(tpdu::OctetView octets) {
    const auto message = tpdu::decode_to_mobile(octets);
    if (!message)
        return fmt::format("not readable: {}", message.error().message);
    return std::visit(Describe{}, *message);
}

} // namespace imsctl
