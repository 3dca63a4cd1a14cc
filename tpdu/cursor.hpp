// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tpdu/octets.hpp"
#include "tpdu/result.hpp"

#include <algorithm>
#include <array>
#include <optional>
#include <string>
#include <string_view>

/// Reading and writing octets field by field. For the codec's own units, not for its users.
namespace tpdu::detail {

inline std::string count_of(std::size_t count, std::string_view noun) {
    std::string text = std::to_string(count) + ' ' + std::string(noun);
    if (count != 1)
        text += 's';
    return text;
}

/// "only 3 octets follow", for errors about what is missing.
inline std::string only_follow(std::size_t octets) {
    return "only " + count_of(octets, "octet") + (octets == 1 ? " follows" : " follow");
}

/// Takes octets from the front and never past the end. The first failure sticks: from then on every
/// read yields zeros, so that a decoder can read all its fields and ask once, in finish().
class Reader {
  public:
    explicit Reader(OctetView octets) : rest_(octets) {}

    std::size_t remaining() const { return failed() ? 0 : rest_.size(); }
    bool failed() const { return error_.has_value(); }

    void fail(ErrorKind kind, std::string_view field, std::string_view problem) {
        if (!error_)
            error_ = make_error(kind, field, problem);
    }

    std::uint8_t octet(std::string_view field) {
        if (remaining() == 0) {
            fail(ErrorKind::kTruncated, field, "is missing: the message ends before it");
            return 0;
        }
        const std::uint8_t value = rest_.front();
        rest_ = rest_.subspan(1);
        return value;
    }

    /// `count` octets, or none after a failure.
    OctetView octets(std::size_t count, std::string_view field) {
        if (remaining() < count) {
            fail(ErrorKind::kTruncated, field,
                 "needs " + count_of(count, "octet") + " but " + only_follow(remaining()));
        }
        if (failed())
            return {};
        const OctetView taken = rest_.first(count);
        rest_ = rest_.subspan(count);
        return taken;
    }

    /// `N` octets, or zeros after a failure.
    template <std::size_t N>
    std::array<std::uint8_t, N> octets(std::string_view field) {
        std::array<std::uint8_t, N> values{};
        const OctetView taken = octets(N, field);
        std::copy(taken.begin(), taken.end(), values.begin());
        return values;
    }

    void expect_end(std::string_view last_field) {
        if (remaining() != 0) {
            fail(ErrorKind::kTrailing, last_field,
                 "ends before the message does: " + count_of(remaining(), "octet") + " left over");
        }
    }

    template <typename T>
    Result<T> finish(T value) const {
        if (error_)
            return *error_;
        return value;
    }

  private:
    OctetView rest_;
    std::optional<Error> error_;
};

/// Appends octets; keeps the first failure for finish().
class Writer {
  public:
    bool failed() const { return error_.has_value(); }

    void fail(ErrorKind kind, std::string_view field, std::string_view problem) {
        fail(make_error(kind, field, problem));
    }
    void fail(Error error) {
        if (!error_)
            error_ = std::move(error);
    }

    void octet(std::size_t value) { octets_.push_back(static_cast<std::uint8_t>(value)); }
    void octets(OctetView values) { octets_.insert(octets_.end(), values.begin(), values.end()); }

    Result<Octets> finish() && {
        if (error_)
            return std::move(*error_);
        return std::move(octets_);
    }

  private:
    Octets octets_;
    std::optional<Error> error_;
};

} // namespace tpdu::detail
