// SPDX-License-Identifier: Apache-2.0
#include "tests/library/vt/vt_rows.hpp"

#include <gtest/gtest.h>

namespace test {
namespace {

constexpr Module kVt{"ims_vt.cpp", "org.kelvo.ims.Vt"};

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

// "(ii)" "(0, 40)"
void is_pointer_to_forty(void *data) {
    ASSERT_NE(data, nullptr);
    EXPECT_EQ(*static_cast<std::int32_t *>(data), 40);
}

// f(handle, session, callback, user_data)
template <auto Function>
RequestRow session_row(const char *function, const char *method) {
    return value_row<Function, 7>(kVt, function, method, "(i)", "(7,)");
}

// A row whose record ends in a text, or has one in it.
template <auto Function, const auto &Record, auto Text>
RequestRow text_row(const char *function, const char *method, const char *type, const char *sent) {
    return with_bad_texts(record_row<Function, Record>(kVt, function, method, type, sent),
                          {bad_text<Function, Record, Text>("text_1")});
}

std::vector<RequestRow> camera_rows() {
    return {
        record_row<ims_vt_start_camera, kCamera>(kVt, "ims_vt_start_camera", "StartCamera", "(ii)",
                                                 "(7, -1)"),
        session_row<ims_vt_stop_camera>("ims_vt_stop_camera", "StopCamera"),
        text_row<ims_vt_hide_me, kHideMe, &ims_vt_hide_me_s::text_1>("ims_vt_hide_me", "HideMe",
                                                                     "(is)", "(7, '/tmp/me.png')"),
        session_row<ims_vt_show_me>("ims_vt_show_me", "ShowMe"),
        session_row<ims_vt_switch_camera>("ims_vt_switch_camera", "SwitchCamera"),
        record_row<ims_vt_set_video_orientation, kOrientation>(
            kVt, "ims_vt_set_video_orientation", "SetVideoOrientation", "(ii)", "(7, 270)"),
        with_reply(record_row<ims_vt_get_zoom, kZoomQuery>(kVt, "ims_vt_get_zoom", "GetZoom",
                                                           "(ii)", "(7, 1)"),
                   "(ii)", "(0, 40)", is_pointer_to_forty),
        record_row<ims_vt_set_zoom, kZoom>(kVt, "ims_vt_set_zoom", "SetZoom", "(iii)",
                                           "(7, 1, 40)"),
        session_row<ims_vt_hold_video>("ims_vt_hold_video", "HoldVideo"),
        session_row<ims_vt_resume_video>("ims_vt_resume_video", "ResumeVideo"),
    };
}

std::vector<RequestRow> file_rows() {
    return {
        text_row<ims_vt_capture_surface_image, kCapture, &ims_vt_capture_s::text_1>(
            "ims_vt_capture_surface_image", "CaptureSurfaceImage", "(iis)",
            "(7, 2, '/tmp/picture.png')"),
        text_row<ims_vt_start_record_video, kStart, &ims_vt_record_start_s::text_1>(
            "ims_vt_start_record_video", "StartRecordVideo", "(iiisi)",
            "(7, 2, 3, '/tmp/video.mp4', 4)"),
        record_row<ims_vt_pause_record_video, kRecord>(kVt, "ims_vt_pause_record_video",
                                                       "PauseRecordVideo", "(ii)", "(7, 2)"),
        record_row<ims_vt_resume_record_video, kRecord>(kVt, "ims_vt_resume_record_video",
                                                        "ResumeRecordVideo", "(ii)", "(7, 2)"),
        record_row<ims_vt_cancel_record_video, kRecord>(kVt, "ims_vt_cancel_record_video",
                                                        "CancelRecordVideo", "(ii)", "(7, 2)"),
        record_row<ims_vt_stop_record_video, kRecord>(kVt, "ims_vt_stop_record_video",
                                                      "StopRecordVideo", "(ii)", "(7, 2)"),
        text_row<ims_vt_start_file_cast, kCast, &ims_vt_file_cast_s::text_1>(
            "ims_vt_start_file_cast", "StartFileCast", "(is)", "(7, '/tmp/film.mp4')"),
        session_row<ims_vt_stop_file_cast>("ims_vt_stop_file_cast", "StopFileCast"),
    };
}

std::vector<RequestRow> drawing_rows() {
    return {
        session_row<ims_vt_swap_video_surface>("ims_vt_swap_video_surface", "SwapVideoSurface"),
        // The record is not checked: callers never pass NULL.
        unchecked_record_row<ims_vt_swipe_video, kSwipe>(kVt, "ims_vt_swipe_video", "SwipeVideo",
                                                         "(iiiiii)", "(7, 1, -2, 3, -4, 5)"),
        record_row<ims_vt_set_near_end_surface, kSurface>(kVt, "ims_vt_set_near_end_surface",
                                                          "SetNearEndSurface", "(iiv)",
                                                          "(7, 3, <[3, -5, 2147483647]>)"),
        record_row<ims_vt_set_far_end_surface, kSurface>(kVt, "ims_vt_set_far_end_surface",
                                                         "SetFarEndSurface", "(iiv)",
                                                         "(7, 3, <[3, -5, 2147483647]>)"),
        session_row<ims_vt_set_active_session_id>("ims_vt_set_active_session_id",
                                                  "SetActiveSessionId"),
        record_row<ims_vt_re_use_pix_map_id, kReUse>(kVt, "ims_vt_re_use_pix_map_id",
                                                     "ReUsePixMapId", "(iii)", "(7, 2, 3)"),
        record_row<ims_vt_release_pix_map_id, kPixMap>(kVt, "ims_vt_release_pix_map_id",
                                                       "ReleasePixMapId", "(ii)", "(7, 2)"),
        record_row<ims_vt_set_window_id, kWindow>(kVt, "ims_vt_set_window_id", "SetWindowId",
                                                  "(iiiiii)", "(7, 1, -2, 3, -4, 5)"),
        text_row<ims_vt_set_camera_buffer, kBuffer, &ims_vt_buffer_s::text_1>(
            "ims_vt_set_camera_buffer", "SetCameraBuffer", "(is)", "(7, 'buffer')"),
        text_row<ims_vt_set_media_buffer, kBuffer, &ims_vt_buffer_s::text_1>(
            "ims_vt_set_media_buffer", "SetMediaBuffer", "(is)", "(7, 'buffer')"),
    };
}

// All but one share a handler, whose name stands in the line of a refusal.
void name_handler(RequestRow &row) {
    row.handler =
        row.method == "GetZoom" ? "on_response_vt_get_zoom" : "on_response_common_response";
}

} // namespace

std::vector<RequestRow> vt_request_rows() {
    std::vector<RequestRow> rows = camera_rows();
    for (std::vector<RequestRow> more : {file_rows(), drawing_rows()})
        rows.insert(rows.end(), more.begin(), more.end());
    for (RequestRow &row : rows)
        name_handler(row);
    return rows;
}

} // namespace test
