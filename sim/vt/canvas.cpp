// SPDX-License-Identifier: Apache-2.0
// What the video is drawn on: surfaces of pixmaps, windows, buffers.
#include "sim/vt/model.hpp"

#include <algorithm>
#include <set>

namespace sim {

namespace {

std::optional<Refusal> bad_pixmaps(std::int32_t count, const VideoTelephony::Ids &pixmaps) {
    if (!pixmaps)
        return refuse(Result::kInvalidArgument, "a surface is a variant that holds \"ai\"");
    if (count < 0 || pixmaps->size() != static_cast<std::size_t>(count))
        return refuse(Result::kInvalidArgument, "the count is {}, and {} pixmaps came", count,
                      pixmaps->size());
    if (std::ranges::any_of(*pixmaps, [](std::int32_t id) { return id <= 0; }))
        return refuse(Result::kInvalidArgument, "a pixmap is a positive number");
    if (std::set<std::int32_t>(pixmaps->begin(), pixmaps->end()).size() != pixmaps->size())
        return refuse(Result::kInvalidArgument, "a pixmap comes twice");
    return std::nullopt;
}

Refusal no_such_pixmap(std::int32_t pixmap) {
    return refuse(Result::kInvalidArgument, "no surface has a pixmap {}", pixmap);
}

} // namespace

Status VideoTelephony::set_surface(int slot, int id, VideoEnd end, std::int32_t count,
                                   const Ids &pixmaps) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = bad_pixmaps(count, pixmaps))
        return *refused;
    (*found)->canvas(end).pixmaps = *pixmaps;
    return Done{};
}

Status VideoTelephony::re_use_pixmap(int slot, int id, VideoEnd end, std::int32_t pixmap) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = no_such_end(end))
        return *refused;
    const auto &pixmaps = (*found)->canvas(end).pixmaps;
    if (std::ranges::find(pixmaps, pixmap) == pixmaps.end())
        return no_such_pixmap(pixmap);
    return Done{};
}

Status VideoTelephony::release_pixmap(int slot, int id, std::int32_t pixmap) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    std::size_t released = 0;
    for (Canvas &canvas : (*found)->canvases)
        released += std::erase(canvas.pixmaps, pixmap);
    if (released == 0)
        return no_such_pixmap(pixmap);
    return Done{};
}

Status VideoTelephony::set_window(int slot, int id, const VideoWindow &window) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = no_such_end(window.end))
        return *refused;
    if (window.window < 0)
        return refuse(Result::kInvalidArgument, "a window is a positive number, or 0 for none");
    if (window.window > 0 && (window.width <= 0 || window.height <= 0))
        return refuse(Result::kInvalidArgument, "a window of {} by {} shows nothing", window.width,
                      window.height);
    (*found)->canvas(window.end).window = window.window;
    return Done{};
}

Status VideoTelephony::swap_ends(int slot, int id) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (!std::ranges::all_of((*found)->canvases, &Canvas::exists))
        return refuse(Result::kWrongState, "an end has neither surface nor window: set both first");
    (*found)->swapped = !(*found)->swapped;
    return Done{};
}

Status VideoTelephony::swipe(int slot, int id, const Swipe &swipe) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (!std::ranges::any_of((*found)->canvases, &Canvas::exists))
        return refuse(Result::kWrongState, "neither end has a surface or window");
    if (std::min({swipe.from_x, swipe.from_y, swipe.to_x, swipe.to_y}) < 0)
        return refuse(Result::kInvalidArgument, "coordinates count from 0");
    if (swipe.milliseconds < 0)
        return refuse(Result::kInvalidArgument, "a swipe lasts 0 or more milliseconds, not {}",
                      swipe.milliseconds);
    return Done{};
}

Status VideoTelephony::set_camera_buffer(int slot, int id, const std::string &name) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    (*found)->camera_buffer = name;
    return Done{};
}

Status VideoTelephony::set_media_buffer(int slot, int id, const std::string &name) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    (*found)->media_buffer = name;
    return Done{};
}

} // namespace sim
