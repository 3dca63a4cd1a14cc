// SPDX-License-Identifier: Apache-2.0
#include "sim/network.hpp"

#include "sim/group/store.hpp"
#include "sim/settings/store.hpp"

#include <utility>

namespace sim {

Network::Network(NetworkOptions options, Timers &timers, const NetworkSinks &sinks)
    : plan(std::move(options.numbers)), registrations(plan.slots(), timers, sinks.registration),
      logins(plan.slots(), timers, registrations, sinks.login), services(plan, registrations),
      calls(plan, timers, registrations, services, options.ring_time,
            [this, tell = sinks.call](int slot, const CallEvent &event) {
                tell(slot, event);
                video.hear(slot, event);
            }),
      ussd(plan, timers, registrations, sinks.call), video(calls, plan.slots()),
      centre(plan, timers, registrations, options.epoch, sinks.sms), ptt_directory(plan),
      ptt(ptt_directory, timers, registrations,
          [this, tell = sinks.ptt](int slot, const PttEvent &event) {
              ptt_recorder.hear(slot, event);
              tell(slot, event);
          }),
      ptt_recorder(ptt, timers), ptt_messages(ptt_directory, ptt, timers, registrations, sinks.ptt),
      ptt_files(ptt_directory, ptt, timers, registrations, sinks.ptt), settings(plan.slots()) {
    registrations.when_lost([this](int slot) { take_away(slot); });
    registrations.when_registered([this](int slot) { centre.deliver_stored(slot); });
    ptt_directory.add_groups([this](std::string_view uri) { return groups.participants_of(uri); });
}

std::optional<std::string> Network::keep_in(const std::string &directory) {
    const auto store = Store::open(directory);
    if (!store)
        return store.refusal().reason;
    if (auto error = keep_settings(*store, settings))
        return error;
    return keep_groups(*store, groups);
}

// What a slot loses with its radio, in the order in which it is told.
void Network::take_away(int slot) {
    calls.drop_calls(slot);
    ussd.drop_dialogue(slot);
    logins.log_out(slot);
    centre.take_back(slot);
    ptt.drop_calls(slot);
    ptt_files.drop_transfers(slot);
}

} // namespace sim
