// SPDX-License-Identifier: Apache-2.0
// The keys of settings sets and profiles: name, type and member, in the order of the records.
#pragma once

#include <algorithm>
#include <array>
#include <cstdint>
#include <ims.h>
#include <iterator>
#include <span>
#include <string_view>
#include <variant>

namespace imsctl {

// What a key's values are to people and in JSON.
enum class KeyType { kNumber, kFlag, kText };

template <class Record>
struct Key {
    using Member = std::variant<std::int32_t Record::*, bool Record::*, char * Record::*,
                                ims_settings_timer_s Record::*>;

    std::string_view name;
    Member member;
};

using SettingsRecord = ims_global_settings_s;
using ProfileRecord = ims_profile_s;

template <class Record>
std::span<const Key<Record>> keys_of();
template <>
std::span<const Key<SettingsRecord>> keys_of();
template <>
std::span<const Key<ProfileRecord>> keys_of();

template <class Record>
constexpr KeyType type_of(const Key<Record> &key) {
    // A timer arrives as text, but it is a number.
    constexpr std::array kTypes = {KeyType::kNumber, KeyType::kFlag, KeyType::kText,
                                   KeyType::kNumber};
    return kTypes[key.member.index()];
}

// These are read, but the service cannot be told a value for them: it is sent a neighbour's in
// their place.
inline constexpr std::string_view kReadOnlyKeys[] = {"audio_port_end", "is_enable_srtp"};

constexpr bool is_read_only(const Key<SettingsRecord> &key) {
    return std::find(std::begin(kReadOnlyKeys), std::end(kReadOnlyKeys), key.name) !=
           std::end(kReadOnlyKeys);
}
constexpr bool is_read_only(const Key<ProfileRecord> &) {
    return false;
}

} // namespace imsctl
