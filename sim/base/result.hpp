// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <cstdint>
#include <fmt/format.h>
#include <string>
#include <utility>
#include <variant>

namespace sim {

// The first integer of a reply. 1 and 2 stay free: a client uses them for failures of the bus
// itself, and a refusal must not look like one.
enum class Result : std::int32_t {
    kOk = 0,
    kInvalidArgument = 10,
    kUnknownApplication = 11,
    kUnknownSession = 12,
    kWrongState = 13,
    kLineInUse = 14,
    kTooMany = 15,
    kBarred = 16,
    kFailed = 17,
    kWrongPassword = 18,
    kUnknownRecord = 19,
    kDuplicate = 20,
};

struct Refusal {
    Result code = Result::kFailed;
    std::string reason;
};

template <typename... Args>
Refusal refuse(Result code, fmt::format_string<Args...> text, Args &&...args) {
    return {code, fmt::format(text, std::forward<Args>(args)...)};
}

// What a request came to: its value, or why it was refused.
template <typename T>
class [[nodiscard]] Answer {
  public:
    Answer(T value) : content_(std::move(value)) {}
    Answer(Refusal refusal) : content_(std::move(refusal)) {}

    explicit operator bool() const { return std::holds_alternative<T>(content_); }
    T &operator*() { return std::get<T>(content_); }
    const T &operator*() const { return std::get<T>(content_); }
    const T *operator->() const { return &std::get<T>(content_); }
    const Refusal &refusal() const { return std::get<Refusal>(content_); }
    Result code() const { return *this ? Result::kOk : refusal().code; }

  private:
    std::variant<T, Refusal> content_;
};

struct Done {};
using Status = Answer<Done>;

} // namespace sim
