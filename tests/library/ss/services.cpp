// SPDX-License-Identifier: Apache-2.0
#include "tests/library/ss/services.hpp"

namespace test {
namespace {

constexpr ims_ss_query_s kAsked{1, 2};

constexpr const char *kWaitingKeys[] = {"ss_class", "ss_status"};
constexpr const char *kForwardingKeys[] = {"ss_class",      "ss_status",     "cf_type",
                                           "no_reply_time", "cf_uri_length", "cf_uri_type"};
constexpr const char *kBarringKeys[] = {"ss_class", "ss_status", "cb_type"};

const Service kServices[] = {
    {"Waiting", "org.kelvo.ims.Ss.GetCallWaiting", "on_response_ss_get_call_waiting",
     "Failed to get waiting status: ", "Waiting status list count is NOT valid - Count: ",
     kWaitingKeys, false,
     [](ims_h handle, ims_response_cb callback, void *user_data) {
         return ims_ss_get_call_waiting(handle, 1, callback, user_data);
     },
     [](const ims_ss_status_list_s &list) -> const void * { return list.entries.call_waiting; },
     [](const ims_ss_status_list_s &list, std::size_t at) {
         const ims_ss_cw_info_s &entry = list.entries.call_waiting[at];
         return Entry{{entry.ss_class, entry.ss_status}, nullptr};
     }},
    {"Forwarding", "org.kelvo.ims.Ss.GetCallForwarding", "on_response_ss_get_call_forwarding",
     "Failed to get forwarding status: ", "Forwarding status list count is NOT valid - Count: ",
     kForwardingKeys, true,
     [](ims_h handle, ims_response_cb callback, void *user_data) {
         return ims_ss_get_call_forwarding(handle, &kAsked, callback, user_data);
     },
     [](const ims_ss_status_list_s &list) -> const void * { return list.entries.call_forwarding; },
     [](const ims_ss_status_list_s &list, std::size_t at) {
         const ims_ss_cf_info_s &entry = list.entries.call_forwarding[at];
         return Entry{{entry.ss_class, entry.ss_status, entry.cf_type, entry.no_reply_time,
                       entry.cf_uri_length, entry.cf_uri_type},
                      entry.cf_uri};
     }},
    {"Barring", "org.kelvo.ims.Ss.GetCallBarring", "on_response_ss_get_call_barring",
     "Failed to get barring status: ", "Barring status list count is NOT valid - Count: ",
     kBarringKeys, false,
     [](ims_h handle, ims_response_cb callback, void *user_data) {
         return ims_ss_get_call_barring(handle, &kAsked, callback, user_data);
     },
     [](const ims_ss_status_list_s &list) -> const void * { return list.entries.call_barring; },
     [](const ims_ss_status_list_s &list, std::size_t at) {
         const ims_ss_cb_info_s &entry = list.entries.call_barring[at];
         return Entry{{entry.ss_class, entry.ss_status, entry.cb_type}, nullptr};
     }},
};

} // namespace

std::span<const Service> services() {
    return kServices;
}

std::string dictionary(const Service &service, std::int32_t first) {
    std::string text = "{";
    for (const char *key : service.keys)
        text += "'" + std::string{key} + "': <" + std::to_string(first++) + ">, ";
    if (service.has_uri)
        text += "'cf_uri': <'tel:" + std::to_string(first) + "'>, ";
    return text.substr(0, text.size() - 2) + "}";
}

std::string list_reply(const std::string &count, const std::vector<std::string> &dictionaries) {
    std::string text = "(0, " + count + ", [";
    for (const std::string &one : dictionaries)
        text += (text.back() == '[' ? "" : ", ") + one;
    return text + "])";
}

} // namespace test
