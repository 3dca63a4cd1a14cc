// SPDX-License-Identifier: Apache-2.0
#include "imsctl/sms/received_message.hpp"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

ReceivedText whole(const tpdu::CompleteMessage &message, const tpdu::Deliver &last_part) {
    const tpdu::DataCoding coding = tpdu::decode_data_coding(message.parts.front().data_coding);
    ReceivedText received;
    received.number = tpdu::to_text(message.sender);
    received.sent = tpdu::to_text(last_part.service_centre_time);
    received.alphabet = coding.alphabet;
    if (coding.message_class)
        received.message_class = static_cast<std::int32_t>(*coding.message_class);
    received.parts = message.parts.size();
    if (const auto text = message.text())
        received.text = *text;
    else
        for (const auto &part : message.parts)
            received.data.insert(received.data.end(), part.body.begin(), part.body.end());
    return received;
}

std::string annotations(const ReceivedText &received) {
    std::string text;
    if (received.message_class)
        text += fmt::format(", class {}", name_of(kMessageClasses, *received.message_class));
    if (received.parts > 1)
        text += fmt::format(", {} parts", received.parts);
    return text;
}

struct InWords {
    std::string operator()(std::monostate) const { return "part of a longer one"; }
    std::string operator()(const ReceivedText &received) const {
        return fmt::format("from {}, sent {}{}: {}", escape(received.number), received.sent,
                           annotations(received),
                           received.text ? quote(*received.text) : to_text(Binary{received.data}));
    }
    std::string operator()(const tpdu::StatusReport &report) const {
        return "status report, " + describe(report);
    }
    std::string operator()(const Unreadable &unreadable) const {
        return fmt::format("not readable: {}: {}", unreadable.problem, to_text(unreadable.tpdu));
    }
};

struct AsJson {
    Json operator()(std::monostate) const { return Json::object(); }
    Json operator()(const ReceivedText &received) const {
        Json message = {{"number", received.number},
                        {"sent", received.sent},
                        {"alphabet", std::string(to_string(received.alphabet))},
                        {"class", nullptr},
                        {"parts", received.parts},
                        {"text", nullptr},
                        {"data", nullptr}};
        if (received.message_class)
            message["class"] = *received.message_class;
        if (received.text)
            message["text"] = *received.text;
        else
            message["data"] = to_json(received.data);
        return {{"message", message}};
    }
    Json operator()(const tpdu::StatusReport &report) const {
        return {{"status_report",
                 {{"number", tpdu::to_text(report.recipient)},
                  {"reference", report.message_reference},
                  {"sent", tpdu::to_text(report.service_centre_time)},
                  {"discharged", tpdu::to_text(report.discharge_time)},
                  {"status", report.status},
                  {"status_text", std::string(tpdu::describe_status(report.status))}}}};
    }
    Json operator()(const Unreadable &unreadable) const {
        return {{"unreadable",
                 {{"tpdu", imsctl::to_json(unreadable.tpdu)}, {"problem", unreadable.problem}}}};
    }
};

} // namespace

Received MessageReader::read(const Bytes &octets) {
    const auto message = tpdu::decode_to_mobile(octets);
    if (!message)
        return {Unreadable{{octets}, message.error().message}};
    if (const auto *deliver = std::get_if<tpdu::Deliver>(&*message))
        return read(*deliver);
    if (const auto *report = std::get_if<tpdu::StatusReport>(&*message))
        return {*report};
    return {Unreadable{{octets}, "an SMS-SUBMIT-REPORT is no incoming message"}};
}

Received MessageReader::read(const tpdu::Deliver &deliver) {
    Received received;
    received.wants_report = true;
    if (const auto complete = reassembler_.add(deliver))
        received.content = whole(*complete, deliver);
    return received;
}

std::string to_text(const Received &received, const Event &event) {
    return fmt::format("{} message {}: {}", local_clock_time(event.time),
                       event.number("member_3").value_or(0),
                       std::visit(InWords{}, received.content));
}

Json to_json(const Received &received, const Event &event, int slot) {
    Event envelope = event;
    std::erase_if(envelope.fields, [](const Field &field) { return field.name == "tpdu"; });
    Json object = to_json(envelope, slot);
    object.update(std::visit(AsJson{}, received.content));
    return object;
}

} // namespace imsctl
