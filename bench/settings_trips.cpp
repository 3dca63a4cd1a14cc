// SPDX-License-Identifier: Apache-2.0
// Does one kind of work with a settings record a fixed number of times, for a tool that counts
// instructions.
#include "bench/settings_work.hpp"
#include "bench/stage.hpp"

#include <cstdio>
#include <cstdlib>

namespace {

int run(const bench::SettingsWork &work, const bench::SettingsSide &side, long trips) {
    const bench::Stage stage;
    const bench::Client client;
    const bench::SettingsScene scene{client};
    for (; trips > 0; --trips) {
        if (!work.run(scene, side)) {
            std::fputs("a trip went wrong\n", stderr);
            return EXIT_FAILURE;
        }
    }
    return EXIT_SUCCESS;
}

} // namespace

int main(int argc, char **argv) {
    for (const bench::SettingsWork &work : bench::kSettingsWorks) {
        for (const bench::SettingsSide *side : bench::kSettingsSides) {
            if (argc == 4 && work.name == argv[1] && std::string_view{side->name} == argv[2])
                return run(work, *side, std::atol(argv[3]));
        }
    }
    std::fprintf(stderr, "usage: %s read|write|get|update library|naive|floor TRIPS\n", argv[0]);
    return 2;
}
