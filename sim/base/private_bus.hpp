// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <optional>
#include <string>
#include <sys/types.h>

namespace sim {

// A message bus for this process and its children. It keeps nothing in the file system (its
// socket is an abstract one, its configuration lives in memory), so nothing can be left behind,
// and it ends with this process even when that is killed.
class PrivateBus {
  public:
    PrivateBus() = default;
    PrivateBus(const PrivateBus &) = delete;
    PrivateBus &operator=(const PrivateBus &) = delete;
    ~PrivateBus();

    // What went wrong, or nothing.
    std::optional<std::string> start();
    const std::string &address() const { return address_; }
    pid_t pid() const { return pid_; }

  private:
    pid_t pid_ = -1;
    std::string address_;
};

} // namespace sim
