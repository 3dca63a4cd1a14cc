// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/interface.hpp"
#include "sim/registration/logins.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Login
class LoginInterface {
  public:
    explicit LoginInterface(Logins &logins) : logins_(logins) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Login";
    Interface describe();

  private:
    Logins &logins_;
};

Signal to_signal(const LoginState &event);

} // namespace sim
