// SPDX-License-Identifier: Apache-2.0
// Heap in use per pending request, through the library and with GDBus alone.
#include "bench/allocation_meter.hpp"
#include "bench/protocol.hpp"
#include "bench/stage.hpp"
#include "bench/traffic.hpp"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>
#include <string_view>

#include <unistd.h>

namespace {

using bench::Client;
using bench::Side;

constexpr std::int64_t kPending = 1000;
constexpr std::size_t kSamples = 5;

// GLib's slices come from the heap in pages, which hides what a single request takes. It reads the
// variable before main(), so the program starts over with it set.
void make_slices_visible(char **argv) {
    if (const char *slices = std::getenv("G_SLICE");
        slices != nullptr && std::string_view{slices} == "always-malloc")
        return;
    setenv("G_SLICE", "always-malloc", 1);
    execv("/proc/self/exe", argv);
    throw std::runtime_error("cannot start over");
}

double bytes_per_pending(const Client &client, const Side &side) {
    bench::RequestTraffic traffic{client, side};
    client.tell_peer(bench::kHoldMethod, g_variant_new("(b)", TRUE));
    client.flush();
    const std::int64_t before = bench::heap_in_use();
    traffic.send(kPending);
    client.flush();
    const std::int64_t pending = bench::heap_in_use();
    client.tell_peer(bench::kHoldMethod, g_variant_new("(b)", FALSE));
    traffic.drain();
    if (traffic.wrong() != 0)
        throw std::runtime_error("the application did not get what the peer sent");
    return static_cast<double>(pending - before) / kPending;
}

double median(std::array<double, kSamples> samples) {
    std::sort(samples.begin(), samples.end());
    return samples[kSamples / 2];
}

} // namespace

int main(int, char **argv) {
    make_slices_visible(argv);
    const bench::Stage stage;
    const Client client;
    std::array<std::array<double, kSamples>, bench::kSides.size()> samples{};
    // The first round is not counted: it also fills what GLib allocates once and keeps.
    for (std::size_t round = 0; round <= kSamples; ++round) {
        for (std::size_t side = 0; side < bench::kSides.size(); ++side) {
            const double bytes = bytes_per_pending(client, *bench::kSides[side]);
            if (round > 0)
                samples[side][round - 1] = bytes;
        }
    }
    for (std::size_t side = 0; side < bench::kSides.size(); ++side)
        std::printf("%s %.0f\n", bench::kSides[side]->name, median(samples[side]));
    return EXIT_SUCCESS;
}
