// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/tpdu.hpp"

#include <cstdint>
#include <ostream>
#include <random>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>

namespace tpdu {

// Found by argument-dependent lookup; makes failed comparisons readable.
inline void PrintTo(const Address &address, std::ostream *out) {
    *out << "type " << static_cast<int>(address.type) << " plan " << static_cast<int>(address.plan)
         << " \"" << address.text << '"';
}

inline void PrintTo(const Timestamp &time, std::ostream *out) {
    *out << to_text(time);
}

inline void PrintTo(const UserData &user_data, std::ostream *out) {
    *out << (user_data.header ? "header" : "no header") << ", body " << to_hex(user_data.body);
}

} // namespace tpdu

namespace tpdu_test {

/// The value of a result that has to be one; an error fails the test with its message.
template <typename T>
T must(tpdu::Result<T> result) {
    if (!result)
        throw std::runtime_error("unexpected error: " + result.error().message);
    return *std::move(result);
}

/// Octets written in hexadecimal; blanks set fields apart.
inline tpdu::Octets hex(std::string_view text) {
    std::string digits;
    for (const char c : text) {
        if (c != ' ')
            digits += c;
    }
    return must(tpdu::from_hex(digits));
}

/// Reproducible everywhere: the distributions of the standard library are not.
class Random {
  public:
    explicit Random(std::uint32_t seed) : engine_(seed) {}

    /// 0 to bound - 1.
    std::uint32_t below(std::uint32_t bound) {
        return static_cast<std::uint32_t>(engine_() % bound);
    }
    bool coin() { return below(2) == 1; }
    std::uint8_t octet() { return static_cast<std::uint8_t>(below(256)); }

    tpdu::Octets octets(std::size_t count) {
        tpdu::Octets values;
        for (std::size_t i = 0; i < count; ++i)
            values.push_back(octet());
        return values;
    }

    std::string pick_from(std::string_view letters, std::size_t count) {
        std::string text;
        for (std::size_t i = 0; i < count; ++i)
            text += letters[below(static_cast<std::uint32_t>(letters.size()))];
        return text;
    }

  private:
    std::mt19937 engine_;
};

} // namespace tpdu_test
