// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <variant>

namespace tpdu {

/// What sort of thing went wrong, for callers that act on it.
enum class ErrorKind : std::uint8_t {
    kTruncated,    ///< the octets end before a field is complete
    kTrailing,     ///< octets are left over that no field accounts for
    kMalformed,    ///< a field contradicts itself or another one
    kTooLong,      ///< more than the field, message or numbering can hold
    kOutOfRange,   ///< a value that the field cannot express
    kNotEncodable, ///< text that the alphabet or the digit set does not have
    kUnsupported,  ///< legal, but not handled here (compression, SMS-COMMAND)
};

/// Why a conversion failed. `message` is a complete sentence for people and begins with the field.
struct Error {
    ErrorKind kind;
    std::string field;
    std::string message;
};

/// Makes an error whose message is the field's name followed by `problem`.
inline Error make_error(ErrorKind kind, std::string_view field, std::string_view problem) {
    std::string message(field);
    message += ' ';
    message += problem;
    return Error{kind, std::string(field), std::move(message)};
}

/// Either a value or the error that prevented it. Test it before use:
///
///     auto submit = tpdu::decode_submit(octets);
///     if (!submit) { complain(submit.error().message); return; }
///     use(submit->destination);
template <typename T>
class [[nodiscard]] Result {
  public:
    // Implicit, so that a function can return either one plainly.
    Result(T value) : content_(std::in_place_index<0>, std::move(value)) {}
    Result(Error error) : content_(std::in_place_index<1>, std::move(error)) {}

    bool ok() const noexcept { return content_.index() == 0; }
    explicit operator bool() const noexcept { return ok(); }

    /// Only when ok().
    const T &value() const & { return std::get<0>(content_); }
    T &value() & { return std::get<0>(content_); }
    T &&value() && { return std::get<0>(std::move(content_)); }
    const T &operator*() const & { return value(); }
    T &operator*() & { return value(); }
    T &&operator*() && { return std::move(*this).value(); }
    const T *operator->() const { return &value(); }
    T *operator->() { return &value(); }

    /// Only when not ok().
    const Error &error() const { return std::get<1>(content_); }

  private:
    std::variant<T, Error> content_;
};

} // namespace tpdu
