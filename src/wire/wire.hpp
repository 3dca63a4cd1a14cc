// SPDX-License-Identifier: Apache-2.0
// D-Bus tuples, packed and unpacked with a signature that is checked against the C++ types at
// compile time: pack<"(is)">(1, "a"), unpack<"(ii)">(reply, result, id).
#pragma once

#include "glib.hpp"
#include "signature.hpp"

#include <concepts>
#include <cstdint>
#include <span>
#include <string_view>
#include <tuple>
#include <utility>

namespace ims {

// A member that unpack() reads past.
struct Skipped {};

// The bus cuts off a process that sends a message larger than it takes: 32 MiB on a system bus that
// is not configured otherwise.
inline constexpr gsize kMaxTupleSize = gsize{16} << 20;

// What is inside a value, however many variants are around it.
Variant peeled(GVariant *value) noexcept;

namespace wire {

template <typename T, typename... Accepted>
inline constexpr bool is_one_of = (std::is_same_v<T, Accepted> || ...);

template <typename T>
consteval bool carries(std::string_view type) {
    if (type == "b")
        return is_one_of<T, bool>;
    if (type == "y")
        return is_one_of<T, std::uint8_t>;
    if (type == "i")
        return is_one_of<T, std::int32_t>;
    if (type == "u")
        return is_one_of<T, std::uint32_t>;
    if (type == "x")
        return is_one_of<T, std::int64_t>;
    if (type == "s")
        return is_one_of<T, const char *, char *>;
    return std::is_same_v<T, Variant>;
}

// What unpack() can store a member of this type in. A "b" may go to a 32-bit boolean, a "v" with an
// "ai" in it to an array of fixed size.
template <typename T>
consteval bool receives(std::string_view type) {
    return carries<T>(type) || is_one_of<T, Skipped> ||
           (type == "b" && is_one_of<T, std::int32_t>) ||
           (type == "v" && is_one_of<std::remove_extent_t<T>, std::int32_t> && std::is_array_v<T>);
}

// Each returns nothing when the value cannot cross the bus.
inline Variant to_variant(bool value, const char *) noexcept {
    return owned(g_variant_new_boolean(value));
}
inline Variant to_variant(std::uint8_t value, const char *) noexcept {
    return owned(g_variant_new_byte(value));
}
inline Variant to_variant(std::int32_t value, const char *) noexcept {
    return owned(g_variant_new_int32(value));
}
inline Variant to_variant(std::uint32_t value, const char *) noexcept {
    return owned(g_variant_new_uint32(value));
}
inline Variant to_variant(std::int64_t value, const char *) noexcept {
    return owned(g_variant_new_int64(value));
}
Variant to_variant(const char *text, const char *type) noexcept;
Variant to_variant(const Variant &value, const char *type) noexcept;

// What a value takes up in a message.
template <std::integral T>
gsize size_of(T) noexcept {
    return sizeof(T);
}
gsize size_of(const char *text) noexcept;
gsize size_of(const Variant &value) noexcept;

inline void from_variant(GVariant *child, bool &value) noexcept {
    value = g_variant_get_boolean(child) != FALSE;
}
inline void from_variant(GVariant *child, std::uint8_t &value) noexcept {
    value = g_variant_get_byte(child);
}
inline void from_variant(GVariant *child, std::uint32_t &value) noexcept {
    value = g_variant_get_uint32(child);
}
inline void from_variant(GVariant *child, std::int64_t &value) noexcept {
    value = g_variant_get_int64(child);
}
void from_variant(GVariant *child, std::int32_t &value) noexcept;
// Borrowed: lives as long as the tuple that it was unpacked from.
inline void from_variant(GVariant *child, const char *&value) noexcept {
    value = g_variant_get_string(child, nullptr);
}
// A copy, which whoever gets the record frees.
inline void from_variant(GVariant *child, char *&value) noexcept {
    value = g_variant_dup_string(child, nullptr);
}
// As many integers as there is room for; what is missing, or all of something else, is 0.
void fill(std::span<std::int32_t> values, GVariant *boxed_array) noexcept;
template <std::size_t Size>
void from_variant(GVariant *child, std::int32_t (&values)[Size]) noexcept {
    fill(values, child);
}
// The value itself; of a variant its content.
void from_variant(GVariant *child, Variant &value) noexcept;
inline void from_variant(GVariant *, const Skipped &) noexcept {}

// No tuple when one of the children is missing.
Variant tuple_of(std::span<const Variant> children) noexcept;

bool has_type(GVariant *value, const char *type) noexcept;

// The type text of one member, zero-terminated for GLib.
template <Literal Format, std::size_t Index>
inline constexpr auto member_type = [] {
    std::array<char, Signature<Format>::member(Index).size() + 1> type{};
    std::size_t at = 0;
    for (const char c : Signature<Format>::member(Index))
        type[at++] = c;
    return type;
}();

template <Literal Format, typename... Arguments, std::size_t... Index>
Variant pack(std::index_sequence<Index...>, const Arguments &...arguments) noexcept {
    static_assert((carries<Arguments>(Signature<Format>::member(Index)) && ...),
                  "an argument's type is not the signature's");
    if ((size_of(arguments) + ... + gsize{0}) > kMaxTupleSize)
        return nullptr;
    const std::array<Variant, sizeof...(Arguments)> children{
        to_variant(arguments, member_type<Format, Index>.data())...};
    return tuple_of(children);
}

template <Literal Format, typename... Out, std::size_t... Index>
bool unpack(std::index_sequence<Index...>, GVariant *tuple, Out &...out) noexcept {
    static_assert((receives<std::remove_const_t<Out>>(Signature<Format>::member(Index)) && ...),
                  "a destination's type is not the signature's");
    if (!has_type(tuple, Signature<Format>::type()))
        return false;
    (from_variant(Variant{g_variant_get_child_value(tuple, Index)}.get(), out), ...);
    return true;
}

// The members of a plain record, in order.
template <std::size_t Count, typename Record>
auto members(Record &record) noexcept {
    static_assert((Count >= 1 && Count <= 10) || Count == 14, "add the missing size here");
    if constexpr (Count == 1) {
        auto &[a] = record;
        return std::tie(a);
    } else if constexpr (Count == 2) {
        auto &[a, b] = record;
        return std::tie(a, b);
    } else if constexpr (Count == 3) {
        auto &[a, b, c] = record;
        return std::tie(a, b, c);
    } else if constexpr (Count == 4) {
        auto &[a, b, c, d] = record;
        return std::tie(a, b, c, d);
    } else if constexpr (Count == 5) {
        auto &[a, b, c, d, e] = record;
        return std::tie(a, b, c, d, e);
    } else if constexpr (Count == 6) {
        auto &[a, b, c, d, e, f] = record;
        return std::tie(a, b, c, d, e, f);
    } else if constexpr (Count == 7) {
        auto &[a, b, c, d, e, f, g] = record;
        return std::tie(a, b, c, d, e, f, g);
    } else if constexpr (Count == 8) {
        auto &[a, b, c, d, e, f, g, h] = record;
        return std::tie(a, b, c, d, e, f, g, h);
    } else if constexpr (Count == 9) {
        auto &[a, b, c, d, e, f, g, h, i] = record;
        return std::tie(a, b, c, d, e, f, g, h, i);
    } else if constexpr (Count == 10) {
        auto &[a, b, c, d, e, f, g, h, i, j] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j);
    } else {
        auto &[a, b, c, d, e, f, g, h, i, j, k, l, m, n] = record;
        return std::tie(a, b, c, d, e, f, g, h, i, j, k, l, m, n);
    }
}

} // namespace wire

// A tuple, or nothing when it cannot cross the bus: one of the texts is not valid UTF-8, or all
// together is too large. A NULL text is sent as an empty one.
template <Literal Format, typename... Arguments>
Variant pack(const Arguments &...arguments) noexcept {
    static_assert(Signature<Format>::size() == sizeof...(Arguments),
                  "the signature has another number of members");
    return wire::pack<Format, std::decay_t<Arguments>...>(std::index_sequence_for<Arguments...>{},
                                                          arguments...);
}

// Stores the tuple's members and says whether the tuple had this type; nothing is stored otherwise.
template <Literal Format, typename... Out>
bool unpack(GVariant *tuple, Out &...out) noexcept {
    static_assert(Signature<Format>::size() == sizeof...(Out),
                  "the signature has another number of members");
    return wire::unpack<Format>(std::index_sequence_for<Out...>{}, tuple, out...);
}

// Unpacks a tuple into a record whose fields are the tuple's members in order.
template <Literal Format, typename Record>
bool unpack_record(GVariant *tuple, Record &record) noexcept {
    return std::apply([tuple](auto &...field) { return unpack<Format>(tuple, field...); },
                      wire::members<Signature<Format>::size()>(record));
}

// A value inside a "v".
inline Variant boxed(const Variant &content) noexcept {
    return content ? owned(g_variant_new_variant(content.get())) : nullptr;
}

// An "as". Nothing when one of the texts is not valid UTF-8; a NULL text becomes an empty one.
class TextArray {
  public:
    TextArray() noexcept;
    ~TextArray();
    TextArray(const TextArray &) = delete;
    TextArray &operator=(const TextArray &) = delete;

    void add(const char *text) noexcept;
    Variant finish() noexcept;

  private:
    GVariantBuilder builder_;
    bool valid_ = true;
};

// The bytes as base64 text; none for a NULL pointer or a count that is not positive.
Text base64_encode(const std::uint8_t *bytes, std::int32_t count) noexcept;

struct Decoded {
    Bytes bytes;
    gsize count = 0;
};

Decoded base64_decode(const char *text) noexcept;

} // namespace ims
