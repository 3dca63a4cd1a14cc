// SPDX-License-Identifier: Apache-2.0
// What the library really sends and accepts, seen on the bus.
#pragma once

#include "tests/contract/contract.hpp"
#include "tests/contract/modules.hpp"
#include "tests/support/with_peer.hpp"

#include <map>
#include <string>

namespace test {

class LibraryOnTheBus : public WithPeer {
  protected:
    // What each exported function that makes a call sent and took for an answer: method lines.
    std::map<std::string, std::string> observe_calls();
    // Signal lines: what reached a callback.
    std::set<std::string> observe_events();

  private:
    std::string made_by(const RequestRow &row);
    std::string made_by(const QueryRow &row);
    std::string made_by_init();
    std::string made_by_network_environment_query();
    // The line of the last call, whose answer of this type was taken.
    std::string last_call(const std::string &reply_type);
};

} // namespace test
