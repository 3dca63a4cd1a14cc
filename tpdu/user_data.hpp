// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/alphabet.hpp"
#include "tpdu/data_coding.hpp"
#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// TP-UD: an optional header of information elements and the message's text or data.
namespace tpdu {

/// One element of a user data header. Elements that nothing here understands are kept as they are.
struct InformationElement {
    std::uint8_t id = 0;
    Octets data{};

    friend bool operator==(const InformationElement &, const InformationElement &) = default;
};

struct UserDataHeader {
    std::vector<InformationElement> elements{};

    friend bool operator==(const UserDataHeader &, const UserDataHeader &) = default;
};

/// What TP-UDHI, TP-UDL and TP-UD say together. TP-UDHI is whether there is a header, TP-UDL
/// follows from the sizes.
struct UserData {
    std::optional<UserDataHeader> header{};
    /// Uncompressed GSM 7-bit text: one septet an element. All else: the octets themselves.
    Octets body{};

    friend bool operator==(const UserData &, const UserData &) = default;
};

/// Text as user data without a header. Fails when `alphabet` lacks a character, and for
/// Alphabet::kEightBit, which is no text. Does not look at the length: see segment().
Result<UserData> encode_text(std::string_view text, Alphabet alphabet);

/// The text of a body in the alphabet that the TP-DCS octet `data_coding` stands for. Fails for
/// 8-bit data, compressed text and UCS-2 of an odd size.
Result<std::string> decode_text(std::uint8_t data_coding, OctetView body);

/// Octets that `header` takes in TP-UD, its length octet included; 0 without a header.
std::size_t header_size(const std::optional<UserDataHeader> &header);

/// Septets that `header` takes in front of GSM 7-bit text: the text begins on a septet boundary
/// counted from the start of TP-UD, so up to six fill bits follow the header.
std::size_t header_septets(const std::optional<UserDataHeader> &header);

namespace detail {

class Reader;
class Writer;

/// How many octets of TP-UD fit into which message.
struct UserDataLimit {
    std::string_view message;
    std::size_t octets;
};

/// TP-UDL and TP-UD.
UserData read_user_data(Reader &in, std::uint8_t data_coding, bool with_header,
                        const UserDataLimit &limit);
void write_user_data(Writer &out, const UserData &user_data, std::uint8_t data_coding,
                     const UserDataLimit &limit);

} // namespace detail

} // namespace tpdu
