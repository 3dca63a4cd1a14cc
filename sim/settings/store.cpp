// SPDX-License-Identifier: Apache-2.0
#include "sim/settings/store.hpp"

#include "sim/base/kept_file.hpp"
#include "sim/settings/json.hpp"

namespace sim {

namespace {

std::string file_of(int slot) {
    return fmt::format("sub{}.json", slot);
}

} // namespace

std::optional<std::string> keep_settings(const std::shared_ptr<Store> &store,
                                         SettingsModel &model) {
    for (int slot = 0; slot < model.slots(); ++slot)
        if (auto error = restore_file(*store, file_of(slot), from_json, [&](SlotSettings settings) {
                model.restore(slot, std::move(settings));
            }))
            return error;
    model.keep_with([store](int slot, const SlotSettings &settings) {
        return keep_file(*store, file_of(slot), to_json(settings));
    });
    return std::nullopt;
}

} // namespace sim
