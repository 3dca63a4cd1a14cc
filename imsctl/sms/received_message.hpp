// SPDX-License-Identifier: Apache-2.0
// What an incoming TPDU means: a message, once all its parts are there, or a status report.
#pragma once

#include "imsctl/output/output.hpp"
#include "imsctl/sms/short_message.hpp"

namespace imsctl {

struct ReceivedText {
    std::string number;
    std::string sent; // the service centre's time
    tpdu::Alphabet alphabet;
    std::optional<std::int32_t> message_class;
    std::size_t parts;
    std::optional<std::string> text; // nothing when it is no text
    Bytes data;                      // of what is no text
};

struct Unreadable {
    Binary tpdu;
    std::string problem;
};

struct Received {
    // monostate: a part whose others are still to come
    std::variant<std::monostate, ReceivedText, tpdu::StatusReport, Unreadable> content;
    bool wants_report = false;

    bool is_complete() const { return content.index() != 0; }
};

// Remembers parts until their message is complete.
class MessageReader {
  public:
    Received read(const Bytes &octets);

    std::size_t incomplete() const { return reassembler_.pending(); }

  private:
    Received read(const tpdu::Deliver &deliver);

    tpdu::Reassembler reassembler_;
};

// "12:34:56.789 message 3 from +15550100, sent ..."; and the event's object with the content in the
// place of the TPDU.
std::string to_text(const Received &received, const Event &event);
Json to_json(const Received &received, const Event &event, int slot);

} // namespace imsctl
