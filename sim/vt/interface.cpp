// SPDX-License-Identifier: Apache-2.0
#include "sim/vt/interface.hpp"

#include "sim/bus/ask.hpp"

namespace sim {

namespace {

using Vt = VideoTelephony;
using enum Caller;

template <VideoEnd kEnd>
Status set_surface(Vt &video, int slot, std::int32_t session, std::int32_t count,
                   const wire::Numbers &pixmaps) {
    return video.set_surface(slot, session, kEnd, count, pixmaps);
}

// No request carries an application id: the connection tells.
constexpr MethodRow<Vt> kMethods[] = {
    {"StartCamera", ask<&Vt::start_camera>, kConnection},
    {"StopCamera", ask<&Vt::stop_camera>, kConnection},
    {"HideMe", ask<&Vt::hide_me>, kConnection},
    {"ShowMe", ask<&Vt::show_me>, kConnection},
    {"SwitchCamera", ask<&Vt::switch_camera>, kConnection},
    {"SetVideoOrientation", ask<&Vt::set_orientation>, kConnection},
    {"GetZoom", ask<&Vt::zoom>, kConnection},
    {"SetZoom", ask<&Vt::set_zoom>, kConnection},
    {"HoldVideo", ask<&Vt::hold>, kConnection},
    {"ResumeVideo", ask<&Vt::resume>, kConnection},
    {"CaptureSurfaceImage", ask<&Vt::capture>, kConnection},
    {"StartRecordVideo", ask<&Vt::start_recording>, kConnection},
    {"PauseRecordVideo", ask<&Vt::pause_recording>, kConnection},
    {"ResumeRecordVideo", ask<&Vt::resume_recording>, kConnection},
    // There is no file that would be kept or thrown away.
    {"CancelRecordVideo", ask<&Vt::end_recording>, kConnection},
    {"StopRecordVideo", ask<&Vt::end_recording>, kConnection},
    {"StartFileCast", ask<&Vt::start_cast>, kConnection},
    {"StopFileCast", ask<&Vt::stop_cast>, kConnection},
    {"SwapVideoSurface", ask<&Vt::swap_ends>, kConnection},
    {"SwipeVideo", ask<&Vt::swipe>, kConnection},
    {"SetNearEndSurface", ask<&set_surface<VideoEnd::kNear>>, kConnection},
    {"SetFarEndSurface", ask<&set_surface<VideoEnd::kFar>>, kConnection},
    {"SetActiveSessionId", ask<&Vt::set_active>, kConnection},
    {"ReUsePixMapId", ask<&Vt::re_use_pixmap>, kConnection},
    {"ReleasePixMapId", ask<&Vt::release_pixmap>, kConnection},
    {"SetWindowId", ask<&Vt::set_window>, kConnection},
    {"SetCameraBuffer", ask<&Vt::set_camera_buffer>, kConnection},
    {"SetMediaBuffer", ask<&Vt::set_media_buffer>, kConnection},
};

} // namespace

Interface VtInterface::describe() {
    return {kName, bind_methods(kMethods, video_), {}};
}

} // namespace sim
