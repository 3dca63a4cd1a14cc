// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/call/events.hpp"
#include "sim/call/model.hpp"

#include <array>
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace sim {

// The values that stand in the integers of org.kelvo.ims.Vt as the stand-in defines them.
enum class Camera : std::int32_t { kFront = 0, kBack = 1 };
enum class VideoEnd : std::int32_t { kNear = 0, kFar = 1 };
enum class VideoFormat : std::int32_t { k3gp = 0, kMp4 = 1 };

constexpr std::int32_t kMaxZoom = 10;

// What one end's video is drawn on: pixmaps or a window.
struct Canvas {
    std::vector<std::int32_t> pixmaps;
    std::int32_t window = 0; // 0 for none
    bool exists() const { return !pixmaps.empty() || window != 0; }
};

struct VideoRecording {
    std::string path;
    bool paused = false;
};

// The video engine's state for one call.
struct Video {
    std::optional<Camera> camera;
    std::array<std::int32_t, 2> zoom{};       // of each camera
    std::optional<std::string> shown_instead; // of the user: a picture, or nothing when empty
    std::int32_t orientation = 0;
    bool held = false;
    std::map<VideoEnd, VideoRecording> recordings;
    std::optional<std::string> cast;
    std::array<Canvas, 2> canvases;
    bool swapped = false;
    std::string camera_buffer;
    std::string media_buffer;

    Canvas &canvas(VideoEnd end) { return canvases[static_cast<std::size_t>(end)]; }
};

struct VideoFile {
    VideoEnd end = VideoEnd::kNear;
    VideoFormat format = VideoFormat::k3gp;
    std::string path;
    std::int32_t limit = 0;
};

struct VideoWindow {
    VideoEnd end = VideoEnd::kNear;
    std::int32_t window = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;
    std::int32_t layer = 0;
};

struct Swipe {
    std::int32_t from_x = 0;
    std::int32_t from_y = 0;
    std::int32_t to_x = 0;
    std::int32_t to_y = 0;
    std::int32_t milliseconds = 0;
};

// The device's video engine of all slots: what belongs to a video call while it is one. A request
// that makes no sense in the present state is refused and changes nothing.
class VideoTelephony {
  public:
    VideoTelephony(const CallModel &calls, int slots) : calls_(calls), slots_(slots) {}

    // A call that ends, or is a voice call from now on, loses its video.
    void hear(int slot, const CallEvent &event);

    // Camera and preview
    Status start_camera(int slot, int id, Camera camera);
    Status stop_camera(int slot, int id);
    Status switch_camera(int slot, int id);
    Status hide_me(int slot, int id, const std::string &picture);
    Status show_me(int slot, int id);
    Status set_orientation(int slot, int id, std::int32_t degrees);
    Answer<std::int32_t> zoom(int slot, int id, Camera camera);
    Status set_zoom(int slot, int id, Camera camera, std::int32_t zoom);

    // The stream, and files
    Status hold(int slot, int id);
    Status resume(int slot, int id);
    Status capture(int slot, int id, VideoEnd end, const std::string &path);
    Status start_recording(int slot, int id, const VideoFile &file);
    Status pause_recording(int slot, int id, VideoEnd end);
    Status resume_recording(int slot, int id, VideoEnd end);
    Status end_recording(int slot, int id, VideoEnd end);
    Status start_cast(int slot, int id, const std::string &path);
    Status stop_cast(int slot, int id);

    // What is drawn on. No ids at all: the array that came was none of numbers.
    using Ids = std::optional<std::vector<std::int32_t>>;
    Status set_surface(int slot, int id, VideoEnd end, std::int32_t count, const Ids &pixmaps);
    Status re_use_pixmap(int slot, int id, VideoEnd end, std::int32_t pixmap);
    Status release_pixmap(int slot, int id, std::int32_t pixmap);
    Status set_window(int slot, int id, const VideoWindow &window);
    Status swap_ends(int slot, int id);
    Status swipe(int slot, int id, const Swipe &swipe);
    Status set_active(int slot, int id);
    Status set_camera_buffer(int slot, int id, const std::string &name);
    Status set_media_buffer(int slot, int id, const std::string &name);

    // For whoever looks: the video of a call that has one, the call whose video is active or 0.
    const Video *find(int slot, int id) const;
    int active(int slot) const { return slots_[slot].active; }

  private:
    struct Slot {
        std::map<int, Video> videos;
        int active = 0;
    };
    void drop(int slot, int id);

    // What requests stand on: the video in the state that they need, or the refusal.
    Answer<Video *> video(int slot, int id);     // of a video call in any state
    Answer<Video *> streaming(int slot, int id); // of one that is established
    Answer<Video *> filmed(int slot, int id);    // with a camera on
    Answer<Video *> zoomable(int slot, int id, Camera camera);
    Answer<VideoRecording *> recording(int slot, int id, VideoEnd end);

    const CallModel &calls_;
    PerSlot<Slot> slots_;
};

// Why an integer names neither end, or nothing.
std::optional<Refusal> no_such_end(VideoEnd end);

} // namespace sim
