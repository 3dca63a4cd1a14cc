// SPDX-License-Identifier: Apache-2.0
// The fields of the settings and profile dictionaries, in wire order.
#pragma once

#include "ims_settings.h"
#include "ims_settings_keys.h"
#include "wire/dictionary.hpp"

namespace ims {

using Settings = ims_global_settings_s;

#define IMS_SETTINGS_FIELD(key) IMS_FIELD(Settings, key),
inline constexpr Field kSettingsRows[] = {IMS_GLOBAL_SETTINGS_KEYS(IMS_SETTINGS_FIELD)};
#undef IMS_SETTINGS_FIELD

static_assert(std::size(kSettingsRows) == 334);
static_assert(is_whole_record<Settings>(kSettingsRows));

inline constexpr auto kSettingsFields = field_table(kSettingsRows);

// Where writing is not the reverse of reading. The three push-to-talk timers are too, by their
// type.
inline constexpr WriteRule kSettingsWriteRules[] = {
    // The service takes these two from their neighbours, which it expects a second time in their
    // place; the copies with suffixes are written like every other key.
    {"audio_port_end", WriteAs::kOtherField, WriteAs::kOtherField, "audio_port_start"},
    {"is_enable_srtp", WriteAs::kOtherField, WriteAs::kOtherField, "is_avpf_enabled"},
    // A new set brings this number as text.
    {"is_enable_emm_MCPTT", WriteAs::kItself, WriteAs::kDecimalText, {}},
};
inline constexpr auto kSettingsUpdate =
    write_plan(kSettingsFields, kSettingsWriteRules, &WriteRule::update);
inline constexpr auto kSettingsAdd =
    write_plan(kSettingsFields, kSettingsWriteRules, &WriteRule::add);

#define IMS_PROFILE_FIELD(key) IMS_FIELD(ims_profile_s, key),
inline constexpr Field kProfileRows[] = {IMS_PROFILE_KEYS(IMS_PROFILE_FIELD)};
#undef IMS_PROFILE_FIELD

static_assert(std::size(kProfileRows) == 51);
static_assert(is_whole_record<ims_profile_s>(kProfileRows));

inline constexpr auto kProfileFields = field_table(kProfileRows);
inline constexpr auto kProfileWrite = write_plan(kProfileFields, {}, &WriteRule::update);

} // namespace ims
