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

// A service's name as its log lines have it.
struct Service {
    const char *name;
    const char *list;
};

// Ends a get request: a list of entries, or the service's own failure. The texts in the entries are
// borrowed from the reply.
template <typename Entry>
void complete_list(GObject *source, GAsyncResult *outcome, gpointer context, FieldsView fields,
                   const Entry *decltype(ims_ss_status_list_s::entries)::*entries, Service service,
                   Site site = here()) noexcept {
    complete<"(iu@aa{sv})">(
        source, outcome, context,
        [=](const Completion &done, std::int32_t result, std::uint32_t count,
            const Variant &dictionaries) {
            if (result != 0) {
                log_error(site, "Failed to get %s status: %d", service.name, result);
                return done(result);
            }
            ims_ss_status_list_s list{
                checked_count(service.list, count, dictionaries.get(), UINT32_MAX, site), {}};
            std::vector<Entry> found(list.count);
            read_list(dictionaries.get(), fields, std::span{found});
            list.entries.*entries = found.empty() ? nullptr : found.data();
            done(result, &list);
        },
        site);
}

} // namespace

static void on_response_ss_set_call_waiting(GObject *source, GAsyncResult *outcome,
                                            gpointer context) {
    complete(source, outcome, context);
}

// Neither call-waiting request checks its handle or its record.
int ims_ss_set_call_waiting(ims_h handle, const ims_ss_cw_info_s *info, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit())
        return refused;
    return request(handle, kInterface, "SetCallWaiting",
                   pack<"(iii)">(handle->app_id, info->ss_class, info->ss_status),
                   {on_response_ss_set_call_waiting, callback, user_data});
}

static void on_response_ss_get_call_waiting(GObject *source, GAsyncResult *outcome,
                                            gpointer context) {
    complete_list(source, outcome, context, kWaitingFields,
                  &decltype(ims_ss_status_list_s::entries)::call_waiting,
                  {"waiting", "Waiting status"});
}

int ims_ss_get_call_waiting(ims_h handle, int32_t ss_class, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit())
        return refused;
    return request(handle, kInterface, "GetCallWaiting", pack<"(ii)">(handle->app_id, ss_class),
                   {on_response_ss_get_call_waiting, callback, user_data});
}

static void on_response_ss_set_call_forwarding(GObject *source, GAsyncResult *outcome,
                                               gpointer context) {
    complete(source, outcome, context);
}

int ims_ss_set_call_forwarding(ims_h handle, const ims_ss_cf_info_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetCallForwarding",
                   pack<"(iiiiiiis)">(handle->app_id, info->ss_class, info->ss_status,
                                      info->cf_type, info->no_reply_time, info->cf_uri_length,
                                      info->cf_uri_type, info->cf_uri),
                   {on_response_ss_set_call_forwarding, callback, user_data});
}

static void on_response_ss_get_call_forwarding(GObject *source, GAsyncResult *outcome,
                                               gpointer context) {
    complete_list(source, outcome, context, kForwardingFields,
                  &decltype(ims_ss_status_list_s::entries)::call_forwarding,
                  {"forwarding", "Forwarding status"});
}

int ims_ss_get_call_forwarding(ims_h handle, const ims_ss_query_s *query, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, query}))
        return refused;
    return request(handle, kInterface, "GetCallForwarding",
                   pack<"(iii)">(handle->app_id, query->ss_class, query->type),
                   {on_response_ss_get_call_forwarding, callback, user_data});
}

static void on_response_ss_set_call_barring(GObject *source, GAsyncResult *outcome,
                                            gpointer context) {
    complete(source, outcome, context);
}

int ims_ss_set_call_barring(ims_h handle, const ims_ss_cb_set_s *info, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetCallBarring",
                   pack<"(iiiis)">(handle->app_id, info->ss_class, info->ss_status, info->cb_type,
                                   info->cb_password),
                   {on_response_ss_set_call_barring, callback, user_data});
}

static void on_response_ss_get_call_barring(GObject *source, GAsyncResult *outcome,
                                            gpointer context) {
    complete_list(source, outcome, context, kBarringFields,
                  &decltype(ims_ss_status_list_s::entries)::call_barring,
                  {"barring", "Barring status"});
}

int ims_ss_get_call_barring(ims_h handle, const ims_ss_query_s *query, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle, query}))
        return refused;
    return request(handle, kInterface, "GetCallBarring",
                   pack<"(iii)">(handle->app_id, query->ss_class, query->type),
                   {on_response_ss_get_call_barring, callback, user_data});
}
