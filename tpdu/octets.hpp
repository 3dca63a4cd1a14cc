// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/result.hpp"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace tpdu {

using Octets = std::vector<std::uint8_t>;
using OctetView = std::span<const std::uint8_t>;

/// Two upper-case hexadecimal digits an octet, without separators.
std::string to_hex(OctetView octets);

/// The reverse of to_hex(); upper or lower case, no separators.
Result<Octets> from_hex(std::string_view text);

} // namespace tpdu
