// SPDX-License-Identifier: Apache-2.0
// Logging a user in and out.
#include "imsctl/line/requests.hpp"
#include "imsctl/registration/module.hpp"

namespace imsctl {
namespace {

constexpr NamedValue kLoginKinds[] = {{"ims", 0}, {"push-to-talk", 1}};

Action prepare_login(Arguments &arguments) {
    const auto user = arguments.text("USER", "who logs in");
    const auto password = arguments.text("PASSWORD", "the user's password");
    const auto kind = arguments.choice("--kind", "the kind of login", kLoginKinds, 0);
    return [=](Invocation &run) {
        const auto start = [&](ims_h handle, ims_response_cb callback, void *user_data) {
            return ims_login(handle, user->c_str(), password->c_str(), *kind, callback, user_data);
        };
        run.request({}, start);
    };
}

Action prepare_login_state(Arguments &arguments) {
    const auto kind = arguments.choice("--kind", "the kind of login", kLoginKinds, 0);
    return [kind](Invocation &run) {
        ims_login_state_s state{};
        run.client().query(
            [&](ims_h handle) { return ims_get_login_state(handle, *kind, &state); });
        const EventRow &row = *find_event(login_events(), IMS_NOTI_LOGIN_STATE);
        run.output().result(row, take_fields(row, &state));
    };
}

constexpr Verb kLoginVerbs[] = {
    {"login", "log a user in", "login alice secret", prepare_login},
    {"logout", "log the user out", "logout", [](Arguments &) { return plain(ims_logout); }},
    {"login-state", "show who is logged in", "login-state", prepare_login_state},
};

} // namespace

std::span<const Verb> login_verbs() {
    return kLoginVerbs;
}

} // namespace imsctl
