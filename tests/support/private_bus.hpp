// SPDX-License-Identifier: Apache-2.0
// A dbus-daemon of the test's own that plays the system bus.
#pragma once

#include <string>
#include <string_view>

#include <sys/types.h>

namespace test {

class PrivateBus {
  public:
    // Listens, and is the process's system bus, when this returns. The rules are put behind those
    // that allow everything, so they can forbid something; the elements behind everything else.
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

    std::string directory_;
    std::string address_;
    pid_t daemon_ = -1;
};

} // namespace test
