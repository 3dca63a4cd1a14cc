// SPDX-License-Identifier: Apache-2.0
#include "sim/ss/interface.hpp"

#include "sim/bus/ask.hpp"

namespace sim {

template <>
inline constexpr std::array wire::kKeys<WaitingEntry>{"ss_class", "ss_status"};
template <>
inline constexpr std::array wire::kKeys<ForwardingEntry>{
    "ss_class", "ss_status", "cf_type", "no_reply_time", "cf_uri_length", "cf_uri_type", "cf_uri",
};
template <>
inline constexpr std::array wire::kKeys<BarringEntry>{"ss_class", "ss_status", "cb_type"};

namespace {

using enum Caller;

constexpr std::size_t kPasswordIndex = 4;

constexpr MethodRow<SupplementaryServices> kMethods[] = {
    {"SetCallWaiting", ask<&SupplementaryServices::set_waiting>, kFirstArgument},
    {"GetCallWaiting", ask<&SupplementaryServices::waiting>, kFirstArgument},
    {"SetCallForwarding", ask<&SupplementaryServices::set_forwarding>, kFirstArgument},
    {"GetCallForwarding", ask<&SupplementaryServices::forwarding>, kFirstArgument},
    {"SetCallBarring", ask<&SupplementaryServices::set_barring>, kFirstArgument, kPasswordIndex},
    {"GetCallBarring", ask<&SupplementaryServices::barring>, kFirstArgument},
};

} // namespace

Interface SsInterface::describe() {
    return {kName, bind_methods(kMethods, services_), {}};
}

} // namespace sim
