// SPDX-License-Identifier: Apache-2.0
#include "bench/settings_work.hpp"

#include "bench/protocol.hpp"

#include <stdexcept>

namespace bench {
namespace {

// A look at both ends of the record must do here: the whole was compared before.
bool is_filled(const SettingsSample &sample, const Settings &settings) {
    return settings.id == sample.record().id && settings.conference_factory_uri != nullptr;
}

bool read(const SettingsScene &scene, const SettingsSide &side) {
    Settings settings{};
    side.read(scene.sample().dictionary(), settings);
    const bool is_good = !side.fills || is_filled(scene.sample(), settings);
    ims_global_settings_clear(&settings);
    return is_good;
}

bool write(const SettingsScene &scene, const SettingsSide &side) {
    return !message_bytes(side.write(scene.sample().record()).get()).empty();
}

bool get(const SettingsScene &scene, const SettingsSide &side) {
    Settings settings{};
    const bool is_good =
        side.get(scene.client(), settings) && (!side.fills || is_filled(scene.sample(), settings));
    ims_global_settings_clear(&settings);
    return is_good;
}

bool update(const SettingsScene &scene, const SettingsSide &side) {
    Answer answer;
    side.update(scene.client(), scene.sample().record(), answer);
    while (!answer.is_here)
        g_main_context_iteration(nullptr, TRUE);
    return answer.result == 0;
}

} // namespace

const std::array<SettingsWork, 4> kSettingsWorks{
    {{"read", read}, {"write", write}, {"get", get}, {"update", update}}};

SettingsScene::SettingsScene(const Client &client) : client_{client} {
    client.tell_peer(kServeMethod, g_variant_new("(@a{sv})", sample_.dictionary()));
    for (const SettingsSide *side : kSettingsSides)
        check(*side);
}

void SettingsScene::check(const SettingsSide &side) const {
    const Variant expected = kSettingsNaive.write(sample_.record());
    if (message_bytes(side.write(sample_.record()).get()) != message_bytes(expected.get()))
        throw std::runtime_error("the sides write different messages");
    if (!side.fills)
        return;
    for (const auto by_bus : {false, true}) {
        Settings settings{};
        if (by_bus)
            side.get(client_, settings);
        else
            side.read(sample_.dictionary(), settings);
        const bool is_whole = is_filled(sample_, settings) && sample_.equals(settings);
        ims_global_settings_clear(&settings);
        if (!is_whole)
            throw std::runtime_error("a side does not read the whole record");
    }
}

} // namespace bench
