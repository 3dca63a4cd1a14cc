// SPDX-License-Identifier: Apache-2.0
#include "sim/group/store.hpp"

#include "sim/base/kept_file.hpp"
#include "sim/group/json.hpp"

namespace sim {

namespace {

constexpr const char *kFile = "groups.json";

} // namespace

std::optional<std::string> keep_groups(const std::shared_ptr<Store> &store, GroupModel &model) {
    if (auto error = restore_file(*store, kFile, groups_from_json,
                                  [&](GroupState state) { model.restore(std::move(state)); }))
        return error;
    model.keep_with([store](const GroupState &state) {
        return keep_file(*store, kFile, groups_to_json(state));
    });
    return std::nullopt;
}

} // namespace sim
