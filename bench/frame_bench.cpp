// SPDX-License-Identifier: Apache-2.0
// Rates through the library beside the same calls made with GDBus alone.
#include "measure.hpp"
#include "traffic.hpp"

namespace bench {
namespace {

void measure_requests(benchmark::State &state, const Client &client, const Side &side,
                      std::int64_t outstanding) {
    start_deadline();
    RequestTraffic traffic{client, side};
    traffic.send(outstanding);
    while (state.KeepRunningBatch(outstanding))
        traffic.exchange(outstanding);
    traffic.drain();
    report(state, traffic.wrong());
}

void measure_queries(benchmark::State &state, const Client &client, const Side &side) {
    start_deadline();
    std::int64_t wrong = 0;
    for ([[maybe_unused]] auto iteration : state)
        wrong += read_calls(client, side) ? 0 : 1;
    report(state, wrong);
}

void measure_signals(benchmark::State &state, const Client &client, const Side &side) {
    start_deadline();
    SignalTraffic traffic{client, side};
    while (state.KeepRunningBatch(SignalTraffic::kBurst))
        traffic.receive();
    traffic.drain();
    report(state, traffic.wrong());
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
    return bench::measure_all(argc, argv, bench::add_all);
}
