// SPDX-License-Identifier: Apache-2.0
#include "sim/program.hpp"

int main(int argc, char **argv) {
    const auto options = sim::parse_options(argc, argv);
    if (const int *status = std::get_if<int>(&options))
        return *status;
    const auto *chosen = std::get_if<sim::Options>(&options);
    return chosen->run ? sim::run(*chosen) : sim::serve(*chosen);
}
