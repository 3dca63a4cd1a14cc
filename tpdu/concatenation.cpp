// SPDX-License-Identifier: Apache-2.0
#include "tpdu/concatenation.hpp"

#include "tpdu/unicode.hpp"

#include <algorithm>

namespace tpdu {

namespace {

constexpr std::uint8_t kElement8Bit = 0x00;
constexpr std::uint8_t kElement16Bit = 0x08;
constexpr std::size_t kUserDataOctets = 140;
constexpr std::size_t kMaxParts = 255;

bool makes_sense(const Concatenation &concatenation) {
    return concatenation.total >= 1 && concatenation.number >= 1 &&
           concatenation.number <= concatenation.total;
}

std::optional<Concatenation> read_element(const InformationElement &element) {
    const Octets &data = element.data;
    Concatenation found;
    if (element.id == kElement8Bit && data.size() == 3)
        found = {data[0], ReferenceWidth::k8Bit, data[1], data[2]};
    else if (element.id == kElement16Bit && data.size() == 4)
        found = {static_cast<std::uint16_t>(data[0] << 8 | data[1]), ReferenceWidth::k16Bit,
                 data[2], data[3]};
    else
        return std::nullopt;
    return makes_sense(found) ? std::optional(found) : std::nullopt;
}

std::size_t concatenation_header_size(ReferenceWidth width) {
    return width == ReferenceWidth::k8Bit ? 6 : 7;
}

/// Elements of a body (septets, or octets of UTF-16) that fit behind a header of that size.
std::size_t capacity_behind(std::size_t header_octets, Alphabet alphabet) {
    const std::size_t octets = kUserDataOctets - header_octets;
    return alphabet == Alphabet::kGsm7 ? octets * 8 / 7 : octets / 2 * 2;
}

/// Where a part that begins at `begin` ends, so that it holds at most `capacity` elements and does
/// not part an escape from its code or a surrogate from its partner.
std::size_t part_end(const Octets &body, std::size_t begin, std::size_t capacity,
                     Alphabet alphabet) {
    const std::size_t end = begin + capacity;
    if (end >= body.size())
        return body.size();
    if (alphabet == Alphabet::kGsm7)
        return body[end - 1] == kGsm7Escape ? end - 1 : end;
    const auto last_unit = static_cast<char32_t>(body[end - 2] << 8 | body[end - 1]);
    return detail::is_high_surrogate(last_unit) ? end - 2 : end;
}

std::vector<Octets> split(const Octets &body, std::size_t capacity, Alphabet alphabet) {
    std::vector<Octets> bodies;
    for (std::size_t begin = 0; begin < body.size();) {
        const std::size_t end = part_end(body, begin, capacity, alphabet);
        bodies.emplace_back(body.begin() + static_cast<std::ptrdiff_t>(begin),
                            body.begin() + static_cast<std::ptrdiff_t>(end));
        begin = end;
    }
    return bodies;
}

bool same_coding(std::uint8_t a, std::uint8_t b) {
    const DataCoding left = decode_data_coding(a);
    const DataCoding right = decode_data_coding(b);
    return left.alphabet == right.alphabet && left.compressed == right.compressed;
}

Alphabet choose_alphabet(std::string_view text, const SegmentOptions &options) {
    if (options.alphabet)
        return *options.alphabet;
    return gsm7_septets(text) ? Alphabet::kGsm7 : Alphabet::kUcs2;
}

} // namespace

std::optional<Concatenation> find_concatenation(const UserDataHeader &header) {
    std::optional<Concatenation> last;
    for (const InformationElement &element : header.elements) {
        if (const auto found = read_element(element))
            last = found;
    }
    return last;
}

Result<InformationElement> concatenation_element(const Concatenation &concatenation) {
    const auto &[reference, width, total, number] = concatenation;
    if (!makes_sense(concatenation)) {
        return make_error(ErrorKind::kOutOfRange, "concatenation",
                          "cannot be part " + std::to_string(number) + " of " +
                              std::to_string(total));
    }
    if (width == ReferenceWidth::k8Bit && reference > 255) {
        return make_error(ErrorKind::kOutOfRange, "concatenation",
                          "has the reference " + std::to_string(reference) +
                              ", too large for 8 bits");
    }
    const auto low = static_cast<std::uint8_t>(reference & 0xFF);
    if (width == ReferenceWidth::k8Bit)
        return InformationElement{kElement8Bit, {low, total, number}};
    const auto high = static_cast<std::uint8_t>(reference >> 8);
    return InformationElement{kElement16Bit, {high, low, total, number}};
}

Result<SegmentedText> segment(std::string_view text, const SegmentOptions &options) {
    SegmentedText result;
    result.alphabet = choose_alphabet(text, options);
    auto whole = encode_text(text, result.alphabet);
    if (!whole)
        return whole.error();
    if (whole->body.size() <= capacity_behind(0, result.alphabet)) {
        result.parts.push_back(*std::move(whole));
        return result;
    }
    const std::size_t capacity =
        capacity_behind(concatenation_header_size(options.width), result.alphabet);
    auto bodies = split(whole->body, capacity, result.alphabet);
    if (bodies.size() > kMaxParts) {
        return make_error(ErrorKind::kTooLong, "text",
                          "takes " + std::to_string(bodies.size()) + " messages but " +
                              std::to_string(kMaxParts) + " parts are the most");
    }
    Concatenation concatenation{options.reference, options.width,
                                static_cast<std::uint8_t>(bodies.size()), 0};
    for (Octets &body : bodies) {
        ++concatenation.number;
        auto element = concatenation_element(concatenation);
        if (!element)
            return element.error();
        result.parts.push_back({UserDataHeader{{*std::move(element)}}, std::move(body)});
    }
    return result;
}

Result<std::string> CompleteMessage::text() const {
    std::string whole;
    for (auto first = parts.begin(); first != parts.end();) {
        // Parts of one coding are joined before decoding: a character may continue in the next.
        const auto next = std::find_if(first, parts.end(), [first](const Part &part) {
            return !same_coding(part.data_coding, first->data_coding);
        });
        const std::uint8_t data_coding = first->data_coding;
        Octets body;
        for (; first != next; ++first)
            body.insert(body.end(), first->body.begin(), first->body.end());
        const auto text = decode_text(data_coding, body);
        if (!text)
            return text.error();
        whole += *text;
    }
    return whole;
}

std::optional<CompleteMessage> Reassembler::add(const Deliver &deliver) {
    return add(deliver.originator, deliver.data_coding, deliver.user_data);
}

std::optional<CompleteMessage> Reassembler::add(const Address &sender, std::uint8_t data_coding,
                                                const UserData &user_data) {
    CompleteMessage::Part part{data_coding, user_data.body};
    const auto concatenation =
        user_data.header ? find_concatenation(*user_data.header) : std::nullopt;
    if (!concatenation)
        return CompleteMessage{sender, {std::move(part)}};

    const auto pending = find_or_start(sender, *concatenation);
    auto &place = pending->parts[concatenation->number - 1U];
    if (!place) {
        place = std::move(part);
        --pending->missing;
    }
    if (pending->missing == 0) {
        CompleteMessage message{sender, {}};
        for (auto &collected : pending->parts)
            message.parts.push_back(*std::move(collected));
        pending_.erase(pending);
        return message;
    }
    if (pending_.size() > max_pending_)
        pending_.erase(pending_.begin());
    return std::nullopt;
}

std::vector<Reassembler::Pending>::iterator Reassembler::find_or_start(const Address &sender,
                                                                       const Concatenation &key) {
    Concatenation any_part = key;
    any_part.number = 0;
    const auto found = std::find_if(pending_.begin(), pending_.end(), [&](const Pending &pending) {
        return pending.key == any_part && pending.sender == sender;
    });
    if (found != pending_.end())
        return found;
    Pending started{sender, any_part, {}, any_part.total};
    started.parts.resize(any_part.total);
    pending_.push_back(std::move(started));
    return std::prev(pending_.end());
}

} // namespace tpdu
