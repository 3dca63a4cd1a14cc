// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

/// Originating, destination and recipient addresses (3GPP TS 23.040), and the service centre's.
namespace tpdu {

enum class TypeOfNumber : std::uint8_t {
    kUnknown = 0,
    kInternational = 1,
    kNational = 2,
    kNetworkSpecific = 3,
    kSubscriber = 4,
    kAlphanumeric = 5,
    kAbbreviated = 6,
    kReserved = 7,
};

/// The commonest plans; any value from 0 to 15 is carried through.
enum class NumberingPlan : std::uint8_t {
    kUnknown = 0,
    kIsdn = 1,
    kData = 3,
    kTelex = 4,
    kNational = 8,
    kPrivate = 9,
    kErmes = 10,
    kReserved = 15,
};

/// A party. `text` holds digits (0-9 * # a b c, without a leading '+': the type tells), or, when
/// the type is alphanumeric, a name of the GSM 7-bit alphabet.
struct Address {
    TypeOfNumber type = TypeOfNumber::kUnknown;
    NumberingPlan plan = NumberingPlan::kIsdn;
    std::string text{};

    friend bool operator==(const Address &, const Address &) = default;
};

/// Digits (or septets' worth of semi-octets) that an address field can hold.
inline constexpr std::size_t kMaxAddressSemiOctets = 20;

/// An address from a number as people write it: "+15550100" is international, "0100" of unknown
/// type. Anything but one '+' in front and 1 to 20 digits is an error.
Result<Address> number_address(std::string_view number);

/// An address that is a name of 1 to 11 septets, such as a sender "Weather".
Result<Address> alphanumeric_address(std::string_view name);

/// The address as people write it; the reverse of the two functions above.
std::string to_text(const Address &address);

/// The field as in a TPDU: count of semi-octets, type of address, value. `field` names it in
/// errors.
///
/// These octets are also what ims_sms_send_sms() takes as the service centre's address, which
/// counts digits in its first byte.
Result<Octets> encode_address(const Address &address, std::string_view field = "address");

/// The reverse of encode_address(); `octets` is the field and nothing else.
Result<Address> decode_address(OctetView octets, std::string_view field = "address");

/// The service centre's address as it stands in front of a TPDU and on the bus: count of octets,
/// type of address, digits. Without an address a single zero octet.
Result<Octets> encode_service_centre(const std::optional<Address> &address);

/// The reverse of encode_service_centre(). Always digits, whatever the type says.
Result<std::optional<Address>> decode_service_centre(OctetView octets);

namespace detail {

class Reader;
class Writer;

Address read_address(Reader &in, std::string_view field);
void write_address(Writer &out, const Address &address, std::string_view field);

} // namespace detail

} // namespace tpdu
