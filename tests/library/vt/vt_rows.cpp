// SPDX-License-Identifier: Apache-2.0
#include "tests/library/vt/vt_rows.hpp"

#include "tests/support/data_checks.hpp"

namespace test {
namespace {

constexpr std::int32_t kSession = 7;
constexpr ims_vt_camera_s kCamera{7, -1};
constexpr ims_vt_hide_me_s kHideMe{7, "/tmp/me.png"};
constexpr ims_vt_orientation_s kOrientation{7, 270};
constexpr ims_vt_zoom_query_s kZoomQuery{7, 1};
constexpr ims_vt_zoom_s kZoom{7, 1, 40};
constexpr ims_vt_capture_s kCapture{7, 2, "/tmp/picture.png"};
constexpr ims_vt_record_start_s kStart{7, 2, 3, "/tmp/video.mp4", 4};
constexpr ims_vt_record_s kRecord{7, 2};
constexpr ims_vt_file_cast_s kCast{7, "/tmp/film.mp4"};
constexpr ims_vt_swipe_s kSwipe{7, 1, -2, 3, -4, 5};
constexpr std::int32_t kEntries[] = {3, -5, 2147483647};
constexpr ims_vt_surface_s kSurface{7, 3, kEntries};
constexpr ims_vt_pix_map_re_use_s kReUse{7, 2, 3};
constexpr ims_vt_pix_map_s kPixMap{7, 2};
constexpr ims_vt_window_s kWindow{7, 1, -2, 3, -4, 5};
constexpr ims_vt_buffer_s kBuffer{7, "buffer"};

std::vector<RequestRow> camera_rows() {
    return {
        {.function = request<ims_vt_start_camera, kCamera>(),
         .method = "StartCamera",
         .type = "(ii)",
         .arguments = "(7, -1)"},
        {.function = request<ims_vt_stop_camera, kSession>(),
         .method = "StopCamera",
         .type = "(i)",
         .arguments = "(7,)"},
        {.function = request<ims_vt_hide_me, kHideMe>(),
         .method = "HideMe",
         .type = "(is)",
         .arguments = "(7, '/tmp/me.png')",
         .bad_texts = {bad_text<&ims_vt_hide_me_s::text_1>()}},
        {.function = request<ims_vt_show_me, kSession>(),
         .method = "ShowMe",
         .type = "(i)",
         .arguments = "(7,)"},
        {.function = request<ims_vt_switch_camera, kSession>(),
         .method = "SwitchCamera",
         .type = "(i)",
         .arguments = "(7,)"},
        {.function = request<ims_vt_set_video_orientation, kOrientation>(),
         .method = "SetVideoOrientation",
         .type = "(ii)",
         .arguments = "(7, 270)"},
        {.function = request<ims_vt_get_zoom, kZoomQuery>(),
         .method = "GetZoom",
         .type = "(ii)",
         .arguments = "(7, 1)",
         .reply_type = "(ii)",
         .reply = "(0, 40)",
         .check_data = points_to<40>,
         .handler = "on_response_vt_get_zoom"},
        {.function = request<ims_vt_set_zoom, kZoom>(),
         .method = "SetZoom",
         .type = "(iii)",
         .arguments = "(7, 1, 40)"},
        {.function = request<ims_vt_hold_video, kSession>(),
         .method = "HoldVideo",
         .type = "(i)",
         .arguments = "(7,)"},
        {.function = request<ims_vt_resume_video, kSession>(),
         .method = "ResumeVideo",
         .type = "(i)",
         .arguments = "(7,)"},
    };
}

std::vector<RequestRow> file_rows() {
    return {
        {.function = request<ims_vt_capture_surface_image, kCapture>(),
         .method = "CaptureSurfaceImage",
         .type = "(iis)",
         .arguments = "(7, 2, '/tmp/picture.png')",
         .bad_texts = {bad_text<&ims_vt_capture_s::text_1>()}},
        {.function = request<ims_vt_start_record_video, kStart>(),
         .method = "StartRecordVideo",
         .type = "(iiisi)",
         .arguments = "(7, 2, 3, '/tmp/video.mp4', 4)",
         .bad_texts = {bad_text<&ims_vt_record_start_s::text_1>()}},
        {.function = request<ims_vt_pause_record_video, kRecord>(),
         .method = "PauseRecordVideo",
         .type = "(ii)",
         .arguments = "(7, 2)"},
        {.function = request<ims_vt_resume_record_video, kRecord>(),
         .method = "ResumeRecordVideo",
         .type = "(ii)",
         .arguments = "(7, 2)"},
        {.function = request<ims_vt_cancel_record_video, kRecord>(),
         .method = "CancelRecordVideo",
         .type = "(ii)",
         .arguments = "(7, 2)"},
        {.function = request<ims_vt_stop_record_video, kRecord>(),
         .method = "StopRecordVideo",
         .type = "(ii)",
         .arguments = "(7, 2)"},
        {.function = request<ims_vt_start_file_cast, kCast>(),
         .method = "StartFileCast",
         .type = "(is)",
         .arguments = "(7, '/tmp/film.mp4')",
         .bad_texts = {bad_text<&ims_vt_file_cast_s::text_1>()}},
        {.function = request<ims_vt_stop_file_cast, kSession>(),
         .method = "StopFileCast",
         .type = "(i)",
         .arguments = "(7,)"},
    };
}

std::vector<RequestRow> drawing_rows() {
    return {
        {.function = request<ims_vt_swap_video_surface, kSession>(),
         .method = "SwapVideoSurface",
         .type = "(i)",
         .arguments = "(7,)"},
        // The record is not checked: callers never pass NULL.
        {.function = request<ims_vt_swipe_video, kSwipe>(),
         .method = "SwipeVideo",
         .type = "(iiiiii)",
         .arguments = "(7, 1, -2, 3, -4, 5)",
         .checked = Checked::kHandle},
        {.function = request<ims_vt_set_near_end_surface, kSurface>(),
         .method = "SetNearEndSurface",
         .type = "(iiv)",
         .arguments = "(7, 3, <[3, -5, 2147483647]>)"},
        {.function = request<ims_vt_set_far_end_surface, kSurface>(),
         .method = "SetFarEndSurface",
         .type = "(iiv)",
         .arguments = "(7, 3, <[3, -5, 2147483647]>)"},
        {.function = request<ims_vt_set_active_session_id, kSession>(),
         .method = "SetActiveSessionId",
         .type = "(i)",
         .arguments = "(7,)"},
        {.function = request<ims_vt_re_use_pix_map_id, kReUse>(),
         .method = "ReUsePixMapId",
         .type = "(iii)",
         .arguments = "(7, 2, 3)"},
        {.function = request<ims_vt_release_pix_map_id, kPixMap>(),
         .method = "ReleasePixMapId",
         .type = "(ii)",
         .arguments = "(7, 2)"},
        {.function = request<ims_vt_set_window_id, kWindow>(),
         .method = "SetWindowId",
         .type = "(iiiiii)",
         .arguments = "(7, 1, -2, 3, -4, 5)"},
        {.function = request<ims_vt_set_camera_buffer, kBuffer>(),
         .method = "SetCameraBuffer",
         .type = "(is)",
         .arguments = "(7, 'buffer')",
         .bad_texts = {bad_text<&ims_vt_buffer_s::text_1>()}},
        {.function = request<ims_vt_set_media_buffer, kBuffer>(),
         .method = "SetMediaBuffer",
         .type = "(is)",
         .arguments = "(7, 'buffer')",
         .bad_texts = {bad_text<&ims_vt_buffer_s::text_1>()}},
    };
}

} // namespace

// All but one share a handler, whose name stands in the line of a refusal.
std::vector<RequestRow> vt_request_rows() {
    return requests_of({.unit = "ims_vt.cpp",
                        .interface = "org.kelvo.ims.Vt",
                        .handler = "on_response_common_response"},
                       joined({camera_rows(), file_rows(), drawing_rows()}));
}

} // namespace test
