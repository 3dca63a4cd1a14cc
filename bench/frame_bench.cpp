// SPDX-License-Identifier: Apache-2.0
// Rates through the library beside the same calls made with GDBus alone.
#include "stage.hpp"
#include "traffic.hpp"

#include <benchmark/benchmark.h>

#include <string>

#include <unistd.h>

namespace bench {
namespace {

// Nothing here takes nearly as long; a signal that got lost would be waited for forever.
constexpr unsigned kDeadlineSeconds = 120;

bool has_failed = false;

void report(benchmark::State &state, std::int64_t wrong) {
    state.SetItemsProcessed(state.iterations());
    if (wrong == 0)
        return;
    has_failed = true;
    state.SkipWithError("the application did not get what the peer sent");
}

void measure_requests(benchmark::State &state, const Client &client, const Side &side,
                      std::int64_t outstanding) {
    alarm(kDeadlineSeconds);
    RequestTraffic traffic{client, side};
    traffic.send(outstanding);
    while (state.KeepRunningBatch(outstanding))
        traffic.exchange(outstanding);
    traffic.drain();
    report(state, traffic.wrong());
}

void measure_queries(benchmark::State &state, const Client &client, const Side &side) {
    alarm(kDeadlineSeconds);
    std::int64_t wrong = 0;
    for ([[maybe_unused]] auto iteration : state)
        wrong += read_calls(client, side) ? 0 : 1;
    report(state, wrong);
}

void measure_signals(benchmark::State &state, const Client &client, const Side &side) {
    alarm(kDeadlineSeconds);
    SignalTraffic traffic{client, side};
    while (state.KeepRunningBatch(SignalTraffic::kBurst))
        traffic.receive();
    traffic.drain();
    report(state, traffic.wrong());
}

// The rate is that of the whole exchange, the CPU time that of this process with all its threads.
template <typename Measure>
void add(const std::string &name, Measure measure) {
    benchmark::RegisterBenchmark(name.c_str(), measure)
        ->UseRealTime()
        ->MeasureProcessCPUTime()
        ->Unit(benchmark::kMicrosecond);
}

void add_all(const Client &client) {
    for (const Side *side : kSides) {
        for (const std::int64_t outstanding : {1, 64, 1000})
            add("request_" + std::to_string(outstanding) + "/" + side->name,
                [&client, side, outstanding](benchmark::State &state) {
                    measure_requests(state, client, *side, outstanding);
                });
        add(std::string{"query/"} + side->name,
            [&client, side](benchmark::State &state) { measure_queries(state, client, *side); });
        add(std::string{"signal/"} + side->name,
            [&client, side](benchmark::State &state) { measure_signals(state, client, *side); });
    }
}

} // namespace
} // namespace bench

int main(int argc, char **argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 2;
    const bench::Stage stage;
    const bench::Client client;
    bench::add_all(client);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return bench::has_failed ? 1 : 0;
}
