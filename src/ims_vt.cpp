// SPDX-License-Identifier: Apache-2.0
// Video telephony: cameras, preview, recording, casting and surfaces. No tuple carries the
// application id.
#include "ims_vt.h"

#include "frame.hpp"

using namespace ims;

namespace {

constexpr const char *kInterface = "org.kelvo.ims.Vt";

// The entries as an "ai" inside a "v"; none for a count that is not positive.
Variant surface_entries(const ims_vt_surface_s &surface) noexcept {
    const gsize count =
        surface.entries != nullptr && surface.count > 0 ? static_cast<gsize>(surface.count) : 0;
    return boxed(owned(g_variant_new_fixed_array(G_VARIANT_TYPE_INT32, surface.entries, count,
                                                 sizeof(std::int32_t))));
}

} // namespace

int ims_vt_start_camera(ims_h handle, const ims_vt_camera_s *info, ims_response_cb callback,
                        void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "StartCamera", pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_stop_camera(ims_h handle, int32_t session_id, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "StopCamera", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_hide_me(ims_h handle, const ims_vt_hide_me_s *info, ims_response_cb callback,
                   void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "HideMe", pack<"(is)">(info->session_id, info->text_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_show_me(ims_h handle, int32_t session_id, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "ShowMe", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_switch_camera(ims_h handle, int32_t session_id, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SwitchCamera", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_video_orientation(ims_h handle, const ims_vt_orientation_s *info,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetVideoOrientation",
                   pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_get_zoom(ims_h handle, const ims_vt_zoom_query_s *info, ims_response_cb callback,
                    void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(
        handle, kInterface, "GetZoom", pack<"(ii)">(info->session_id, info->value_1),
        {answer<"on_response_vt_get_zoom", "(ii)", kSecondByPointer>, callback, user_data});
}

int ims_vt_set_zoom(ims_h handle, const ims_vt_zoom_s *info, ims_response_cb callback,
                    void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetZoom",
                   pack<"(iii)">(info->session_id, info->value_1, info->value_2),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_hold_video(ims_h handle, int32_t session_id, ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "HoldVideo", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_resume_video(ims_h handle, int32_t session_id, ims_response_cb callback,
                        void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "ResumeVideo", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_capture_surface_image(ims_h handle, const ims_vt_capture_s *info,
                                 ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "CaptureSurfaceImage",
                   pack<"(iis)">(info->session_id, info->value_1, info->text_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_start_record_video(ims_h handle, const ims_vt_record_start_s *info,
                              ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "StartRecordVideo",
                   pack<"(iiisi)">(info->session_id, info->value_1, info->value_2, info->text_1,
                                   info->value_3),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_pause_record_video(ims_h handle, const ims_vt_record_s *info, ims_response_cb callback,
                              void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "PauseRecordVideo",
                   pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_resume_record_video(ims_h handle, const ims_vt_record_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "ResumeRecordVideo",
                   pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_cancel_record_video(ims_h handle, const ims_vt_record_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "CancelRecordVideo",
                   pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_stop_record_video(ims_h handle, const ims_vt_record_s *info, ims_response_cb callback,
                             void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "StopRecordVideo",
                   pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_start_file_cast(ims_h handle, const ims_vt_file_cast_s *info, ims_response_cb callback,
                           void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "StartFileCast",
                   pack<"(is)">(info->session_id, info->text_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_stop_file_cast(ims_h handle, int32_t session_id, ims_response_cb callback,
                          void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "StopFileCast", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_swap_video_surface(ims_h handle, int32_t session_id, ims_response_cb callback,
                              void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SwapVideoSurface", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

// The record is not checked.
int ims_vt_swipe_video(ims_h handle, const ims_vt_swipe_s *info, ims_response_cb callback,
                       void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SwipeVideo",
                   pack<"(iiiiii)">(info->session_id, info->value_1, info->value_2, info->value_3,
                                    info->value_4, info->value_5),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_near_end_surface(ims_h handle, const ims_vt_surface_s *info,
                                ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetNearEndSurface",
                   pack<"(iiv)">(info->session_id, info->count, surface_entries(*info)),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_far_end_surface(ims_h handle, const ims_vt_surface_s *info, ims_response_cb callback,
                               void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetFarEndSurface",
                   pack<"(iiv)">(info->session_id, info->count, surface_entries(*info)),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_active_session_id(ims_h handle, int32_t session_id, ims_response_cb callback,
                                 void *user_data) {
    if (const int refused = admit({handle}))
        return refused;
    return request(handle, kInterface, "SetActiveSessionId", pack<"(i)">(session_id),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_re_use_pix_map_id(ims_h handle, const ims_vt_pix_map_re_use_s *info,
                             ims_response_cb callback, void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "ReUsePixMapId",
                   pack<"(iii)">(info->session_id, info->value_1, info->value_2),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_release_pix_map_id(ims_h handle, const ims_vt_pix_map_s *info, ims_response_cb callback,
                              void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "ReleasePixMapId",
                   pack<"(ii)">(info->session_id, info->value_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_window_id(ims_h handle, const ims_vt_window_s *info, ims_response_cb callback,
                         void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetWindowId",
                   pack<"(iiiiii)">(info->session_id, info->value_1, info->value_2, info->value_3,
                                    info->value_4, info->value_5),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_camera_buffer(ims_h handle, const ims_vt_buffer_s *info, ims_response_cb callback,
                             void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetCameraBuffer",
                   pack<"(is)">(info->session_id, info->text_1),
                   {answer<"on_response_common_response">, callback, user_data});
}

int ims_vt_set_media_buffer(ims_h handle, const ims_vt_buffer_s *info, ims_response_cb callback,
                            void *user_data) {
    if (const int refused = admit({handle, info}))
        return refused;
    return request(handle, kInterface, "SetMediaBuffer",
                   pack<"(is)">(info->session_id, info->text_1),
                   {answer<"on_response_common_response">, callback, user_data});
}
