// SPDX-License-Identifier: Apache-2.0
// What the programs that measure rates share.
#pragma once

#include "bench/client.hpp"

#include <benchmark/benchmark.h>

#include <string>

namespace bench {

// Ends the program if a measurement hangs: nothing takes nearly as long, and an answer that got
// lost would be waited for forever.
void start_deadline();

// Counts the work that was done, and the measurement as failed when some of it went wrong.
void report(benchmark::State &state, std::int64_t wrong);

// The rate is that of the whole exchange, the CPU time that of this process with all its threads.
template <typename Measure>
void add(const std::string &name, Measure measure) {
    benchmark::RegisterBenchmark(name.c_str(), measure)
        ->UseRealTime()
        ->MeasureProcessCPUTime()
        ->Unit(benchmark::kMicrosecond);
}

// The program: measures what `add_all` adds, on a bus of its own.
int measure_all(int argc, char **argv, void (*add_all)(const Client &client));

} // namespace bench
