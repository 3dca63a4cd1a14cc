// SPDX-License-Identifier: Apache-2.0
// How the fields of an event's record become values: what the tables of events are made of.
#pragma once

#include "imsctl/output/events.hpp"

#include <cstdlib>
#include <ims.h>
#include <iterator>
#include <optional>
#include <string>
#include <type_traits>

namespace imsctl {

template <class Record, class Member>
Record record_of(Member Record::*);

template <auto Member>
using RecordOf = decltype(record_of(Member));

template <auto Member>
auto &member_of(void *record) {
    return static_cast<RecordOf<Member> *>(record)->*Member;
}

inline std::optional<std::string> take_text(char *text) {
    if (text == nullptr)
        return std::nullopt;
    std::string copy(text);
    std::free(text);
    return copy;
}

// A text that stays the library's.
inline Value lent_text(const char *text) {
    return text == nullptr ? Value() : Value(std::string(text));
}

template <auto Member>
Value take_member(void *record) {
    auto &member = member_of<Member>(record);
    using Type = std::remove_reference_t<decltype(member)>;
    if constexpr (std::is_same_v<Type, char *>) {
        auto text = take_text(member);
        return text ? Value(*std::move(text)) : Value();
    } else if constexpr (std::is_same_v<Type, const char *>) {
        return lent_text(member);
    } else if constexpr (std::is_array_v<Type>) {
        return Numbers(std::begin(member), std::end(member));
    } else if constexpr (std::is_same_v<Type, bool> || std::is_same_v<Type, std::uint8_t>) {
        return member;
    } else {
        static_assert(std::is_same_v<Type, std::int32_t> || std::is_same_v<Type, std::uint32_t>);
        return std::int64_t{member};
    }
}

// A boolean that the record holds as a number.
template <auto Member>
Value take_flag(void *record) {
    return member_of<Member>(record) != 0;
}

// The record's bytes are gone after the callback and are nobody's to free.
template <auto Data, auto Length>
Value take_bytes(void *record) {
    const std::uint8_t *data = member_of<Data>(record);
    const std::int32_t length = member_of<Length>(record);
    if (data == nullptr || length <= 0)
        return Bytes();
    return Bytes(data, data + length);
}

template <auto Data, auto Length>
Value take_tpdu(void *record) {
    const std::uint8_t *data = member_of<Data>(record);
    return Binary{data == nullptr ? Bytes() : Bytes(data, data + member_of<Length>(record))};
}

template <auto Member>
constexpr FieldRow field(std::string_view name) {
    return {name, take_member<Member>};
}

template <auto Member>
constexpr FieldRow flag(std::string_view name) {
    return {name, take_flag<Member>};
}

template <auto Data, auto Length>
constexpr FieldRow tpdu_bytes(std::string_view name) {
    return {name, take_tpdu<Data, Length>};
}

template <auto Data, auto Length>
constexpr FieldRow bytes(std::string_view name) {
    return {name, take_bytes<Data, Length>};
}

} // namespace imsctl
