// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/sim/bus/bus_client.hpp"
#include "tests/sim/settings/directory.hpp"

#include <functional>

// Killed at any moment, the program loses no change that it has acknowledged.
namespace sim::test {

// A request that keeps a number, in more than one place: what is kept must be of one request.
struct KeptNumber {
    const char *interface;
    const char *method;
    std::function<std::string(int number)> arguments;
    // What is kept; the answer is that of this query.
    const char *query;
    const char *query_arguments;
    std::function<int(GVariant *dictionary)> read;
    // What is wrong with the content of the file; empty when nothing is.
    const char *file;
    std::function<std::string(const std::string &content)> problem;
};

class KillTest : public testing::Test {
  protected:
    std::unique_ptr<Program> start();
    // Kills the program again and again while it keeps numbers.
    void kill_while_keeping(const KeptNumber &kept, int rounds);

    TemporaryDirectory directory_;
    PrivateBus bus_;
    std::unique_ptr<Client> client_ = std::make_unique<Client>(bus_.address());

  private:
    int stored(const KeptNumber &kept);
};

} // namespace sim::test
