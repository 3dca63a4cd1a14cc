// SPDX-License-Identifier: Apache-2.0
// The near end's picture: camera, preview, zoom, orientation.
#include "sim/vt/model.hpp"

namespace sim {

namespace {

std::optional<Refusal> no_such_camera(Camera camera) {
    if (camera == Camera::kFront || camera == Camera::kBack)
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "a camera is 0 (front) or 1 (back), not {}", camera);
}

} // namespace

Answer<Video *> VideoTelephony::filmed(int slot, int id) {
    auto found = video(slot, id);
    if (found && !(*found)->camera)
        return refuse(Result::kWrongState, "no camera is on for call {}: start one first", id);
    return found;
}

Status VideoTelephony::start_camera(int slot, int id, Camera camera) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = no_such_camera(camera))
        return *refused;
    if ((*found)->camera)
        return refuse(Result::kWrongState, "camera {} is on already: stop or switch it",
                      *(*found)->camera);
    (*found)->camera = camera;
    return Done{};
}

Status VideoTelephony::stop_camera(int slot, int id) {
    const auto found = filmed(slot, id);
    if (!found)
        return found.refusal();
    (*found)->camera.reset();
    (*found)->shown_instead.reset();
    return Done{};
}

Status VideoTelephony::switch_camera(int slot, int id) {
    const auto found = filmed(slot, id);
    if (!found)
        return found.refusal();
    (*found)->camera = *(*found)->camera == Camera::kFront ? Camera::kBack : Camera::kFront;
    return Done{};
}

Status VideoTelephony::hide_me(int slot, int id, const std::string &picture) {
    const auto found = filmed(slot, id);
    if (!found)
        return found.refusal();
    if ((*found)->shown_instead)
        return refuse(Result::kWrongState, "the user is hidden already");
    (*found)->shown_instead = picture;
    return Done{};
}

Status VideoTelephony::show_me(int slot, int id) {
    const auto found = filmed(slot, id);
    if (!found)
        return found.refusal();
    if (!(*found)->shown_instead)
        return refuse(Result::kWrongState, "the user is not hidden");
    (*found)->shown_instead.reset();
    return Done{};
}

Status VideoTelephony::set_orientation(int slot, int id, std::int32_t degrees) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (degrees < 0 || degrees > 270 || degrees % 90 != 0)
        return refuse(Result::kInvalidArgument, "an orientation is 0, 90, 180 or 270, not {}",
                      degrees);
    (*found)->orientation = degrees;
    return Done{};
}

Answer<Video *> VideoTelephony::zoomable(int slot, int id, Camera camera) {
    auto found = filmed(slot, id);
    if (!found)
        return found;
    if (auto refused = no_such_camera(camera))
        return *refused;
    if (*(*found)->camera != camera)
        return refuse(Result::kWrongState, "camera {} is off: camera {} is on", camera,
                      *(*found)->camera);
    return found;
}

Answer<std::int32_t> VideoTelephony::zoom(int slot, int id, Camera camera) {
    const auto found = zoomable(slot, id, camera);
    if (!found)
        return found.refusal();
    return (*found)->zoom[static_cast<std::size_t>(camera)];
}

Status VideoTelephony::set_zoom(int slot, int id, Camera camera, std::int32_t zoom) {
    const auto found = zoomable(slot, id, camera);
    if (!found)
        return found.refusal();
    if (zoom < 0 || zoom > kMaxZoom)
        return refuse(Result::kInvalidArgument, "a zoom is 0 to {}, not {}", kMaxZoom, zoom);
    (*found)->zoom[static_cast<std::size_t>(camera)] = zoom;
    return Done{};
}

} // namespace sim
