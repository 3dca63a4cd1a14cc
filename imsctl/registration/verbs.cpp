// SPDX-License-Identifier: Apache-2.0
// Registration with the network, and flight mode.
#include "imsctl/line/requests.hpp"
#include "imsctl/line/watching.hpp"
#include "imsctl/registration/module.hpp"

namespace imsctl {
namespace {

const EventRow &registration_event() {
    return *find_event(registration_events(), IMS_NOTI_REG_REGISTRATION_STATUS);
}

// The answer to the query is the event's record.
void show_registration(Invocation &run) {
    ims_registration_info_s info{};
    run.client().query([&](ims_h handle) { return ims_get_registration_info(handle, &info); });
    run.output().result(registration_event(), take_fields(registration_event(), &info));
}

Action prepare_watch(Arguments &arguments) {
    const WatchLimits limits = watch_limits(arguments);
    return [limits](Invocation &run) {
        Watch watch(run, limits,
                    {&registration_event(),
                     find_event(registration_events(), IMS_NOTI_REG_EMERGENCY_REGISTRATION_STATUS)},
                    "watching the registration of");
        const auto show = [&](const Event &event) {
            show_event(run, event);
            return true;
        };
        watch.until_end(show);
    };
}

constexpr Verb kRegistrationVerbs[] = {
    {"registration show", "show whether the device is registered", "registration show",
     [](Arguments &) -> Action { return show_registration; }},
    {"registration watch", "show changes of the registration as they happen",
     "registration watch --count 1", prepare_watch},
    {"registration register", "register this program and the device again", "registration register",
     [](Arguments &) { return plain(ims_register_application, number_as("application_id")); }},
    {"flight-mode", "enter flight mode; 'registration register' leaves it", "flight-mode",
     [](Arguments &) { return plain(ims_enable_flight_mode); }},
};

} // namespace

std::span<const Verb> registration_verbs() {
    return kRegistrationVerbs;
}

} // namespace imsctl
