/*
 * SPDX-License-Identifier: Apache-2.0
 */
#ifndef KELVO_IMS_VT_H
#define KELVO_IMS_VT_H

/**
 * @file
 * @brief Video telephony: camera, preview, zoom, recording, casting, drawing surfaces.
 */

/**
 * @defgroup ims_vt Video telephony
 * @brief The picture of a video call: `org.kelvo.ims.Vt`.
 *
 * The service does the media work; the library only steers it.
 *
 * @section ims_vt_life The life of a picture
 *
 * All of it belongs to a session of @ref ims_call, and goes when the session ends. An application
 * starts a camera, says where the near end's and the far end's video is drawn (surfaces of pixmaps,
 * or windows), and then holds, hides, zooms, records or casts as its user wants. The callback of
 * each request says whether the service has done it; there are no events.
 *
 * @code{.c}
 * #include <ims.h>
 *
 * void on_started(ims_h handle, int result, void *data, void *user_data) {
 *     const int32_t *session = user_data; // must live until now
 *     const int32_t pixmaps[] = {101, 102};
 *     const ims_vt_surface_s surface = {.session_id = *session, .count = 2, .entries = pixmaps};
 *     if (result == 0)
 *         ims_vt_set_near_end_surface(handle, &surface, NULL, NULL);
 * }
 *
 * int show_me(ims_h handle, int32_t *session, int32_t which) {
 *     const ims_vt_camera_s camera = {.session_id = *session, .value_1 = which};
 *     return ims_vt_start_camera(handle, &camera, on_started, session);
 * }
 * @endcode
 *
 * What all requests share is said in @ref ims_requests and @ref ims_errors; values are the
 * service's, see @ref ims_values. Sent are the argument, or the record's fields in their order: no
 * method carries the application id. The reply is `(i)`, the result, and the callback's data is
 * NULL, unless something else is said.
 *
 * @{
 */

#include "ims_types.h"

#ifdef __cplusplus
extern "C" {
#endif

/**
 * @defgroup ims_vt_records Request records
 * @brief Owned by the caller, read during the call only; a NULL text is sent as an empty one.
 * @{
 */

/** A camera to start. */
typedef struct ims_vt_camera_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
} ims_vt_camera_s;

/** What is shown in the user's place. */
typedef struct ims_vt_hide_me_s {
    int32_t session_id; /**< the session */
    const char *text_1; /**< defined by the service */
} ims_vt_hide_me_s;

/** An orientation of the video. */
typedef struct ims_vt_orientation_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
} ims_vt_orientation_s;

/** Whose zoom to ask for. */
typedef struct ims_vt_zoom_query_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
} ims_vt_zoom_query_s;

/** A zoom to set. */
typedef struct ims_vt_zoom_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    int32_t value_2;    /**< defined by the service */
} ims_vt_zoom_s;

/** A picture to take. */
typedef struct ims_vt_capture_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    const char *text_1; /**< defined by the service */
} ims_vt_capture_s;

/** A recording to start. */
typedef struct ims_vt_record_start_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    int32_t value_2;    /**< defined by the service */
    const char *text_1; /**< defined by the service */
    int32_t value_3;    /**< defined by the service */
} ims_vt_record_start_s;

/** A recording to pause, resume, cancel or end. */
typedef struct ims_vt_record_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
} ims_vt_record_s;

/** A file to cast. */
typedef struct ims_vt_file_cast_s {
    int32_t session_id; /**< the session */
    const char *text_1; /**< defined by the service */
} ims_vt_file_cast_s;

/** A movement over the video. */
typedef struct ims_vt_swipe_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    int32_t value_2;    /**< defined by the service */
    int32_t value_3;    /**< defined by the service */
    int32_t value_4;    /**< defined by the service */
    int32_t value_5;    /**< defined by the service */
} ims_vt_swipe_s;

/** A surface to draw on. */
typedef struct ims_vt_surface_s {
    int32_t session_id;     /**< the session */
    int32_t count;          /**< how many entries; sent as stored, 0 and less send none */
    const int32_t *entries; /**< count identifiers, defined by the service; NULL sends none */
} ims_vt_surface_s;

/** A pixmap to be used again. */
typedef struct ims_vt_pix_map_re_use_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    int32_t value_2;    /**< defined by the service */
} ims_vt_pix_map_re_use_s;

/** A pixmap to release. */
typedef struct ims_vt_pix_map_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
} ims_vt_pix_map_s;

/** The windows to draw in. */
typedef struct ims_vt_window_s {
    int32_t session_id; /**< the session */
    int32_t value_1;    /**< defined by the service */
    int32_t value_2;    /**< defined by the service */
    int32_t value_3;    /**< defined by the service */
    int32_t value_4;    /**< defined by the service */
    int32_t value_5;    /**< defined by the service */
} ims_vt_window_s;

/** A buffer, by name. */
typedef struct ims_vt_buffer_s {
    int32_t session_id; /**< the session */
    const char *text_1; /**< defined by the service */
} ims_vt_buffer_s;

/** @} */

/**
 * @defgroup ims_vt_requests Requests
 * @brief To show, hide, draw, record and cast video.
 * @{
 */

/**
 * Starts a camera.
 *
 * D-Bus: `StartCamera`, sends `(ii)`.
 *
 * @param info  the session and which camera
 */
IMS_API int ims_vt_start_camera(ims_h handle, const ims_vt_camera_s *info, ims_response_cb callback,
                                void *user_data);

/**
 * Stops the camera.
 *
 * D-Bus: `StopCamera`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_stop_camera(ims_h handle, int32_t session_id, ims_response_cb callback,
                               void *user_data);

/**
 * Hides the user: the other party no longer sees the camera's picture.
 *
 * D-Bus: `HideMe`, sends `(is)`.
 *
 * @param info  the session and what is shown instead
 */
IMS_API int ims_vt_hide_me(ims_h handle, const ims_vt_hide_me_s *info, ims_response_cb callback,
                           void *user_data);

/**
 * Shows the user again, after ims_vt_hide_me().
 *
 * D-Bus: `ShowMe`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_show_me(ims_h handle, int32_t session_id, ims_response_cb callback,
                           void *user_data);

/**
 * Switches to the other camera.
 *
 * D-Bus: `SwitchCamera`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_switch_camera(ims_h handle, int32_t session_id, ims_response_cb callback,
                                 void *user_data);

/**
 * Sets the orientation of the video.
 *
 * D-Bus: `SetVideoOrientation`, sends `(ii)`.
 *
 * @param info  the session and the orientation
 */
IMS_API int ims_vt_set_video_orientation(ims_h handle, const ims_vt_orientation_s *info,
                                         ims_response_cb callback, void *user_data);

/**
 * Asks for the zoom.
 *
 * D-Bus: `GetZoom`, sends `(ii)`; expects `(ii)`: the callback's data is an `int32_t *`, the second
 * member, or NULL when the call failed.
 *
 * @param info  the session and what to ask for
 */
IMS_API int ims_vt_get_zoom(ims_h handle, const ims_vt_zoom_query_s *info, ims_response_cb callback,
                            void *user_data);

/**
 * Sets the zoom.
 *
 * D-Bus: `SetZoom`, sends `(iii)`.
 *
 * @param info  the session and the zoom
 */
IMS_API int ims_vt_set_zoom(ims_h handle, const ims_vt_zoom_s *info, ims_response_cb callback,
                            void *user_data);

/**
 * Holds the video stream.
 *
 * D-Bus: `HoldVideo`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_hold_video(ims_h handle, int32_t session_id, ims_response_cb callback,
                              void *user_data);

/**
 * Resumes the video stream, after ims_vt_hold_video().
 *
 * D-Bus: `ResumeVideo`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_resume_video(ims_h handle, int32_t session_id, ims_response_cb callback,
                                void *user_data);

/**
 * Takes a picture of a surface.
 *
 * D-Bus: `CaptureSurfaceImage`, sends `(iis)`.
 *
 * @param info  the session, the surface and the picture's file
 */
IMS_API int ims_vt_capture_surface_image(ims_h handle, const ims_vt_capture_s *info,
                                         ims_response_cb callback, void *user_data);

/**
 * Starts recording the video.
 *
 * D-Bus: `StartRecordVideo`, sends `(iiisi)`.
 *
 * @param info  the session, what to record and the file
 */
IMS_API int ims_vt_start_record_video(ims_h handle, const ims_vt_record_start_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * Pauses a recording.
 *
 * D-Bus: `PauseRecordVideo`, sends `(ii)`.
 *
 * @param info  the session and the recording
 */
IMS_API int ims_vt_pause_record_video(ims_h handle, const ims_vt_record_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * Resumes a recording, after ims_vt_pause_record_video().
 *
 * D-Bus: `ResumeRecordVideo`, sends `(ii)`.
 *
 * @param info  the session and the recording
 */
IMS_API int ims_vt_resume_record_video(ims_h handle, const ims_vt_record_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Cancels a recording.
 *
 * D-Bus: `CancelRecordVideo`, sends `(ii)`.
 *
 * @param info  the session and the recording
 */
IMS_API int ims_vt_cancel_record_video(ims_h handle, const ims_vt_record_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Ends a recording.
 *
 * D-Bus: `StopRecordVideo`, sends `(ii)`.
 *
 * @param info  the session and the recording
 */
IMS_API int ims_vt_stop_record_video(ims_h handle, const ims_vt_record_s *info,
                                     ims_response_cb callback, void *user_data);

/**
 * Casts a file into the call.
 *
 * D-Bus: `StartFileCast`, sends `(is)`.
 *
 * @param info  the session and the file
 */
IMS_API int ims_vt_start_file_cast(ims_h handle, const ims_vt_file_cast_s *info,
                                   ims_response_cb callback, void *user_data);

/**
 * Stops casting a file.
 *
 * D-Bus: `StopFileCast`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_stop_file_cast(ims_h handle, int32_t session_id, ims_response_cb callback,
                                  void *user_data);

/**
 * Swaps the two video surfaces.
 *
 * D-Bus: `SwapVideoSurface`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_swap_video_surface(ims_h handle, int32_t session_id, ims_response_cb callback,
                                      void *user_data);

/**
 * Swipes the video.
 *
 * D-Bus: `SwipeVideo`, sends `(iiiiii)`.
 *
 * @param info  the session and the movement. Not checked: must not be NULL
 */
IMS_API int ims_vt_swipe_video(ims_h handle, const ims_vt_swipe_s *info, ims_response_cb callback,
                               void *user_data);

/**
 * Sets the surface that the near end's video is drawn on.
 *
 * D-Bus: `SetNearEndSurface`, sends `(iiv)`: the session, the count, and a variant with an `ai` of
 * the entries.
 *
 * @param info  the surface
 */
IMS_API int ims_vt_set_near_end_surface(ims_h handle, const ims_vt_surface_s *info,
                                        ims_response_cb callback, void *user_data);

/**
 * Sets the surface that the far end's video is drawn on.
 *
 * D-Bus: `SetFarEndSurface`, sends `(iiv)`: the session, the count, and a variant with an `ai` of
 * the entries.
 *
 * @param info  the surface
 */
IMS_API int ims_vt_set_far_end_surface(ims_h handle, const ims_vt_surface_s *info,
                                       ims_response_cb callback, void *user_data);

/**
 * Names the session whose video is active.
 *
 * D-Bus: `SetActiveSessionId`, sends `(i)`.
 *
 * @param session_id  the session
 */
IMS_API int ims_vt_set_active_session_id(ims_h handle, int32_t session_id, ims_response_cb callback,
                                         void *user_data);

/**
 * Lets the service use a pixmap again.
 *
 * D-Bus: `ReUsePixMapId`, sends `(iii)`.
 *
 * @param info  the session and the pixmap
 */
IMS_API int ims_vt_re_use_pix_map_id(ims_h handle, const ims_vt_pix_map_re_use_s *info,
                                     ims_response_cb callback, void *user_data);

/**
 * Releases a pixmap.
 *
 * D-Bus: `ReleasePixMapId`, sends `(ii)`.
 *
 * @param info  the session and the pixmap
 */
IMS_API int ims_vt_release_pix_map_id(ims_h handle, const ims_vt_pix_map_s *info,
                                      ims_response_cb callback, void *user_data);

/**
 * Sets the windows that the video is drawn in.
 *
 * D-Bus: `SetWindowId`, sends `(iiiiii)`.
 *
 * @param info  the session and the windows
 */
IMS_API int ims_vt_set_window_id(ims_h handle, const ims_vt_window_s *info,
                                 ims_response_cb callback, void *user_data);

/**
 * Sets the buffer of the camera's pictures.
 *
 * D-Bus: `SetCameraBuffer`, sends `(is)`.
 *
 * @param info  the session and the buffer
 */
IMS_API int ims_vt_set_camera_buffer(ims_h handle, const ims_vt_buffer_s *info,
                                     ims_response_cb callback, void *user_data);

/**
 * Sets the buffer of the media.
 *
 * D-Bus: `SetMediaBuffer`, sends `(is)`.
 *
 * @param info  the session and the buffer
 */
IMS_API int ims_vt_set_media_buffer(ims_h handle, const ims_vt_buffer_s *info,
                                    ims_response_cb callback, void *user_data);

/** @} */

/** @} */

#ifdef __cplusplus
}
#endif

#endif
