// SPDX-License-Identifier: Apache-2.0
#include "tpdu/user_data.hpp"

#include "tpdu/cursor.hpp"

#include <algorithm>

namespace tpdu {

namespace {

constexpr std::string_view kLength = "TP-UDL";
constexpr std::string_view kHeader = "TP-UDH";
constexpr std::string_view kData = "TP-UD";

/// Whether TP-UDL counts septets.
bool counts_septets(const DataCoding &coding) {
    return coding.alphabet == Alphabet::kGsm7 && !coding.compressed;
}

constexpr std::size_t octets_for_septets(std::size_t septets) {
    return (septets * 7 + 7) / 8;
}
constexpr std::size_t septets_for_octets(std::size_t octets) {
    return (octets * 8 + 6) / 7;
}
constexpr std::size_t septets_within(std::size_t octets) {
    return octets * 8 / 7;
}

/// Bits between a header of `octets` and the first septet boundary behind it.
constexpr std::size_t fill_bits_behind(std::size_t octets) {
    return septets_for_octets(octets) * 7 - octets * 8;
}

/// Takes the elements out of `octets`, which are the header without its length octet.
UserDataHeader parse_header(detail::Reader &in, OctetView octets) {
    UserDataHeader header;
    while (!octets.empty()) {
        if (octets.size() < 2) {
            in.fail(ErrorKind::kTruncated, kHeader,
                    "ends inside an information element: one octet left");
            return {};
        }
        const std::uint8_t id = octets[0];
        const std::size_t size = octets[1];
        octets = octets.subspan(2);
        if (size > octets.size()) {
            in.fail(ErrorKind::kTruncated, kHeader,
                    "has the element 0x" + to_hex({&id, 1}) + " of " +
                        detail::count_of(size, "octet") + " but " +
                        detail::only_follow(octets.size()) + " in the header");
            return {};
        }
        const OctetView data = octets.first(size);
        header.elements.push_back({id, Octets(data.begin(), data.end())});
        octets = octets.subspan(size);
    }
    return header;
}

/// Takes the header off the front of the whole TP-UD.
std::optional<UserDataHeader> take_header(detail::Reader &in, OctetView octets) {
    if (octets.empty()) {
        in.fail(ErrorKind::kMalformed, kHeader, "is announced by TP-UDHI but TP-UD is empty");
        return std::nullopt;
    }
    const std::size_t size = octets[0];
    if (size > octets.size() - 1) {
        in.fail(ErrorKind::kTruncated, kHeader,
                "says " + detail::count_of(size, "octet") + " but " +
                    detail::only_follow(octets.size() - 1) + " in TP-UD");
        return std::nullopt;
    }
    return parse_header(in, octets.subspan(1, size));
}

/// The octets of TP-UD after checking `length` against the limit and what is there.
OctetView take_octets(detail::Reader &in, std::size_t length, bool septets,
                      const detail::UserDataLimit &limit) {
    const std::string_view unit = septets ? "septet" : "octet";
    const std::size_t most = septets ? septets_within(limit.octets) : limit.octets;
    if (length > most) {
        in.fail(ErrorKind::kTooLong, kLength,
                "says " + detail::count_of(length, unit) + " but " + std::string(limit.message) +
                    " carries " + std::to_string(most) + " at most");
        return {};
    }
    const std::size_t size = septets ? octets_for_septets(length) : length;
    if (size > in.remaining()) {
        in.fail(ErrorKind::kTruncated, kLength,
                "says " + detail::count_of(length, unit) + " but " +
                    detail::only_follow(in.remaining()));
        return {};
    }
    return in.octets(size, kData);
}

Octets septet_body(detail::Reader &in, OctetView octets, std::size_t length,
                   std::size_t header_octets) {
    const std::size_t header_units = septets_for_octets(header_octets);
    if (header_units > length) {
        in.fail(ErrorKind::kMalformed, kLength,
                "says " + detail::count_of(length, "septet") + " but the header alone takes " +
                    std::to_string(header_units));
        return {};
    }
    return *unpack_septets(octets.subspan(header_octets), length - header_units,
                           fill_bits_behind(header_octets));
}

void write_header(detail::Writer &out, const UserDataHeader &header, std::size_t size) {
    out.octet(size - 1);
    for (const InformationElement &element : header.elements) {
        out.octet(element.id);
        out.octet(element.data.size());
        out.octets(element.data);
    }
}

} // namespace

Result<UserData> encode_text(std::string_view text, Alphabet alphabet) {
    if (alphabet == Alphabet::kEightBit)
        return make_error(ErrorKind::kUnsupported, kData, "cannot hold text as 8-bit data");
    auto body = alphabet == Alphabet::kGsm7 ? gsm7_encode(text) : ucs2_encode(text);
    if (!body)
        return body.error();
    return UserData{std::nullopt, *std::move(body)};
}

Result<std::string> decode_text(std::uint8_t data_coding, OctetView body) {
    const DataCoding coding = decode_data_coding(data_coding);
    if (coding.compressed)
        return make_error(ErrorKind::kUnsupported, kData, "holds compressed text");
    switch (coding.alphabet) {
    case Alphabet::kGsm7:
        return gsm7_decode(body);
    case Alphabet::kUcs2:
        return ucs2_decode(body);
    case Alphabet::kEightBit:
        break;
    }
    return make_error(ErrorKind::kUnsupported, kData, "holds 8-bit data, not text");
}

std::size_t header_size(const std::optional<UserDataHeader> &header) {
    if (!header)
        return 0;
    std::size_t size = 1;
    for (const InformationElement &element : header->elements)
        size += 2 + element.data.size();
    return size;
}

std::size_t header_septets(const std::optional<UserDataHeader> &header) {
    return septets_for_octets(header_size(header));
}

namespace detail {

UserData read_user_data(Reader &in, std::uint8_t data_coding, bool with_header,
                        const UserDataLimit &limit) {
    const std::size_t length = in.octet(kLength);
    const bool septets = counts_septets(decode_data_coding(data_coding));
    const OctetView octets = take_octets(in, length, septets, limit);
    UserData user_data;
    if (with_header)
        user_data.header = take_header(in, octets);
    if (in.failed())
        return {};
    const std::size_t header_octets = with_header ? 1U + octets[0] : 0U;
    if (septets) {
        user_data.body = septet_body(in, octets, length, header_octets);
    } else {
        const OctetView body = octets.subspan(header_octets);
        user_data.body.assign(body.begin(), body.end());
    }
    return user_data;
}

void write_user_data(Writer &out, const UserData &user_data, std::uint8_t data_coding,
                     const UserDataLimit &limit) {
    const DataCoding coding = decode_data_coding(data_coding);
    const bool septets = counts_septets(coding);
    const std::size_t header_octets = header_size(user_data.header);
    const std::size_t length =
        user_data.body.size() + (septets ? header_septets(user_data.header) : header_octets);
    const std::size_t most = septets ? septets_within(limit.octets) : limit.octets;
    if (length > most) {
        out.fail(ErrorKind::kTooLong, kData,
                 "takes " + count_of(length, septets ? "septet" : "octet") + " but " +
                     std::string(limit.message) + " carries " + std::to_string(most) + " at most");
        return;
    }
    if (septets && std::any_of(user_data.body.begin(), user_data.body.end(),
                               [](std::uint8_t value) { return value > 0x7F; })) {
        out.fail(ErrorKind::kOutOfRange, kData, "has a septet above 127");
        return;
    }
    if (coding.alphabet == Alphabet::kUcs2 && !coding.compressed &&
        user_data.body.size() % 2 != 0) {
        out.fail(ErrorKind::kMalformed, kData, "has an odd number of octets for UCS-2 text");
        return;
    }
    out.octet(length);
    if (user_data.header)
        write_header(out, *user_data.header, header_octets);
    if (septets)
        out.octets(pack_septets(user_data.body, fill_bits_behind(header_octets)));
    else
        out.octets(user_data.body);
}

} // namespace detail

} // namespace tpdu
