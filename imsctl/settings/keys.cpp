// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/keys.hpp"

#include <ims_settings_keys.h>

namespace imsctl {
namespace {

#define IMSCTL_SETTINGS_KEY(key) {#key, &SettingsRecord::key},
constexpr Key<SettingsRecord> kSettingsKeys[] = {IMS_GLOBAL_SETTINGS_KEYS(IMSCTL_SETTINGS_KEY)};
#undef IMSCTL_SETTINGS_KEY

#define IMSCTL_PROFILE_KEY(key) {#key, &ProfileRecord::key},
constexpr Key<ProfileRecord> kProfileKeys[] = {IMS_PROFILE_KEYS(IMSCTL_PROFILE_KEY)};
#undef IMSCTL_PROFILE_KEY

} // namespace

template <>
std::span<const Key<SettingsRecord>> keys_of() {
    return kSettingsKeys;
}

template <>
std::span<const Key<ProfileRecord>> keys_of() {
    return kProfileKeys;
}

} // namespace imsctl
