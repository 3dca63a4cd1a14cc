// SPDX-License-Identifier: Apache-2.0
#include "bench/measure.hpp"

#include "bench/stage.hpp"

#include <unistd.h>

namespace bench {
namespace {

constexpr unsigned kDeadlineSeconds = 120;

bool has_failed = false;

} // namespace

void start_deadline() {
    alarm(kDeadlineSeconds);
}

void report(benchmark::State &state, std::int64_t wrong) {
    state.SetItemsProcessed(state.iterations());
    if (wrong == 0)
        return;
    has_failed = true;
    state.SkipWithError("the application did not get what the peer sent");
}

int measure_all(int argc, char **argv, void (*add_all)(const Client &client)) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    const Stage stage;
    const Client client;
    add_all(client);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return has_failed ? 1 : 0;
}

} // namespace bench
