// SPDX-License-Identifier: Apache-2.0
#pragma once

#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace sim {

// Who has registered: application ids count from 1 over all slots and are never given twice.
class Applications {
  public:
    // A connection may register as often as it likes; each time makes a new application.
    int add(int slot, std::string_view connection, std::string_view name);
    bool known(int slot, int id) const;
    // The latest application of this connection on this slot.
    std::optional<int> latest(int slot, std::string_view connection) const;
    // The name under which this connection registered last; empty when it did not.
    std::string_view name_of(std::string_view connection) const;
    // How many applications went with this connection.
    std::size_t forget(std::string_view connection);

  private:
    struct Application {
        int slot;
        std::string connection;
        std::string name;
    };
    std::map<int, Application> applications_;
    int next_id_ = 1;
};

} // namespace sim
