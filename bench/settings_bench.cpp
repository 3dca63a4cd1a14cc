// SPDX-License-Identifier: Apache-2.0
// A full settings record read and written, and moved over the bus, by each side.
#include "bench/measure.hpp"
#include "bench/settings_work.hpp"

#include <memory>

namespace {

void add_all(const bench::Client &client) {
    const auto scene = std::make_shared<bench::SettingsScene>(client);
    for (const bench::SettingsWork &work : bench::kSettingsWorks) {
        for (const bench::SettingsSide *side : bench::kSettingsSides)
            bench::add(std::string{work.name} + "/" + side->name,
                       [scene, &work, side](benchmark::State &state) {
                           bench::start_deadline();
                           std::int64_t wrong = 0;
                           for ([[maybe_unused]] auto iteration : state)
                               wrong += work.run(*scene, *side) ? 0 : 1;
                           bench::report(state, wrong);
                       });
    }
}

} // namespace

int main(int argc, char **argv) {
    return bench::measure_all(argc, argv, add_all);
}
