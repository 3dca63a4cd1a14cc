// SPDX-License-Identifier: Apache-2.0
#include "bench/protocol.hpp"
#include "bench/settings_side.hpp"

#include "src/settings_fields.hpp"
#include "src/wire/wire.hpp"

namespace bench {
namespace {

void read(GVariant *dictionary, Settings &settings) {
    ims::read_dictionary(dictionary, ims::kSettingsFields, &settings);
}

Variant write(const Settings &settings) {
    return ims::pack<"(@a{sv})">(
        ims::write_dictionary(ims::kSettingsFields, ims::kSettingsUpdate, &settings));
}

bool get(const Client &client, Settings &settings) {
    return ims_get_global_settings_info(client.handle(), kSettingsName, &settings) ==
           IMS_ERROR_NONE;
}

void on_answer(ims_h, int result, void *, void *answer) {
    *static_cast<Answer *>(answer) = {true, result};
}

void update(const Client &client, const Settings &settings, Answer &answer) {
    const int result = ims_update_global_settings(client.handle(), &settings, on_answer, &answer);
    if (result != IMS_ERROR_NONE)
        answer = {true, result};
}

} // namespace

const SettingsSide kSettingsLibrary{"library", true, read, write, get, update};

} // namespace bench
