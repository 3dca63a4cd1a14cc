// SPDX-License-Identifier: Apache-2.0
#include "sim/registration/login_interface.hpp"

#include "sim/bus/replies.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;

constexpr SignalInfo kSignals[] = {{"LoginState", "(iuii)"}};

} // namespace

const MethodRow<LoginInterface> LoginInterface::kMethods[] = {
    {"Login", "(ssii)", "(i)", Caller::kLastArgument, &LoginInterface::login, 0, 1},
    {"Logout", "(i)", "(i)", Caller::kFirstArgument, &LoginInterface::logout},
    {"GetLoginState", "(ii)", "(iiui)", Caller::kLastArgument, &LoginInterface::get_login_state},
};

Interface LoginInterface::describe() {
    return {kName, bind_methods<LoginInterface>(*this, kMethods), kSignals};
}

Answer<Variant> LoginInterface::login(const Request &request) {
    const auto [user, password, kind, app] = request.unpack<string, string, int32_t, int32_t>();
    return result_of(logins_.login(request.slot, user, password, LoginKind{kind}));
}

Answer<Variant> LoginInterface::logout(const Request &request) {
    return result_of(logins_.logout(request.slot));
}

Answer<Variant> LoginInterface::get_login_state(const Request &request) {
    const auto [kind, app] = request.unpack<int32_t, int32_t>();
    const auto state = logins_.state(request.slot, LoginKind{kind});
    if (!state)
        return state.refusal();
    return wire::pack(Result::kOk, state->phase, state->number, state->reason);
}

Signal to_signal(const LoginState &event) {
    return {"LoginState", wire::pack(event.phase, event.number, event.reason, event.kind)};
}

} // namespace sim
