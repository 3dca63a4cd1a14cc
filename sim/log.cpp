// SPDX-License-Identifier: Apache-2.0
#include "sim/log.hpp"

#include <cstdio>
#include <string>

namespace sim {

void Log::write(std::string_view line) const {
    const std::chrono::duration<double> elapsed = std::chrono::steady_clock::now() - start_;
    const auto whole = fmt::format("ims-sim: {:8.3f} {}\n", elapsed.count(), line);
    // One write a line keeps it whole beside what other processes print.
    std::fwrite(whole.data(), 1, whole.size(), stderr);
    std::fflush(stderr);
}

} // namespace sim
