// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/applications.hpp"
#include "sim/bus/interface.hpp"
#include "sim/registration/registrations.hpp"

#include <string_view>

namespace sim {

// org.kelvo.ims.Registration: the applications, and the device in the network.
class RegistrationInterface {
  public:
    RegistrationInterface(Applications &applications, Registrations &registrations)
        : applications_(applications), registrations_(registrations) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Registration";
    Interface describe();

  private:
    int register_connection(const Request &request);

    Applications &applications_;
    Registrations &registrations_;
};

Signal to_signal(const RegistrationEvent &event);

} // namespace sim
