// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/sim/bus/bus_client.hpp"
#include "tests/sim/settings/directory.hpp"

namespace sim::test {

// Made before the program that uses it.
struct StateDirectory {
    TemporaryDirectory directory_;
};

// A program that keeps its state and can be started anew with it.
class ServedWithState : StateDirectory, public Served {
  protected:
    ServedWithState() : Served({"--speed", "0", "--state", directory_.path()}) {}

    using StateDirectory::directory_;

    std::vector<std::string> arguments() const {
        return {"serve", "--address", bus_.address(), "--state", directory_.path()};
    }
    void restart(int signal) {
        program_->send_signal(signal);
        program_->wait();
        client_->wait_until_gone(kServiceName);
        program_ = std::make_unique<Program>(arguments());
        client_->wait_until_owned(kServiceName);
    }
};

} // namespace sim::test
