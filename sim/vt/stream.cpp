// SPDX-License-Identifier: Apache-2.0
// The stream itself: hold, pictures, recordings, casting a file. State alone: there are no
// pictures, no file is read or written.
#include "sim/vt/model.hpp"

namespace sim {

namespace {

std::optional<Refusal> no_path(const std::string &path, std::string_view what) {
    if (!path.empty())
        return std::nullopt;
    return refuse(Result::kInvalidArgument, "{} needs the path of a file", what);
}

// Nobody sees the near end without a camera.
std::optional<Refusal> nothing_to_see(const Video &video, VideoEnd end) {
    if (auto refused = no_such_end(end))
        return refused;
    if (end == VideoEnd::kNear && !video.camera && !video.cast)
        return refuse(Result::kWrongState, "the near end shows nothing: start a camera first");
    return std::nullopt;
}

} // namespace

Status VideoTelephony::hold(int slot, int id) {
    const auto found = streaming(slot, id);
    if (!found)
        return found.refusal();
    if ((*found)->held)
        return refuse(Result::kWrongState, "the video of call {} is on hold already", id);
    (*found)->held = true;
    return Done{};
}

Status VideoTelephony::resume(int slot, int id) {
    const auto found = streaming(slot, id);
    if (!found)
        return found.refusal();
    if (!(*found)->held)
        return refuse(Result::kWrongState, "the video of call {} is not on hold", id);
    (*found)->held = false;
    return Done{};
}

Status VideoTelephony::capture(int slot, int id, VideoEnd end, const std::string &path) {
    const auto found = streaming(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = nothing_to_see(**found, end))
        return *refused;
    if (auto refused = no_path(path, "a picture"))
        return *refused;
    return Done{};
}

Status VideoTelephony::start_recording(int slot, int id, const VideoFile &file) {
    const auto found = streaming(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = nothing_to_see(**found, file.end))
        return *refused;
    if (file.format != VideoFormat::k3gp && file.format != VideoFormat::kMp4)
        return refuse(Result::kInvalidArgument, "a format is 0 (3GP) or 1 (MP4), not {}",
                      file.format);
    if (file.limit < 0)
        return refuse(Result::kInvalidArgument, "a limit is 0 (none) or seconds, not {}",
                      file.limit);
    if (auto refused = no_path(file.path, "a recording"))
        return *refused;
    const auto [entry, is_new] =
        (*found)->recordings.try_emplace(file.end, VideoRecording{file.path, false});
    if (!is_new)
        return refuse(Result::kWrongState, "end {} of call {} is recorded already, to {}", file.end,
                      id, entry->second.path);
    return Done{};
}

Answer<VideoRecording *> VideoTelephony::recording(int slot, int id, VideoEnd end) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = no_such_end(end))
        return *refused;
    const auto entry = (*found)->recordings.find(end);
    if (entry == (*found)->recordings.end())
        return refuse(Result::kWrongState, "end {} of call {} is not being recorded", end, id);
    return &entry->second;
}

Status VideoTelephony::pause_recording(int slot, int id, VideoEnd end) {
    const auto found = recording(slot, id, end);
    if (!found)
        return found.refusal();
    if ((*found)->paused)
        return refuse(Result::kWrongState, "the recording pauses already");
    (*found)->paused = true;
    return Done{};
}

Status VideoTelephony::resume_recording(int slot, int id, VideoEnd end) {
    const auto found = recording(slot, id, end);
    if (!found)
        return found.refusal();
    if (!(*found)->paused)
        return refuse(Result::kWrongState, "the recording does not pause");
    (*found)->paused = false;
    return Done{};
}

Status VideoTelephony::end_recording(int slot, int id, VideoEnd end) {
    if (const auto found = recording(slot, id, end); !found)
        return found.refusal();
    slots_[slot].videos.at(id).recordings.erase(end);
    return Done{};
}

Status VideoTelephony::start_cast(int slot, int id, const std::string &path) {
    const auto found = streaming(slot, id);
    if (!found)
        return found.refusal();
    if (auto refused = no_path(path, "a cast"))
        return *refused;
    if ((*found)->held)
        return refuse(Result::kWrongState, "the video of call {} is on hold", id);
    if ((*found)->cast)
        return refuse(Result::kWrongState, "{} is being cast: stop that first", *(*found)->cast);
    (*found)->cast = path;
    return Done{};
}

Status VideoTelephony::stop_cast(int slot, int id) {
    const auto found = video(slot, id);
    if (!found)
        return found.refusal();
    if (!(*found)->cast)
        return refuse(Result::kWrongState, "no file is being cast");
    (*found)->cast.reset();
    return Done{};
}

} // namespace sim
