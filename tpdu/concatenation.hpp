// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/address.hpp"
#include "tpdu/pdu.hpp"
#include "tpdu/result.hpp"
#include "tpdu/user_data.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// Texts longer than one message: splitting them and putting them together again.
namespace tpdu {

enum class ReferenceWidth : std::uint8_t { k8Bit, k16Bit };

/// The header element that makes a message one part of several.
struct Concatenation {
    std::uint16_t reference = 0; ///< the same in all parts of a text
    ReferenceWidth width = ReferenceWidth::k8Bit;
    std::uint8_t total = 1;  ///< how many parts there are
    std::uint8_t number = 1; ///< which one this is, from 1

    friend bool operator==(const Concatenation &, const Concatenation &) = default;
};

/// The last meaningful concatenation element of `header`. One of a wrong size, with a number of 0
/// or above the total, or with a total of 0, counts as absent.
std::optional<Concatenation> find_concatenation(const UserDataHeader &header);

/// `concatenation` as a header element. Fails when its values make no sense together.
Result<InformationElement> concatenation_element(const Concatenation &concatenation);

struct SegmentOptions {
    /// Tells this text from others to the same party; of no effect when one message is enough.
    std::uint16_t reference = 0;
    /// A 16-bit reference costs one septet or unit of each part.
    ReferenceWidth width = ReferenceWidth::k8Bit;
    /// Forces an alphabet; otherwise GSM 7-bit when every character fits, else UCS-2.
    std::optional<Alphabet> alphabet{};
};

struct SegmentedText {
    Alphabet alphabet = Alphabet::kGsm7;
    std::vector<UserData> parts{}; ///< at least one; with headers when more than one

    friend bool operator==(const SegmentedText &, const SegmentedText &) = default;
};

/// Splits `text` into as many messages as it takes: one of up to 160 septets or 70 UTF-16 units, or
/// parts of 153 or 67 (152 or 66 with a 16-bit reference). No part ends inside a character. Use
/// data_coding_for(result.alphabet) as TP-DCS of every part. More than 255 parts are an error.
Result<SegmentedText> segment(std::string_view text, const SegmentOptions &options = {});

/// A message put together again.
struct CompleteMessage {
    struct Part {
        std::uint8_t data_coding = 0;
        Octets body; ///< as in UserData

        friend bool operator==(const Part &, const Part &) = default;
    };

    Address sender{};
    std::vector<Part> parts{}; ///< in order; one for a message that stands alone

    /// The whole text. Characters that a sender split between two parts are whole again.
    Result<std::string> text() const;
};

/// Collects the parts of concatenated messages, in any order, by sender, reference and total.
///
/// A repeated part is ignored. When more than `max_pending` messages are incomplete, the one whose
/// first part came earliest is dropped.
class Reassembler {
  public:
    static constexpr std::size_t kDefaultMaxPending = 64;

    explicit Reassembler(std::size_t max_pending = kDefaultMaxPending)
        : max_pending_(max_pending) {}

    /// Takes a received message; yields the complete one when this was its last missing part, at
    /// once when it is not concatenated.
    std::optional<CompleteMessage> add(const Deliver &deliver);
    std::optional<CompleteMessage> add(const Address &sender, std::uint8_t data_coding,
                                       const UserData &user_data);

    /// How many messages still lack parts.
    std::size_t pending() const { return pending_.size(); }

  private:
    struct Pending {
        Address sender;
        Concatenation key; // its number stays 0: it stands for all parts
        std::vector<std::optional<CompleteMessage::Part>> parts;
        std::size_t missing = 0;
    };

    std::vector<Pending>::iterator find_or_start(const Address &sender, const Concatenation &key);

    std::size_t max_pending_;
    std::vector<Pending> pending_; // in order of arrival
};

} // namespace tpdu
