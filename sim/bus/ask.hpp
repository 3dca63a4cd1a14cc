// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/result.hpp"
#include "sim/bus/form.hpp"
#include "sim/bus/interface.hpp"

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

// From a method on the bus to a function of a model. A row says only which one,
//
//     {"HoldCall", ask<&CallModel::hold>, kFirstArgument},
//
// and the signatures, the reading of the arguments and the writing of the reply follow from its
// types. Where a model is not asked in the words of the bus a function of the interface stands in
// between: ask<start_conference>, which takes the model first.
namespace sim {

// The commonest reply begins with its result; this one ends with it.
template <typename T>
struct ResultLast {
    T value;
};

namespace asking {

// Who asks is no argument of the method: nothing is said of it, the slot, or all of the request.
template <typename T>
concept Asker = std::same_as<T, int> || std::same_as<T, const Request &>;

// Arguments as they are kept between reading and calling.
template <typename T>
struct Kept {
    using Type = std::remove_cvref_t<T>;
};
template <>
struct Kept<std::string_view> {
    using Type = std::string;
};

template <typename... Ts>
struct Parameters {
    static constexpr bool kAsker = false;
    using Arguments = std::tuple<typename Kept<Ts>::Type...>;
};
template <Asker First, typename... Ts>
struct Parameters<First, Ts...> {
    static constexpr bool kAsker = true;
    using AskerType = First;
    using Arguments = std::tuple<typename Kept<Ts>::Type...>;
};

template <typename Function>
struct Asked;
template <typename Answered, typename Owner, typename... Ts>
struct Asked<Answered (Owner::*)(Ts...)> : Parameters<Ts...> {
    using Reply = Answered;
    using Model = Owner;
};
template <typename Answered, typename Owner, typename... Ts>
struct Asked<Answered (Owner::*)(Ts...) const> : Parameters<Ts...> {
    using Reply = Answered;
    using Model = Owner;
};
template <typename Answered, typename Owner, typename... Ts>
struct Asked<Answered (*)(Owner &, Ts...)> : Parameters<Ts...> {
    using Reply = Answered;
    using Model = std::remove_const_t<Owner>;
};

inline constexpr std::string_view kOpen = "(";
inline constexpr std::string_view kClose = ")";
inline constexpr std::string_view kInteger = "i"; // an application id, a result

template <typename T>
inline constexpr std::string_view kOut =
    wire::Joined<kOpen, kInteger, wire::kSignature<T>, kClose>::kText;
template <typename T>
inline constexpr std::string_view kOut<Answer<T>> = kOut<T>;
template <typename T>
inline constexpr std::string_view kOut<ResultLast<T>> =
    wire::Joined<kOpen, wire::kSignature<T>, kInteger, kClose>::kText;

// How many members a record becomes whose own are of one each.
template <typename T>
constexpr std::size_t members_in() {
    if constexpr (wire::Whole<T>)
        return 1;
    else
        return []<typename... Ts>(std::type_identity<std::tuple<Ts...>>) {
            return (members_in<std::remove_cvref_t<Ts>>() + ... + std::size_t{0});
        }(std::type_identity<decltype(members_of(std::declval<T &>()))>());
}

template <typename T>
inline constexpr std::size_t kResultIndex = 0;
template <typename T>
inline constexpr std::size_t kResultIndex<ResultLast<T>> = members_in<T>();

template <typename T>
Answer<Variant> reply(const T &value) {
    return wire::pack(Result::kOk, value);
}
template <typename T>
Answer<Variant> reply(const Answer<T> &answer) {
    return answer ? reply(*answer) : answer.refusal();
}
template <typename T>
Answer<Variant> reply(const ResultLast<T> &last) {
    return wire::pack(last.value, Result::kOk);
}

} // namespace asking

// `WithoutEffect`: arguments that come after those of the function, are read like them and go
// nowhere.
template <auto kFunction, typename... WithoutEffect>
struct Ask {
    using Asked = asking::Asked<decltype(kFunction)>;
    using Taken = typename Asked::Arguments;
    using All = decltype(std::tuple_cat(std::declval<Taken>(),
                                        std::declval<std::tuple<WithoutEffect...>>()));

    static constexpr std::string_view in(Caller caller) {
        using namespace asking;
        constexpr auto &kArguments = wire::kSignature<All>;
        switch (caller) {
        case Caller::kFirstArgument:
            return wire::Joined<kOpen, kInteger, kArguments, kClose>::kText;
        case Caller::kLastArgument:
            return wire::Joined<kOpen, kArguments, kInteger, kClose>::kText;
        case Caller::kAnybody:
        case Caller::kConnection:
            break;
        }
        return wire::Joined<kOpen, kArguments, kClose>::kText;
    }
    static constexpr std::string_view kOut = asking::kOut<typename Asked::Reply>;
    static constexpr std::size_t kResultIndex = asking::kResultIndex<typename Asked::Reply>;

    // The arguments begin at `first` of those of the request.
    template <typename... Models>
    static Answer<Variant> answer(const std::tuple<Models &...> &models, const Request &request,
                                  std::size_t first) {
        wire::Arguments arguments(request.arguments.get(), first);
        auto taken = arguments.take<Taken>();
        (arguments.take<WithoutEffect>(), ...);
        if (arguments.refusal())
            return *arguments.refusal();
        auto &model = std::get<typename Asked::Model &>(models);
        return asking::reply(
            std::apply([&](auto &&...values) { return call(model, request, std::move(values)...); },
                       std::move(taken)));
    }

  private:
    template <typename Model, typename... Ts>
    static auto call(Model &model, const Request &request, Ts &&...values) {
        if constexpr (!Asked::kAsker)
            return std::invoke(kFunction, model, std::forward<Ts>(values)...);
        else if constexpr (std::same_as<typename Asked::AskerType, int>)
            return std::invoke(kFunction, model, request.slot, std::forward<Ts>(values)...);
        else
            return std::invoke(kFunction, model, request, std::forward<Ts>(values)...);
    }
};

template <auto kFunction, typename... WithoutEffect>
inline constexpr Ask<kFunction, WithoutEffect...> ask{};

// A method of an interface that has these models, each of another class.
template <typename... Models>
struct MethodRow {
    template <auto kFunction, typename... WithoutEffect>
    constexpr MethodRow(std::string_view name, Ask<kFunction, WithoutEffect...> asked, Caller who,
                        std::optional<std::size_t> password_index = {})
        : member(name), in(asked.in(who)), out(asked.kOut), caller(who),
          answer(&Ask<kFunction, WithoutEffect...>::template answer<Models...>),
          result_index(asked.kResultIndex), password(password_index) {}

    std::string_view member;
    std::string_view in;
    std::string_view out;
    Caller caller;
    Answer<Variant> (*answer)(const std::tuple<Models &...> &models, const Request &request,
                              std::size_t first);
    std::size_t result_index;
    std::optional<std::size_t> password; // the argument that the log does not show
};

// The methods keep references to the models.
template <typename... Models>
std::vector<Method> bind_methods(std::span<const std::type_identity_t<MethodRow<Models...>>> rows,
                                 Models &...models) {
    std::vector<Method> methods;
    methods.reserve(rows.size());
    for (const auto &row : rows) {
        const std::size_t first = row.caller == Caller::kFirstArgument ? 1 : 0;
        methods.push_back(
            {row.member, row.in, row.out, row.caller,
             [models = std::tuple<Models &...>(models...), answer = row.answer,
              first](const Request &request) { return answer(models, request, first); },
             row.result_index, row.password});
    }
    return methods;
}

} // namespace sim
