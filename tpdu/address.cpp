// SPDX-License-Identifier: Apache-2.0
#include "tpdu/address.hpp"

#include "tpdu/alphabet.hpp"
#include "tpdu/cursor.hpp"

namespace tpdu {

namespace {

constexpr std::string_view kAddressDigits = "0123456789*#abc";
constexpr std::uint8_t kFill = 0x0F;
constexpr std::uint8_t kNoExtensionBit = 0x80;
constexpr std::size_t kMaxServiceCentreOctets = 1 + kMaxAddressSemiOctets / 2;
constexpr std::string_view kServiceCentre = "service centre address";

/// The semi-octets of `text`, or nothing and a failure in `out`.
Octets to_semi_octets(detail::Writer &out, std::string_view text, std::string_view field) {
    Octets values;
    for (const char c : text) {
        const std::size_t value = kAddressDigits.find(c);
        if (value == std::string_view::npos) {
            out.fail(ErrorKind::kNotEncodable, field,
                     "has no digit for '" + std::string(1, c) + "' in \"" + std::string(text) +
                         "\" (0-9 * # a b c)");
            return {};
        }
        values.push_back(static_cast<std::uint8_t>(value));
    }
    if (values.size() > kMaxAddressSemiOctets) {
        out.fail(ErrorKind::kTooLong, field,
                 "has " + std::to_string(values.size()) + " digits, more than the " +
                     std::to_string(kMaxAddressSemiOctets) + " that fit");
        return {};
    }
    return values;
}

void write_semi_octets(detail::Writer &out, OctetView values) {
    for (std::size_t i = 0; i < values.size(); i += 2) {
        const unsigned high = i + 1 < values.size() ? values[i + 1] : kFill;
        out.octet(high << 4 | values[i]);
    }
}

void write_type(detail::Writer &out, const Address &address, std::string_view field) {
    const auto type = static_cast<unsigned>(address.type);
    const auto plan = static_cast<unsigned>(address.plan);
    if (type > 7 || plan > 15)
        out.fail(ErrorKind::kOutOfRange, field, "has a type or plan that its octet cannot hold");
    out.octet(kNoExtensionBit | type << 4 | plan);
}

/// `count` digits out of `octets`, which hold at least as many.
std::string read_digits(detail::Reader &in, OctetView octets, std::size_t count,
                        std::string_view field) {
    std::string digits;
    for (std::size_t i = 0; i < count; ++i) {
        const unsigned value = i % 2 == 0 ? octets[i / 2] & 0x0F : octets[i / 2] >> 4;
        if (value == kFill) {
            in.fail(ErrorKind::kMalformed, field,
                    "has the filler 0xF in place of digit " + std::to_string(i + 1) + " of " +
                        std::to_string(count));
            return {};
        }
        digits += kAddressDigits[value];
    }
    return digits;
}

void read_type(detail::Reader &in, Address &address, std::string_view field) {
    if (in.remaining() == 0)
        in.fail(ErrorKind::kTruncated, field, "ends before its type of address");
    const std::uint8_t octet = in.octet(field);
    if (in.failed())
        return;
    if ((octet & kNoExtensionBit) == 0) {
        in.fail(ErrorKind::kMalformed, field,
                "has the type of address 0x" + to_hex({&octet, 1}) + ", whose top bit is not set");
    }
    address.type = static_cast<TypeOfNumber>(octet >> 4 & 0x07);
    address.plan = static_cast<NumberingPlan>(octet & 0x0F);
}

bool is_alphanumeric(const Address &address) {
    return address.type == TypeOfNumber::kAlphanumeric;
}

void write_name(detail::Writer &out, const Address &address, std::string_view field) {
    const auto septets = gsm7_encode(address.text);
    if (!septets) {
        out.fail(septets.error().kind, field, "cannot be encoded: " + septets.error().message);
        return;
    }
    const std::size_t semi_octets = (septets->size() * 7 + 3) / 4;
    if (semi_octets > kMaxAddressSemiOctets) {
        out.fail(ErrorKind::kTooLong, field,
                 "has a name of " + std::to_string(septets->size()) +
                     " septets, more than the 11 that fit");
        return;
    }
    out.octet(semi_octets);
    write_type(out, address, field);
    out.octets(pack_septets(*septets));
}

} // namespace

namespace detail {

Address read_address(Reader &in, std::string_view field) {
    const std::size_t semi_octets = in.octet(field);
    if (semi_octets > kMaxAddressSemiOctets) {
        in.fail(ErrorKind::kTooLong, field,
                "says " + std::to_string(semi_octets) + " semi-octets but holds " +
                    std::to_string(kMaxAddressSemiOctets) + " at most");
    }
    Address address;
    read_type(in, address, field);
    const std::size_t size = (semi_octets + 1) / 2;
    if (in.remaining() < size) {
        in.fail(ErrorKind::kTruncated, field,
                "says " + count_of(semi_octets, "semi-octet") + " but " +
                    only_follow(in.remaining()));
    }
    const OctetView value = in.octets(size, field);
    if (in.failed())
        return {};
    if (is_alphanumeric(address)) {
        const auto septets = unpack_septets(value, semi_octets * 4 / 7);
        address.text = gsm7_decode(*septets);
    } else {
        address.text = read_digits(in, value, semi_octets, field);
    }
    return address;
}

void write_address(Writer &out, const Address &address, std::string_view field) {
    if (is_alphanumeric(address)) {
        write_name(out, address, field);
        return;
    }
    const Octets values = to_semi_octets(out, address.text, field);
    out.octet(values.size());
    write_type(out, address, field);
    write_semi_octets(out, values);
}

} // namespace detail

Result<Address> number_address(std::string_view number) {
    Address address;
    std::string_view digits = number;
    if (digits.starts_with('+')) {
        address.type = TypeOfNumber::kInternational;
        digits.remove_prefix(1);
    }
    if (digits.empty())
        return make_error(ErrorKind::kNotEncodable, "number", "has no digits");
    detail::Writer check;
    to_semi_octets(check, digits, "number");
    address.text = digits;
    if (const auto checked = std::move(check).finish(); !checked)
        return checked.error();
    return address;
}

Result<Address> alphanumeric_address(std::string_view name) {
    if (name.empty())
        return make_error(ErrorKind::kNotEncodable, "name", "is empty");
    Address address{TypeOfNumber::kAlphanumeric, NumberingPlan::kUnknown, std::string(name)};
    detail::Writer check;
    write_name(check, address, "name");
    if (const auto checked = std::move(check).finish(); !checked)
        return checked.error();
    return address;
}

std::string to_text(const Address &address) {
    if (address.type == TypeOfNumber::kInternational)
        return "+" + address.text;
    return address.text;
}

Result<Octets> encode_address(const Address &address, std::string_view field) {
    detail::Writer out;
    detail::write_address(out, address, field);
    return std::move(out).finish();
}

Result<Address> decode_address(OctetView octets, std::string_view field) {
    detail::Reader in(octets);
    Address address = detail::read_address(in, field);
    in.expect_end(field);
    return in.finish(std::move(address));
}

Result<Octets> encode_service_centre(const std::optional<Address> &address) {
    if (!address)
        return Octets{0};
    detail::Writer out;
    const Octets values = to_semi_octets(out, address->text, kServiceCentre);
    out.octet(1 + (values.size() + 1) / 2);
    write_type(out, *address, kServiceCentre);
    write_semi_octets(out, values);
    return std::move(out).finish();
}

Result<std::optional<Address>> decode_service_centre(OctetView octets) {
    detail::Reader in(octets);
    const std::size_t size = in.octet(kServiceCentre);
    if (size > kMaxServiceCentreOctets) {
        in.fail(ErrorKind::kTooLong, kServiceCentre,
                "says " + std::to_string(size) + " octets but holds " +
                    std::to_string(kMaxServiceCentreOctets) + " at most");
    }
    std::optional<Address> address;
    if (size > 0 && !in.failed()) {
        address.emplace();
        read_type(in, *address, kServiceCentre);
        const OctetView value = in.octets(size - 1, kServiceCentre);
        const bool odd = !value.empty() && value.back() >> 4 == kFill;
        address->text = read_digits(in, value, value.size() * 2 - (odd ? 1 : 0), kServiceCentre);
    }
    in.expect_end(kServiceCentre);
    return in.finish(std::move(address));
}

} // namespace tpdu
