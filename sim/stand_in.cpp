// SPDX-License-Identifier: Apache-2.0
#include "sim/stand_in.hpp"

#include "sim/call/signals.hpp"
#include "sim/group/store.hpp"
#include "sim/ptt/participants.hpp"
#include "sim/ptt/signals.hpp"
#include "sim/settings/store.hpp"

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
    : log_(log), plan_(options.numbers), timers_(options.speed, &MainLoop::now),
      service_(bus_, log_, applications_, plan_.slots()),
      registrations_(plan_.slots(), timers_, sink_of<RegistrationInterface>(service_)),
      services_(plan_, registrations_),
      calls_(plan_, timers_, registrations_, services_,
             std::chrono::duration_cast<std::chrono::nanoseconds>(options.ring_time),
             [this](int slot, const CallEvent &event) {
                 sink_of<CallInterface>(service_)(slot, event);
                 video_.hear(slot, event);
             }),
      video_(calls_, plan_.slots()),
      ussd_(plan_, timers_, registrations_, sink_of<CallInterface>(service_)),
      logins_(plan_.slots(), timers_, registrations_, sink_of<LoginInterface>(service_)),
      centre_(plan_, timers_, registrations_, std::time(nullptr), sink_of<SmsInterface>(service_)),
      ptt_directory_(plan_), ptt_calls_(ptt_directory_, timers_, registrations_,
                                        [this](int slot, const PttEvent &event) {
                                            ptt_recorder_.hear(slot, event);
                                            sink_of<PttInterface>(service_)(slot, event);
                                        }),
      ptt_recorder_(ptt_calls_, timers_),
      ptt_messages_(ptt_directory_, ptt_calls_, timers_, registrations_,
                    sink_of<PttInterface>(service_)),
      ptt_files_(ptt_directory_, ptt_calls_, timers_, registrations_,
                 sink_of<PttInterface>(service_)),
      settings_(plan_.slots()), registration_interface_(applications_, registrations_),
      login_interface_(logins_), call_interface_(calls_, ussd_), sms_interface_(centre_),
      ss_interface_(services_), settings_interface_(settings_), vt_interface_(video_),
      ptt_interface_(ptt_calls_, ptt_recorder_, ptt_messages_, ptt_files_),
      group_interface_(groups_, plan_, registrations_, [this](int slot) {
          std::vector<ParticipantInfo> sessions;
          for (const PttRunningCall &call : ptt_calls_.running(slot))
              sessions.push_back(participant_info(call));
          return sessions;
      }) {
    ptt_directory_.add_groups(
        [this](std::string_view uri) { return groups_.participants_of(uri); });
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
    if (state_directory.empty())
        return std::nullopt;
    const auto store = Store::open(state_directory);
    if (!store)
        return store.refusal().reason;
    if (auto error = keep_settings(*store, settings_))
        return error;
    return keep_groups(*store, groups_);
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
    registrations_.start();
    return std::nullopt;
}

} // namespace sim
