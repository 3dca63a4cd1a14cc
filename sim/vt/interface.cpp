// SPDX-License-Identifier: Apache-2.0
#include "sim/vt/interface.hpp"

#include "sim/bus/replies.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

} // namespace

// No request carries an application id: the connection tells.
const MethodRow<VtInterface> VtInterface::kMethods[] = {
    {"StartCamera", "(ii)", "(i)", kConnection, &VtInterface::start_camera},
    {"StopCamera", "(i)", "(i)", kConnection, &VtInterface::stop_camera},
    {"HideMe", "(is)", "(i)", kConnection, &VtInterface::hide_me},
    {"ShowMe", "(i)", "(i)", kConnection, &VtInterface::show_me},
    {"SwitchCamera", "(i)", "(i)", kConnection, &VtInterface::switch_camera},
    {"SetVideoOrientation", "(ii)", "(i)", kConnection, &VtInterface::set_video_orientation},
    {"GetZoom", "(ii)", "(ii)", kConnection, &VtInterface::get_zoom},
    {"SetZoom", "(iii)", "(i)", kConnection, &VtInterface::set_zoom},
    {"HoldVideo", "(i)", "(i)", kConnection, &VtInterface::hold_video},
    {"ResumeVideo", "(i)", "(i)", kConnection, &VtInterface::resume_video},
    {"CaptureSurfaceImage", "(iis)", "(i)", kConnection, &VtInterface::capture_surface_image},
    {"StartRecordVideo", "(iiisi)", "(i)", kConnection, &VtInterface::start_record_video},
    {"PauseRecordVideo", "(ii)", "(i)", kConnection, &VtInterface::pause_record_video},
    {"ResumeRecordVideo", "(ii)", "(i)", kConnection, &VtInterface::resume_record_video},
    {"CancelRecordVideo", "(ii)", "(i)", kConnection, &VtInterface::end_record_video},
    {"StopRecordVideo", "(ii)", "(i)", kConnection, &VtInterface::end_record_video},
    {"StartFileCast", "(is)", "(i)", kConnection, &VtInterface::start_file_cast},
    {"StopFileCast", "(i)", "(i)", kConnection, &VtInterface::stop_file_cast},
    {"SwapVideoSurface", "(i)", "(i)", kConnection, &VtInterface::swap_video_surface},
    {"SwipeVideo", "(iiiiii)", "(i)", kConnection, &VtInterface::swipe_video},
    {"SetNearEndSurface", "(iiv)", "(i)", kConnection, &VtInterface::set_near_end_surface},
    {"SetFarEndSurface", "(iiv)", "(i)", kConnection, &VtInterface::set_far_end_surface},
    {"SetActiveSessionId", "(i)", "(i)", kConnection, &VtInterface::set_active_session_id},
    {"ReUsePixMapId", "(iii)", "(i)", kConnection, &VtInterface::re_use_pix_map_id},
    {"ReleasePixMapId", "(ii)", "(i)", kConnection, &VtInterface::release_pix_map_id},
    {"SetWindowId", "(iiiiii)", "(i)", kConnection, &VtInterface::set_window_id},
    {"SetCameraBuffer", "(is)", "(i)", kConnection, &VtInterface::set_camera_buffer},
    {"SetMediaBuffer", "(is)", "(i)", kConnection, &VtInterface::set_media_buffer},
};

Interface VtInterface::describe() {
    return {kName, bind_methods<VtInterface>(*this, kMethods), {}};
}

Answer<Variant> VtInterface::start_camera(const Request &request) {
    const auto [session, camera] = request.unpack<int32_t, int32_t>();
    return result_of(video_.start_camera(request.slot, session, Camera{camera}));
}

Answer<Variant> VtInterface::stop_camera(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.stop_camera(request.slot, session));
}

Answer<Variant> VtInterface::hide_me(const Request &request) {
    const auto [session, picture] = request.unpack<int32_t, string>();
    return result_of(video_.hide_me(request.slot, session, picture));
}

Answer<Variant> VtInterface::show_me(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.show_me(request.slot, session));
}

Answer<Variant> VtInterface::switch_camera(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.switch_camera(request.slot, session));
}

Answer<Variant> VtInterface::set_video_orientation(const Request &request) {
    const auto [session, degrees] = request.unpack<int32_t, int32_t>();
    return result_of(video_.set_orientation(request.slot, session, degrees));
}

Answer<Variant> VtInterface::get_zoom(const Request &request) {
    const auto [session, camera] = request.unpack<int32_t, int32_t>();
    return result_with(video_.zoom(request.slot, session, Camera{camera}));
}

Answer<Variant> VtInterface::set_zoom(const Request &request) {
    const auto [session, camera, zoom] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(video_.set_zoom(request.slot, session, Camera{camera}, zoom));
}

Answer<Variant> VtInterface::hold_video(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.hold(request.slot, session));
}

Answer<Variant> VtInterface::resume_video(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.resume(request.slot, session));
}

Answer<Variant> VtInterface::capture_surface_image(const Request &request) {
    const auto [session, end, path] = request.unpack<int32_t, int32_t, string>();
    return result_of(video_.capture(request.slot, session, VideoEnd{end}, path));
}

Answer<Variant> VtInterface::start_record_video(const Request &request) {
    const auto [session, end, format, path, limit] =
        request.unpack<int32_t, int32_t, int32_t, string, int32_t>();
    return result_of(video_.start_recording(request.slot, session,
                                            {VideoEnd{end}, VideoFormat{format}, path, limit}));
}

Answer<Variant> VtInterface::pause_record_video(const Request &request) {
    const auto [session, end] = request.unpack<int32_t, int32_t>();
    return result_of(video_.pause_recording(request.slot, session, VideoEnd{end}));
}

Answer<Variant> VtInterface::resume_record_video(const Request &request) {
    const auto [session, end] = request.unpack<int32_t, int32_t>();
    return result_of(video_.resume_recording(request.slot, session, VideoEnd{end}));
}

// There is no file that would be kept or thrown away.
Answer<Variant> VtInterface::end_record_video(const Request &request) {
    const auto [session, end] = request.unpack<int32_t, int32_t>();
    return result_of(video_.end_recording(request.slot, session, VideoEnd{end}));
}

Answer<Variant> VtInterface::start_file_cast(const Request &request) {
    const auto [session, path] = request.unpack<int32_t, string>();
    return result_of(video_.start_cast(request.slot, session, path));
}

Answer<Variant> VtInterface::stop_file_cast(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.stop_cast(request.slot, session));
}

Answer<Variant> VtInterface::swap_video_surface(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.swap(request.slot, session));
}

Answer<Variant> VtInterface::swipe_video(const Request &request) {
    const auto [session, from_x, from_y, to_x, to_y, milliseconds] =
        request.unpack<int32_t, int32_t, int32_t, int32_t, int32_t, int32_t>();
    return result_of(
        video_.swipe(request.slot, session, {from_x, from_y, to_x, to_y, milliseconds}));
}

Answer<Variant> VtInterface::set_near_end_surface(const Request &request) {
    const auto [session, count, pixmaps] = request.unpack<int32_t, int32_t, wire::Numbers>();
    return result_of(video_.set_surface(request.slot, session, VideoEnd::kNear, count, pixmaps));
}

Answer<Variant> VtInterface::set_far_end_surface(const Request &request) {
    const auto [session, count, pixmaps] = request.unpack<int32_t, int32_t, wire::Numbers>();
    return result_of(video_.set_surface(request.slot, session, VideoEnd::kFar, count, pixmaps));
}

Answer<Variant> VtInterface::set_active_session_id(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(video_.set_active(request.slot, session));
}

Answer<Variant> VtInterface::re_use_pix_map_id(const Request &request) {
    const auto [session, end, pixmap] = request.unpack<int32_t, int32_t, int32_t>();
    return result_of(video_.re_use_pixmap(request.slot, session, VideoEnd{end}, pixmap));
}

Answer<Variant> VtInterface::release_pix_map_id(const Request &request) {
    const auto [session, pixmap] = request.unpack<int32_t, int32_t>();
    return result_of(video_.release_pixmap(request.slot, session, pixmap));
}

Answer<Variant> VtInterface::set_window_id(const Request &request) {
    const auto [session, end, window, width, height, layer] =
        request.unpack<int32_t, int32_t, int32_t, int32_t, int32_t, int32_t>();
    return result_of(
        video_.set_window(request.slot, session, {VideoEnd{end}, window, width, height, layer}));
}

Answer<Variant> VtInterface::set_camera_buffer(const Request &request) {
    const auto [session, name] = request.unpack<int32_t, string>();
    return result_of(video_.set_camera_buffer(request.slot, session, name));
}

Answer<Variant> VtInterface::set_media_buffer(const Request &request) {
    const auto [session, name] = request.unpack<int32_t, string>();
    return result_of(video_.set_media_buffer(request.slot, session, name));
}

} // namespace sim
