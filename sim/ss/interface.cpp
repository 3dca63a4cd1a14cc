// SPDX-License-Identifier: Apache-2.0
#include "sim/ss/interface.hpp"

#include "sim/bus/replies.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

} // namespace

const MethodRow<SsInterface> SsInterface::kMethods[] = {
    {"SetCallWaiting", "(iii)", "(i)", kFirstArgument, &SsInterface::set_call_waiting},
    {"GetCallWaiting", "(ii)", "(iuaa{sv})", kFirstArgument, &SsInterface::get_call_waiting},
    {"SetCallForwarding", "(iiiiiiis)", "(i)", kFirstArgument, &SsInterface::set_call_forwarding},
    {"GetCallForwarding", "(iii)", "(iuaa{sv})", kFirstArgument, &SsInterface::get_call_forwarding},
    {"SetCallBarring", "(iiiis)", "(i)", kFirstArgument, &SsInterface::set_call_barring, 0, 4},
    {"GetCallBarring", "(iii)", "(iuaa{sv})", kFirstArgument, &SsInterface::get_call_barring},
};

Interface SsInterface::describe() {
    return {kName, bind_methods<SsInterface>(*this, kMethods), {}};
}

Answer<Variant> SsInterface::set_call_waiting(const Request &request) {
    const auto [app, service, status] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(services_.set_waiting(request.slot, {ServiceClass{service}, status}));
}

Answer<Variant> SsInterface::get_call_waiting(const Request &request) {
    const auto [app, service] = request.unpack<int32_t, int32_t>();
    const auto entries = services_.waiting(request.slot, ServiceClass{service});
    if (!entries)
        return entries.refusal();
    return list_of(*entries, [](const WaitingEntry &entry, const auto &add) {
        add("ss_class", entry.service);
        add("ss_status", entry.status);
    });
}

Answer<Variant> SsInterface::set_call_forwarding(const Request &request) {
    const auto [app, service, status, condition, time, length, uri_type, uri] =
        request.unpack<int32_t, int32_t, int32_t, int32_t, int32_t, int32_t, int32_t, string>();
    return result_of(services_.set_forwarding(request.slot, {ServiceClass{service}, status,
                                                             ForwardCondition{condition}, time,
                                                             length, UriType{uri_type}, uri}));
}

Answer<Variant> SsInterface::get_call_forwarding(const Request &request) {
    const auto [app, service, condition] = request.unpack<int32_t, int32_t, int32_t>();
    const auto entries =
        services_.forwarding(request.slot, ServiceClass{service}, ForwardCondition{condition});
    if (!entries)
        return entries.refusal();
    return list_of(*entries, [](const ForwardingEntry &entry, const auto &add) {
        add("ss_class", entry.service);
        add("ss_status", entry.status);
        add("cf_type", entry.condition);
        add("no_reply_time", entry.no_reply_time);
        add("cf_uri_length", entry.uri_length);
        add("cf_uri_type", entry.uri_type);
        add("cf_uri", entry.uri);
    });
}

Answer<Variant> SsInterface::set_call_barring(const Request &request) {
    const auto [app, service, status, type, password] =
        request.unpack<int32_t, int32_t, int32_t, int32_t, string>();
    return result_of(services_.set_barring(
        request.slot, {ServiceClass{service}, status, BarringType{type}}, password));
}

Answer<Variant> SsInterface::get_call_barring(const Request &request) {
    const auto [app, service, type] = request.unpack<int32_t, int32_t, int32_t>();
    const auto entries = services_.barring(request.slot, ServiceClass{service}, BarringType{type});
    if (!entries)
        return entries.refusal();
    return list_of(*entries, [](const BarringEntry &entry, const auto &add) {
        add("ss_class", entry.service);
        add("ss_status", entry.status);
        add("cb_type", entry.type);
    });
}

} // namespace sim
