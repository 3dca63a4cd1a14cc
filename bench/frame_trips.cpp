// SPDX-License-Identifier: Apache-2.0
// Makes a fixed number of round trips, one after the other, for a tool that counts instructions.
#include "bench/stage.hpp"
#include "bench/traffic.hpp"

#include <cstdio>
#include <cstdlib>
#include <string_view>

namespace {

using bench::Client;
using bench::Side;

const Side *find_side(std::string_view name) {
    for (const Side *side : bench::kSides) {
        if (name == side->name)
            return side;
    }
    return nullptr;
}

// Each returns how many of the trips went wrong.
std::int64_t make_requests(const Client &client, const Side &side, std::int64_t trips) {
    bench::RequestTraffic traffic{client, side};
    for (; trips > 0; --trips) {
        traffic.send(1);
        traffic.drain();
    }
    return traffic.wrong();
}

std::int64_t make_queries(const Client &client, const Side &side, std::int64_t trips) {
    std::int64_t wrong = 0;
    for (; trips > 0; --trips)
        wrong += bench::read_calls(client, side) ? 0 : 1;
    return wrong;
}

// A trip is one burst.
std::int64_t take_signals(const Client &client, const Side &side, std::int64_t trips) {
    bench::SignalTraffic traffic{client, side};
    for (; trips > 0; --trips)
        traffic.receive();
    traffic.drain();
    return traffic.wrong();
}

struct Kind {
    std::string_view name;
    std::int64_t (*run)(const Client &client, const Side &side, std::int64_t trips);
};
constexpr Kind kKinds[] = {
    {"request", make_requests}, {"query", make_queries}, {"signal", take_signals}};

} // namespace

int main(int argc, char **argv) {
    const Side *side = argc == 4 ? find_side(argv[2]) : nullptr;
    for (const Kind &kind : kKinds) {
        if (side == nullptr || kind.name != argv[1])
            continue;
        const bench::Stage stage;
        const Client client;
        const std::int64_t wrong = kind.run(client, *side, std::atoll(argv[3]));
        if (wrong != 0)
            std::fprintf(stderr, "%s: %lld trips went wrong\n", argv[0],
                         static_cast<long long>(wrong));
        return wrong == 0 ? EXIT_SUCCESS : EXIT_FAILURE;
    }
    std::fprintf(stderr, "usage: %s request|query|signal library|bare TRIPS\n", argv[0]);
    return 2;
}
