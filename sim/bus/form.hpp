// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/glib_ref.hpp"
#include "sim/base/result.hpp"
#include "sim/bus/members.hpp"
#include "sim/bus/wire.hpp"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <tuple>
#include <type_traits>
#include <utility>
#include <vector>

// How a C++ type travels, said once for its signature, for reading and for writing.
namespace sim::wire {

class Tuple;

// A type that travels as it is said here:
//   kSignature, of the one member or the few that it becomes
//   read(const Variant &member), which gives the value, or an Answer where the content can be wrong
//   write(Tuple &, value)
// Modules add their own. A record, a tuple or an array without a form travels member by member.
template <typename T>
struct Form;

template <typename T>
concept Whole = requires {
    Form<T>::kSignature;
};

// What read() and write() know by themselves.
template <typename T>
inline constexpr std::string_view kLetter{};
template <>
inline constexpr std::string_view kLetter<std::int32_t> = "i";
template <>
inline constexpr std::string_view kLetter<std::uint32_t> = "u";
template <>
inline constexpr std::string_view kLetter<std::uint8_t> = "y";
template <>
inline constexpr std::string_view kLetter<bool> = "b";
template <>
inline constexpr std::string_view kLetter<std::string> = "s";
template <>
inline constexpr std::string_view kLetter<Texts> = "v";
template <>
inline constexpr std::string_view kLetter<Numbers> = "v";
template <typename T>
requires std::is_enum_v<T>
inline constexpr std::string_view kLetter<T> = "i";

// The keys under which the members of an entry stand in a list of dictionaries.
template <typename T>
inline constexpr std::array<const char *, 0> kKeys{};

// One text of several.
template <const std::string_view &...kTexts>
struct Joined {
    static constexpr auto kLetters = [] {
        std::array<char, (kTexts.size() + ... + 0)> letters{};
        [[maybe_unused]] auto end = letters.begin(); // without texts
        ((end = std::ranges::copy(kTexts, end).out), ...);
        return letters;
    }();
    static constexpr std::string_view kText{kLetters.data(), kLetters.size()};
};

template <typename Members>
struct JoinedMembers;

// Of the members that a type becomes, without parentheses.
template <typename T>
inline constexpr std::string_view kSignature = [] {
    if constexpr (Whole<T>)
        return Form<T>::kSignature;
    else
        return JoinedMembers<decltype(members_of(std::declval<T &>()))>::kText;
}();

template <typename... Ts>
struct JoinedMembers<std::tuple<Ts...>> {
    static constexpr std::string_view kText = Joined<kSignature<std::remove_cvref_t<Ts>>...>::kText;
};

// The members of a tuple, one after the other. Its signature has been checked against the types
// that are taken.
class Arguments {
  public:
    explicit Arguments(GVariant *tuple, std::size_t first = 0) : tuple_(tuple), next_(first) {}

    template <typename T>
    T take() {
        if constexpr (Whole<T>) {
            return accepted(
                Form<T>::read(Variant::adopt(g_variant_get_child_value(tuple_, next_++))));
        } else {
            T record{};
            std::apply(
                [&](auto &...members) {
                    ((members = take<std::remove_reference_t<decltype(members)>>()), ...);
                },
                members_of(record));
            return record;
        }
    }
    // Of the first whose content was wrong; what was taken for it is empty.
    const std::optional<Refusal> &refusal() const { return refusal_; }

  private:
    template <typename T>
    static T accepted(T value) {
        return value;
    }
    template <typename T>
    T accepted(Answer<T> answer) {
        if (answer)
            return *std::move(answer);
        if (!refusal_)
            refusal_ = answer.refusal();
        return {};
    }

    GVariant *tuple_;
    gsize next_;
    std::optional<Refusal> refusal_;
};

// Builds a tuple member by member.
class Tuple {
  public:
    Tuple() { g_variant_builder_init(&builder_, G_VARIANT_TYPE_TUPLE); }
    Tuple(const Tuple &) = delete;
    Tuple &operator=(const Tuple &) = delete;
    ~Tuple() { g_variant_builder_clear(&builder_); }

    template <typename T>
    Tuple &add(const T &value) {
        if constexpr (Whole<T>)
            Form<T>::write(*this, value);
        else
            std::apply([&](const auto &...members) { (add(members), ...); }, members_of(value));
        return *this;
    }
    void put(GVariant *member) { g_variant_builder_add_value(&builder_, member); }
    Variant end() { return Variant(g_variant_builder_end(&builder_)); }

  private:
    GVariantBuilder builder_;
};

template <typename... Ts>
Variant pack(const Ts &...values) {
    Tuple tuple;
    (tuple.add(values), ...);
    return tuple.end();
}

template <typename T>
requires(!kLetter<T>.empty()) struct Form<T> {
    static constexpr std::string_view kSignature = kLetter<T>;
    static T read(const Variant &member) { return wire::read<T>(member.get()); }
    static void write(Tuple &tuple, const T &value) { tuple.put(wire::write(value)); }
};

// A member that is a variant, for those who look into it themselves.
template <>
struct Form<Variant> {
    static constexpr std::string_view kSignature = "v";
    static Variant read(const Variant &member) { return member; }
};

template <>
struct Form<std::vector<std::int32_t>> {
    static constexpr std::string_view kSignature = "v";
    static void write(Tuple &tuple, const std::vector<std::int32_t> &values) {
        tuple.put(wire::write(values));
    }
};

template <>
struct Form<std::vector<std::string>> {
    static constexpr std::string_view kSignature = "v";
    static void write(Tuple &tuple, const std::vector<std::string> &values) {
        tuple.put(wire::write(values));
    }
};

// Dictionaries that a module has made itself.
struct Dictionary {
    Variant content;
};
struct Dictionaries {
    Variant content;
};

template <>
struct Form<Dictionary> {
    static constexpr std::string_view kSignature = "a{sv}";
    static void write(Tuple &tuple, const Dictionary &dictionary) {
        tuple.put(dictionary.content.get());
    }
};

template <>
struct Form<Dictionaries> {
    static constexpr std::string_view kSignature = "aa{sv}";
    static void write(Tuple &tuple, const Dictionaries &list) { tuple.put(list.content.get()); }
};

// How many entries there are, and a dictionary for each.
template <typename T>
requires(!kKeys<T>.empty()) struct Form<std::vector<T>> {
    static constexpr std::string_view kSignature = "uaa{sv}";
    static void write(Tuple &tuple, const std::vector<T> &entries) {
        tuple.put(wire::write(static_cast<std::uint32_t>(entries.size())));
        GVariantBuilder list;
        g_variant_builder_init(&list, G_VARIANT_TYPE("aa{sv}"));
        for (const auto &entry : entries) {
            g_variant_builder_open(&list, G_VARIANT_TYPE_VARDICT);
            const auto members = members_of(entry);
            static_assert(std::tuple_size_v<decltype(members)> == kKeys<T>.size());
            auto key = kKeys<T>.begin();
            std::apply(
                [&](const auto &...values) {
                    (g_variant_builder_add(&list, "{sv}", *key++, wire::write(values)), ...);
                },
                members);
            g_variant_builder_close(&list);
        }
        tuple.put(g_variant_builder_end(&list));
    }
};

} // namespace sim::wire
