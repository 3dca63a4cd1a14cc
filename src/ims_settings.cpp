// SPDX-License-Identifier: Apache-2.0
// Global settings sets, registration profiles, network environment.
#include "ims_settings.h"

#include "frame.hpp"
#include "settings_fields.hpp"

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Settings";

} // namespace

int ims_get_global_settings_info(ims_h handle, const char *name, ims_global_settings_s *settings) {
    if (const int refused = admit({handle, settings}))
        return refused;
    Variant reply;
    if (const int failed = query(handle, kInterface, "GetGlobalSettings", pack<"(s)">(name), reply))
        return failed;
    std::int32_t result = 1;
    Variant dictionary;
    if (!unpack<"(i@a{sv})">(reply.get(), result, dictionary))
        return IMS_ERROR_OPERATION_FAILED;
    if (result != 0)
        return operation_failed(here(), "Failed to get global settings Info: %d", result);
    read_dictionary(dictionary.get(), kSettingsFields, settings);
    return IMS_ERROR_NONE;
}

int ims_update_global_settings(ims_h handle, const ims_global_settings_s *settings,
                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, settings}))
        return refused;
    return request(handle, kInterface, "UpdateGlobalSettings",
                   pack<"(@a{sv})">(write_dictionary(kSettingsFields, kSettingsUpdate, settings)),
                   {answer<"on_response_settings_update_global_settings">, callback, user_data});
}

int ims_add_global_settings(ims_h handle, const ims_global_settings_s *settings,
                            ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, settings}))
        return refused;
    return request(handle, kInterface, "AddGlobalSettings",
                   pack<"(@a{sv})">(write_dictionary(kSettingsFields, kSettingsAdd, settings)),
                   {answer<"on_response_settings_add_global_settings">, callback, user_data});
}

// The record is not checked here, nor in ims_delete_profile().
int ims_delete_global_settings(ims_h handle, const ims_global_settings_s *settings,
                               ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "DeleteGlobalSettings", pack<"(s)">(settings->name),
                   {answer<"on_response_settings_delete_global_settings">, callback, user_data});
}

void ims_global_settings_clear(ims_global_settings_s *settings) {
    if (settings != nullptr)
        clear_record(kSettingsFields, settings, sizeof *settings);
}

int ims_get_profile_list_info(ims_h handle, ims_profile_list_s *list) {
    if (const int refused = admit({handle, list}))
        return refused;
    Variant reply;
    if (const int failed = query(handle, kInterface, "GetProfileList", pack<"()">(), reply))
        return failed;
    std::int32_t result = 1;
    Variant profiles;
    if (!unpack<"(iu@aa{sv})">(reply.get(), result, list->count, profiles))
        return IMS_ERROR_OPERATION_FAILED;
    if (result != 0)
        return operation_failed(here(), "Failed to get profile Info: %d", result);
    list->count =
        checked_count("profile", list->count, profiles.get(), IMS_PROFILE_LIST_CAPACITY, here());
    read_list(profiles.get(), kProfileFields, std::span{list->profiles, list->count});
    return IMS_ERROR_NONE;
}

int ims_update_profile(ims_h handle, const ims_profile_s *profile, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle, profile}))
        return refused;
    return request(handle, kInterface, "UpdateProfile",
                   pack<"(@a{sv})">(write_dictionary(kProfileFields, kProfileWrite, profile)),
                   {answer<"on_response_settings_update_profile">, callback, user_data});
}

int ims_add_profile(ims_h handle, const ims_profile_s *profile, ims_response_cb callback,
                    void *user_data) {
    if (const int refused = admit({handle, profile}))
        return refused;
    return request(handle, kInterface, "AddProfile",
                   pack<"(@a{sv})">(write_dictionary(kProfileFields, kProfileWrite, profile)),
                   {answer<"on_response_settings_add_profile">, callback, user_data});
}

int ims_delete_profile(ims_h handle, const ims_profile_s *profile, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "DeleteProfile", pack<"(i)">(profile->id),
                   {answer<"on_response_settings_delete_profile">, callback, user_data});
}

void ims_profile_clear(ims_profile_s *profile) {
    if (profile != nullptr)
        clear_record(kProfileFields, profile, sizeof *profile);
}

void ims_profile_list_clear(ims_profile_list_s *list) {
    if (list == nullptr)
        return;
    for (ims_profile_s &profile : list->profiles)
        ims_profile_clear(&profile);
    list->count = 0;
}

int ims_set_network_environment(ims_h handle, int32_t environment_type, ims_response_cb callback,
                                void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SetNetworkEnvironment", pack<"(i)">(environment_type),
                   {answer<"on_response_settings_set_network_environment">, callback, user_data});
}

int ims_get_network_environment(ims_h handle, int32_t *environment_type) {
    if (const int refused = admit({handle, environment_type}))
        return refused;
    Variant reply;
    if (const int failed = query(handle, kInterface, "GetNetworkEnvironment", pack<"()">(), reply))
        return failed;
    // The type counts whatever the result says.
    Skipped result;
    return unpack<"(ii)">(reply.get(), result, *environment_type) ? IMS_ERROR_NONE
                                                                  : IMS_ERROR_OPERATION_FAILED;
}
