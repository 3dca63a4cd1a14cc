// SPDX-License-Identifier: Apache-2.0
#include "sim/settings_store.hpp"

#include "sim/settings_json.hpp"
#include "sim/store.hpp"

namespace sim {

namespace {

std::string file_of(int slot) {
    return fmt::format("sub{}.json", slot);
}

std::optional<std::string> restore_slot(const Store &store, int slot, SettingsModel &model) {
    const auto content = store.read(file_of(slot));
    if (!content)
        return content.refusal().reason;
    if (!*content)
        return std::nullopt;
    const auto settings = from_json(**content);
    if (!settings)
        return fmt::format("cannot use {}: {}; mend it or move it away",
                           store.path_of(file_of(slot)), settings.refusal().reason);
    model.restore(slot, *settings);
    return std::nullopt;
}

} // namespace

std::optional<std::string> keep_settings(const std::string &directory, SettingsModel &model) {
    const auto opened = Store::open(directory);
    if (!opened)
        return opened.refusal().reason;
    const auto store = *opened;
    for (int slot = 0; slot < model.slots(); ++slot)
        if (auto error = restore_slot(*store, slot, model))
            return error;
    model.keep_with([store](int slot, const SlotSettings &settings) -> std::optional<std::string> {
        const auto written = store->write(file_of(slot), to_json(settings));
        return written ? std::nullopt : std::optional(written.refusal().reason);
    });
    return std::nullopt;
}

} // namespace sim
