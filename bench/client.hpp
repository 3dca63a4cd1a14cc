// SPDX-License-Identifier: Apache-2.0
// The application under measurement. Both sides use the one connection, which is the process's.
#pragma once

#include "bench/owned.hpp"
#include "ims.h"

#include <cstdint>

namespace bench {

class Client {
  public:
    Client();
    ~Client();
    Client(const Client &) = delete;
    Client &operator=(const Client &) = delete;

    ims_h handle() const { return handle_; }
    GDBusConnection *connection() const { return connection_.get(); }

    // Returns at once; the peer acts on it before anything that is sent later.
    void tell_peer(const char *method, GVariant *parameters) const;
    // Returns when all that was sent has left the process.
    void flush() const;

  private:
    ims_h handle_ = nullptr;
    Connection connection_;
};

} // namespace bench
