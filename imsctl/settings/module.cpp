// SPDX-License-Identifier: Apache-2.0
#include "imsctl/settings/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kSettingsVerbGroups[] = {
    {"settings", "sets of global settings"},
    {"network-environment", "the type of network environment"},
    {"profile", "registration profiles"},
};

} // namespace

Module settings_module() {
    return {kSettingsVerbGroups, {settings_verbs(), profile_verbs()}, {}};
}

} // namespace imsctl
