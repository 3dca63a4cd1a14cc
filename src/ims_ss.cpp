// SPDX-License-Identifier: Apache-2.0
// Supplementary services: call waiting, call forwarding, call barring.
#include "ims_ss.h"

#include "frame.hpp"
#include "wire/dictionary.hpp"

#include <vector>

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Ss";

constexpr auto kWaitingFields = field_table({
    IMS_FIELD(ims_ss_cw_info_s, ss_class),
    IMS_FIELD(ims_ss_cw_info_s, ss_status),
});
constexpr auto kForwardingFields = field_table({
    IMS_FIELD(ims_ss_cf_info_s, ss_class),
    IMS_FIELD(ims_ss_cf_info_s, ss_status),
    IMS_FIELD(ims_ss_cf_info_s, cf_type),
    IMS_FIELD(ims_ss_cf_info_s, no_reply_time),
    IMS_FIELD(ims_ss_cf_info_s, cf_uri_length),
    IMS_FIELD(ims_ss_cf_info_s, cf_uri_type),
    IMS_FIELD(ims_ss_cf_info_s, cf_uri),
});
constexpr auto kBarringFields = field_table({
    IMS_FIELD(ims_ss_cb_info_s, ss_class),
    IMS_FIELD(ims_ss_cb_info_s, ss_status),
    IMS_FIELD(ims_ss_cb_info_s, cb_type),
});

using Entries = decltype(ims_ss_status_list_s::entries);

// The list of entries that a service answers with, or its own failure: the service's name as the
// lines about the one and the other have it. The texts in the entries are borrowed from the reply.
template <Literal Failed, Literal Listed, const auto &Fields, typename Entry,
          const Entry *Entries::*Member>
constexpr auto kList = [](const Completion &done, std::int32_t result, std::uint32_t count,
                          const Variant &dictionaries) {
    if (result != 0) {
        log_error(done.site(), "Failed to get %s status: %d", Failed.text, result);
        return done(result);
    }
    ims_ss_status_list_s list{
        checked_count(Listed.text, count, dictionaries.get(), UINT32_MAX, done.site()), {}};
    std::vector<Entry> found(list.count);
    read_list(dictionaries.get(), Fields, std::span{found});
    list.entries.*Member = found.empty() ? nullptr : found.data();
    done(result, &list);
};
constexpr auto kWaitingList =
    kList<"waiting", "Waiting status", kWaitingFields, ims_ss_cw_info_s, &Entries::call_waiting>;
constexpr auto kForwardingList = kList<"forwarding", "Forwarding status", kForwardingFields,
                                       ims_ss_cf_info_s, &Entries::call_forwarding>;
constexpr auto kBarringList =
    kList<"barring", "Barring status", kBarringFields, ims_ss_cb_info_s, &Entries::call_barring>;

} // namespace

// Neither call-waiting request checks its handle or its record.
int ims_ss_set_call_waiting(ims_h handle, const ims_ss_cw_info_s *info, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit())
        return refused;
    return request(handle, kInterface, "SetCallWaiting",
                   pack<"(iii)">(handle->app_id, info->ss_class, info->ss_status),
                   {answer<"on_response_ss_set_call_waiting">, callback, user_data});
}

int ims_ss_get_call_waiting(ims_h handle, int32_t ss_class, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit())
        return refused;
    return request(handle, kInterface, "GetCallWaiting", pack<"(ii)">(handle->app_id, ss_class),
                   {answer<"on_response_ss_get_call_waiting", "(iu@aa{sv})", kWaitingList>,
                    callback, user_data});
}

int ims_ss_set_call_forwarding(ims_h handle, const ims_ss_cf_info_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetCallForwarding",
                   pack<"(iiiiiiis)">(handle->app_id, info->ss_class, info->ss_status,
                                      info->cf_type, info->no_reply_time, info->cf_uri_length,
                                      info->cf_uri_type, info->cf_uri),
                   {answer<"on_response_ss_set_call_forwarding">, callback, user_data});
}

int ims_ss_get_call_forwarding(ims_h handle, const ims_ss_query_s *query, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, query}))
        return refused;
    return request(handle, kInterface, "GetCallForwarding",
                   pack<"(iii)">(handle->app_id, query->ss_class, query->type),
                   {answer<"on_response_ss_get_call_forwarding", "(iu@aa{sv})", kForwardingList>,
                    callback, user_data});
}

int ims_ss_set_call_barring(ims_h handle, const ims_ss_cb_set_s *info, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetCallBarring",
                   pack<"(iiiis)">(handle->app_id, info->ss_class, info->ss_status, info->cb_type,
                                   info->cb_password),
                   {answer<"on_response_ss_set_call_barring">, callback, user_data});
}

int ims_ss_get_call_barring(ims_h handle, const ims_ss_query_s *query, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle, query}))
        return refused;
    return request(handle, kInterface, "GetCallBarring",
                   pack<"(iii)">(handle->app_id, query->ss_class, query->type),
                   {answer<"on_response_ss_get_call_barring", "(iu@aa{sv})", kBarringList>,
                    callback, user_data});
}
