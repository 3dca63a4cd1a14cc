// SPDX-License-Identifier: Apache-2.0
// Rates through the library beside the same calls made with GDBus alone.
#include "bench/measure.hpp"
#include "bench/traffic.hpp"

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

using Measure = void (*)(benchmark::State &state, const Client &client, const Side &side);

template <std::int64_t Outstanding>
void measure_requests(benchmark::State &state, const Client &client, const Side &side) {
    measure_requests(state, client, side, Outstanding);
}

constexpr struct {
    const char *name;
    Measure measure;
} kWorks[] = {
    {"request_1", measure_requests<1>},
    {"request_64", measure_requests<64>},
    {"request_1000", measure_requests<1000>},
    {"query", measure_queries},
    {"signal", measure_signals},
};

// The sides of a work run one after the other, so that both meet the same machine.
void add_all(const Client &client) {
    for (const auto &work : kWorks) {
        for (const Side *side : kSides)
            add(std::string{work.name} + "/" + side->name,
                [&client, &work, side](benchmark::State &state) {
                    work.measure(state, client, *side);
                });
    }
}

} // namespace
} // namespace bench

int main(int argc, char **argv) {
    return bench::measure_all(argc, argv, bench::add_all);
}
