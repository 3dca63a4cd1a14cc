// SPDX-License-Identifier: Apache-2.0
#include "sim/stand_in.hpp"

#include "sim/call/signals.hpp"

#include <ctime>

namespace sim {

namespace {

template <typename Interface>
auto sink_of(Service &service) {
    return [&service](int slot, const auto &event) {
        const Signal signal = to_signal(event);
        service.emit(slot, Interface::kName, signal.member, signal.body);
    };
}

} // namespace

StandIn::StandIn(const Options &options, const Log &log, MainLoop &loop)
    : log_(log), timers_(options.speed, &MainLoop::now),
      service_(bus_, log_, applications_, static_cast<int>(options.numbers.size())),
      network_(
          {.numbers = options.numbers,
           .ring_time = std::chrono::duration_cast<std::chrono::nanoseconds>(options.ring_time),
           .epoch = std::time(nullptr)},
          timers_,
          {.registration = sink_of<RegistrationInterface>(service_),
           .login = sink_of<LoginInterface>(service_),
           .call = sink_of<CallInterface>(service_),
           .sms = sink_of<SmsInterface>(service_),
           .ptt = sink_of<PttInterface>(service_)}),
      registration_interface_(applications_, network_.registrations),
      login_interface_(network_.logins), call_interface_(network_.calls, network_.ussd),
      sms_interface_(network_.centre), ss_interface_(network_.services),
      settings_interface_(network_.settings), vt_interface_(network_.video),
      ptt_interface_(network_.ptt, network_.ptt_recorder, network_.ptt_messages,
                     network_.ptt_files),
      group_interface_(network_.groups, network_.plan, network_.registrations,
                       [this](int slot) { return network_.ptt.running(slot); }) {
    loop.drive(timers_);
    service_.add(registration_interface_.describe());
    service_.add(login_interface_.describe());
    service_.add(call_interface_.describe());
    service_.add(sms_interface_.describe());
    service_.add(ss_interface_.describe());
    service_.add(settings_interface_.describe());
    service_.add(vt_interface_.describe());
    service_.add(ptt_interface_.describe());
    service_.add(group_interface_.describe());
}

std::optional<std::string> StandIn::restore(const std::string &state_directory) {
    return state_directory.empty() ? std::nullopt : network_.keep_in(state_directory);
}

std::optional<std::string> StandIn::start(const std::string &address,
                                          std::function<void(const std::string &why)> lost) {
    if (auto error = bus_.connect(address))
        return fmt::format("cannot reach the bus: {}", *error);
    bus_.listen({.call = [this](GDBusMessage *call) { service_.handle(call); },
                 .peer_gone =
                     [this](const std::string &connection) {
                         if (const auto gone = applications_.forget(connection))
                             log_.trace(
                                 "{} has left the bus with {} application(s); its calls stay",
                                 connection, gone);
                     },
                 .lost = std::move(lost)});
    if (auto error = bus_.own_name(std::string(Service::kName)))
        return error;
    network_.registrations.start();
    return std::nullopt;
}

} // namespace sim
