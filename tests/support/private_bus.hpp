// SPDX-License-Identifier: Apache-2.0
// A message bus of the test's own. Who makes a PrivateBus owns its daemon, which ends with it, and
// its directory, which is gone then. As long as it lives it is the system bus of this process and
// of the programs that it runs; two that overlap end in the other order.
#pragma once

#include "tests/support/files.hpp"
#include "tests/support/process.hpp"

#include <optional>
#include <string>
#include <string_view>

namespace test {

class PrivateBus {
  public:
    // Listens when this returns. The rules are put behind those that allow everything, so they can
    // forbid something; the elements behind everything else.
    explicit PrivateBus(std::string_view policy_rules = {}, std::string_view elements = {});
    ~PrivateBus();
    PrivateBus(const PrivateBus &) = delete;
    PrivateBus &operator=(const PrivateBus &) = delete;

    const std::string &address() const { return address_; }

    // Ends the daemon: every connection is closed.
    void stop();

  private:
    void write_configuration(std::string_view policy_rules, std::string_view elements) const;
    void start();

    TemporaryDirectory directory_;
    std::string address_;
    std::optional<std::string> system_bus_before_;
    std::optional<Process> daemon_;
};

} // namespace test
