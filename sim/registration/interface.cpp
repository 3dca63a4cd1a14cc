// SPDX-License-Identifier: Apache-2.0
#include "sim/registration/interface.hpp"

#include "sim/bus/ask.hpp"
#include "sim/bus/tell.hpp"

namespace sim {

namespace {

using enum Caller;

Answer<int> register_application(Applications &applications, const Request &request,
                                 std::int32_t slot, const std::string &name) {
    if (slot != request.slot)
        return refuse(Result::kInvalidArgument, "slot {} is asked for at the object of slot {}",
                      slot, request.slot);
    return applications.add(request.slot, request.connection, name);
}

ResultLast<RegistrationInfo> get_registration_info(const Registrations &registrations, int slot) {
    return {registrations.info(slot)};
}

constexpr SignalTable kRegistrationSignals{
    SignalRow<RegistrationInfo>{"RegistrationStatus"},
    SignalRow<EmergencyRegistrationStatus>{"EmergencyRegistrationStatus"},
};

} // namespace

int RegistrationInterface::register_connection(const Request &request) {
    const auto present = applications_.latest(request.slot, request.connection);
    const int id = present ? *present : applications_.add(request.slot, request.connection, "");
    registrations_.switch_on(request.slot);
    return id;
}

Interface RegistrationInterface::describe() {
    // RegisterApplication has two forms: a new application each time, or the one that this
    // connection already has.
    static constexpr MethodRow<RegistrationInterface, Applications, Registrations> kMethods[] = {
        {"RegisterApplication", ask<register_application>, kAnybody},
        {"RegisterApplication", ask<&RegistrationInterface::register_connection>, kAnybody},
        {"GetRegistrationInfo", ask<get_registration_info>, kConnection},
        {"EnableFlightMode", ask<&Registrations::enable_flight_mode>, kConnection},
    };
    return {kName, bind_methods(kMethods, *this, applications_, registrations_),
            kRegistrationSignals.infos()};
}

Signal to_signal(const RegistrationEvent &event) {
    return kRegistrationSignals.signal_of(event);
}

} // namespace sim
