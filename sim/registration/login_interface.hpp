// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/registration/logins.hpp"

namespace sim {

// org.kelvo.ims.Login
class LoginInterface {
  public:
    explicit LoginInterface(Logins &logins) : logins_(logins) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Login";
    Interface describe();

  private:
    Answer<Variant> login(const Request &request);
    Answer<Variant> logout(const Request &request);
    Answer<Variant> get_login_state(const Request &request);

    static const MethodRow<LoginInterface> kMethods[];

    Logins &logins_;
};

Signal to_signal(const LoginState &event);

} // namespace sim
