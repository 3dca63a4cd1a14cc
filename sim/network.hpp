// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/number_plan.hpp"
#include "sim/call/model.hpp"
#include "sim/call/ussd.hpp"
#include "sim/group/model.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/files.hpp"
#include "sim/ptt/messages.hpp"
#include "sim/ptt/model.hpp"
#include "sim/ptt/recorder.hpp"
#include "sim/registration/logins.hpp"
#include "sim/registration/registrations.hpp"
#include "sim/settings/model.hpp"
#include "sim/sms/service_centre.hpp"
#include "sim/ss/model.hpp"
#include "sim/vt/model.hpp"

#include <chrono>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace sim {

struct NetworkOptions {
    std::vector<std::string> numbers;                              // one a slot
    std::chrono::nanoseconds ring_time = std::chrono::seconds(60); // how long a slot rings
    std::int64_t epoch = 0; // when the timers' network time was 0, since 1970
};

// Who hears what slots are told.
struct NetworkSinks {
    Registrations::Sink registration;
    Logins::Sink login;
    CallModel::Sink call;
    ServiceCentre::Sink sms;
    PttCalls::Sink ptt;
};

// The network and the devices in it: every model, wired, without a bus.
struct Network {
    Network(NetworkOptions options, Timers &timers, const NetworkSinks &sinks);
    Network(const Network &) = delete;
    Network &operator=(const Network &) = delete;

    // Gives the models what is kept in a directory and keeps their changes there. What went wrong,
    // or nothing.
    std::optional<std::string> keep_in(const std::string &directory);

    NumberPlan plan; // the network's
    // What the devices are in the network.
    Registrations registrations;
    Logins logins;
    // Calls: the network forwards and bars them and answers codes; the devices show video.
    SupplementaryServices services;
    CallModel calls;
    UssdService ussd;
    VideoTelephony video;
    // The network's service centre.
    ServiceCentre centre;
    // The network's groups and its push-to-talk server; the devices record.
    GroupModel groups;
    PttDirectory ptt_directory;
    PttCalls ptt;
    PttRecorder ptt_recorder;
    PttMessages ptt_messages;
    PttFiles ptt_files;
    // The devices'.
    SettingsModel settings;

  private:
    void take_away(int slot);
};

} // namespace sim
