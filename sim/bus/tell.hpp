// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/form.hpp"
#include "sim/bus/interface.hpp"

#include <array>
#include <concepts>
#include <optional>
#include <span>
#include <string_view>
#include <tuple>
#include <variant>

// From a model's event to a signal on the bus: a row says which signal stands for which event, and
// its signature follows from the event's members or from what a function makes of them.
namespace sim {

namespace telling {

template <typename Body>
struct Unwrapped {
    using Type = Body;
};
template <typename Body>
struct Unwrapped<std::optional<Body>> {
    using Type = Body;
};

inline constexpr std::string_view kOpen = "(";
inline constexpr std::string_view kClose = ")";

} // namespace telling

// A body that is optional: events without one are another row's.
template <typename Event, typename Body = Event>
class SignalRow {
  public:
    using Told = Event;

    // The event's members, in their order.
    constexpr explicit SignalRow(std::string_view member) : member_(member) {
        static_assert(std::same_as<Event, Body>);
    }
    constexpr SignalRow(std::string_view member, Body (*body)(const Event &))
        : member_(member), body_(body) {}

    constexpr SignalInfo info() const {
        using Content = typename telling::Unwrapped<Body>::Type;
        return {member_,
                wire::Joined<telling::kOpen, wire::kSignature<Content>, telling::kClose>::kText};
    }
    // Whether it is this row's.
    bool tell(const Event &event, Signal &signal) const {
        if constexpr (std::same_as<Event, Body>)
            return tell_body(event, signal);
        else
            return tell_body(body_(event), signal);
    }
    template <typename Other>
    static bool tell(const Other &, Signal &) {
        return false;
    }

  private:
    template <typename Content>
    bool tell_body(const Content &content, Signal &signal) const {
        signal = {member_, wire::pack(content)};
        return true;
    }
    template <typename Content>
    bool tell_body(const std::optional<Content> &content, Signal &signal) const {
        return content && tell_body(*content, signal);
    }

    std::string_view member_;
    Body (*body_)(const Event &) = nullptr;
};

// All signals of an interface.
template <typename... Rows>
class SignalTable {
  public:
    constexpr explicit SignalTable(Rows... rows) : rows_(rows...), infos_{rows.info()...} {}

    constexpr std::span<const SignalInfo> infos() const { return infos_; }

    template <typename Event>
    Signal signal_of(const Event &event) const {
        static_assert((std::same_as<Event, typename Rows::Told> || ...), "an event without a row");
        Signal signal;
        std::apply([&](const auto &...rows) { (rows.tell(event, signal) || ...); }, rows_);
        return signal;
    }
    template <typename... Events>
    Signal signal_of(const std::variant<Events...> &event) const {
        return std::visit([this](const auto &content) { return this->signal_of(content); }, event);
    }

  private:
    std::tuple<Rows...> rows_;
    std::array<SignalInfo, sizeof...(Rows)> infos_;
};

} // namespace sim
