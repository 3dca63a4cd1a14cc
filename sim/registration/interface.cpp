// SPDX-License-Identifier: Apache-2.0
#include "sim/registration/interface.hpp"

#include "sim/bus/replies.hpp"

namespace sim {

namespace {

constexpr SignalInfo kSignals[] = {
    {"RegistrationStatus", "(buuiii)"},
    {"EmergencyRegistrationStatus", "(bui)"},
};

struct ToSignal {
    Signal operator()(const RegistrationInfo &e) const {
        return {"RegistrationStatus",
                wire::pack(e.registered, e.network, e.features, e.reason, e.sip_status, e.expires)};
    }
    Signal operator()(const EmergencyRegistrationStatus &e) const {
        return {"EmergencyRegistrationStatus", wire::pack(e.registered, e.network, e.reason)};
    }
};

constexpr std::size_t kResultComesLast = 6;

} // namespace

// RegisterApplication has two forms: a new application each time, or the one that this connection
// already has.
const MethodRow<RegistrationInterface> RegistrationInterface::kMethods[] = {
    {"RegisterApplication", "(is)", "(ii)", Caller::kAnybody,
     &RegistrationInterface::register_application},
    {"RegisterApplication", "()", "(ii)", Caller::kAnybody,
     &RegistrationInterface::register_connection},
    {"GetRegistrationInfo", "()", "(buuiiii)", Caller::kConnection,
     &RegistrationInterface::get_registration_info, kResultComesLast},
    {"EnableFlightMode", "()", "(i)", Caller::kConnection,
     &RegistrationInterface::enable_flight_mode},
};

Interface RegistrationInterface::describe() {
    return {kName, bind_methods<RegistrationInterface>(*this, kMethods), kSignals};
}

Answer<Variant> RegistrationInterface::register_application(const Request &request) {
    const auto [slot, name] = request.unpack<std::int32_t, std::string>();
    if (slot != request.slot)
        return refuse(Result::kInvalidArgument, "slot {} is asked for at the object of slot {}",
                      slot, request.slot);
    return wire::pack(Result::kOk, applications_.add(request.slot, request.connection, name));
}

Answer<Variant> RegistrationInterface::register_connection(const Request &request) {
    const auto present = applications_.latest(request.slot, request.connection);
    const int id = present ? *present : applications_.add(request.slot, request.connection, "");
    registrations_.switch_on(request.slot);
    return wire::pack(Result::kOk, id);
}

Answer<Variant> RegistrationInterface::get_registration_info(const Request &request) {
    const auto info = registrations_.info(request.slot);
    return wire::pack(info.registered, info.network, info.features, info.reason, info.sip_status,
                      info.expires, Result::kOk);
}

Answer<Variant> RegistrationInterface::enable_flight_mode(const Request &request) {
    return result_of(registrations_.enable_flight_mode(request.slot));
}

Signal to_signal(const RegistrationEvent &event) {
    return std::visit(ToSignal{}, event);
}

} // namespace sim
