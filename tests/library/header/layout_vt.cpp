// SPDX-License-Identifier: Apache-2.0
// Where each field of the video telephony records is on a machine with 64-bit pointers. A change
// here is a change of the binary interface.
#include "ims.h"

#include <cstddef>

static_assert(sizeof(ims_vt_camera_s) == 8);
static_assert(offsetof(ims_vt_camera_s, session_id) == 0);
static_assert(offsetof(ims_vt_camera_s, value_1) == 4);

static_assert(sizeof(ims_vt_hide_me_s) == 16);
static_assert(offsetof(ims_vt_hide_me_s, session_id) == 0);
static_assert(offsetof(ims_vt_hide_me_s, text_1) == 8);

static_assert(sizeof(ims_vt_orientation_s) == 8);
static_assert(offsetof(ims_vt_orientation_s, session_id) == 0);
static_assert(offsetof(ims_vt_orientation_s, value_1) == 4);

static_assert(sizeof(ims_vt_zoom_query_s) == 8);
static_assert(offsetof(ims_vt_zoom_query_s, session_id) == 0);
static_assert(offsetof(ims_vt_zoom_query_s, value_1) == 4);

static_assert(sizeof(ims_vt_zoom_s) == 12);
static_assert(offsetof(ims_vt_zoom_s, session_id) == 0);
static_assert(offsetof(ims_vt_zoom_s, value_1) == 4);
static_assert(offsetof(ims_vt_zoom_s, value_2) == 8);

static_assert(sizeof(ims_vt_capture_s) == 16);
static_assert(offsetof(ims_vt_capture_s, session_id) == 0);
static_assert(offsetof(ims_vt_capture_s, value_1) == 4);
static_assert(offsetof(ims_vt_capture_s, text_1) == 8);

static_assert(sizeof(ims_vt_record_start_s) == 32);
static_assert(offsetof(ims_vt_record_start_s, session_id) == 0);
static_assert(offsetof(ims_vt_record_start_s, value_1) == 4);
static_assert(offsetof(ims_vt_record_start_s, value_2) == 8);
static_assert(offsetof(ims_vt_record_start_s, text_1) == 16);
static_assert(offsetof(ims_vt_record_start_s, value_3) == 24);

static_assert(sizeof(ims_vt_record_s) == 8);
static_assert(offsetof(ims_vt_record_s, session_id) == 0);
static_assert(offsetof(ims_vt_record_s, value_1) == 4);

static_assert(sizeof(ims_vt_file_cast_s) == 16);
static_assert(offsetof(ims_vt_file_cast_s, session_id) == 0);
static_assert(offsetof(ims_vt_file_cast_s, text_1) == 8);

static_assert(sizeof(ims_vt_swipe_s) == 24);
static_assert(offsetof(ims_vt_swipe_s, session_id) == 0);
static_assert(offsetof(ims_vt_swipe_s, value_1) == 4);
static_assert(offsetof(ims_vt_swipe_s, value_2) == 8);
static_assert(offsetof(ims_vt_swipe_s, value_3) == 12);
static_assert(offsetof(ims_vt_swipe_s, value_4) == 16);
static_assert(offsetof(ims_vt_swipe_s, value_5) == 20);

static_assert(sizeof(ims_vt_surface_s) == 16);
static_assert(offsetof(ims_vt_surface_s, session_id) == 0);
static_assert(offsetof(ims_vt_surface_s, count) == 4);
static_assert(offsetof(ims_vt_surface_s, entries) == 8);

static_assert(sizeof(ims_vt_pix_map_re_use_s) == 12);
static_assert(offsetof(ims_vt_pix_map_re_use_s, session_id) == 0);
static_assert(offsetof(ims_vt_pix_map_re_use_s, value_1) == 4);
static_assert(offsetof(ims_vt_pix_map_re_use_s, value_2) == 8);

static_assert(sizeof(ims_vt_pix_map_s) == 8);
static_assert(offsetof(ims_vt_pix_map_s, session_id) == 0);
static_assert(offsetof(ims_vt_pix_map_s, value_1) == 4);

static_assert(sizeof(ims_vt_window_s) == 24);
static_assert(offsetof(ims_vt_window_s, session_id) == 0);
static_assert(offsetof(ims_vt_window_s, value_1) == 4);
static_assert(offsetof(ims_vt_window_s, value_2) == 8);
static_assert(offsetof(ims_vt_window_s, value_3) == 12);
static_assert(offsetof(ims_vt_window_s, value_4) == 16);
static_assert(offsetof(ims_vt_window_s, value_5) == 20);

static_assert(sizeof(ims_vt_buffer_s) == 16);
static_assert(offsetof(ims_vt_buffer_s, session_id) == 0);
static_assert(offsetof(ims_vt_buffer_s, text_1) == 8);
