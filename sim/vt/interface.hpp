// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/bus/service.hpp"
#include "sim/vt/model.hpp"

namespace sim {

// org.kelvo.ims.Vt
class VtInterface {
  public:
    explicit VtInterface(VideoTelephony &video) : video_(video) {}

    static constexpr std::string_view kName = "org.kelvo.ims.Vt";
    Interface describe();

  private:
    using Outcome = Answer<Variant>;

    Outcome start_camera(const Request &request);
    Outcome stop_camera(const Request &request);
    Outcome hide_me(const Request &request);
    Outcome show_me(const Request &request);
    Outcome switch_camera(const Request &request);
    Outcome set_video_orientation(const Request &request);
    Outcome get_zoom(const Request &request);
    Outcome set_zoom(const Request &request);
    Outcome hold_video(const Request &request);
    Outcome resume_video(const Request &request);
    Outcome capture_surface_image(const Request &request);
    Outcome start_record_video(const Request &request);
    Outcome pause_record_video(const Request &request);
    Outcome resume_record_video(const Request &request);
    Outcome end_record_video(const Request &request);
    Outcome start_file_cast(const Request &request);
    Outcome stop_file_cast(const Request &request);
    Outcome swap_video_surface(const Request &request);
    Outcome swipe_video(const Request &request);
    Outcome set_near_end_surface(const Request &request);
    Outcome set_far_end_surface(const Request &request);
    Outcome set_active_session_id(const Request &request);
    Outcome re_use_pix_map_id(const Request &request);
    Outcome release_pix_map_id(const Request &request);
    Outcome set_window_id(const Request &request);
    Outcome set_camera_buffer(const Request &request);
    Outcome set_media_buffer(const Request &request);

    static const MethodRow<VtInterface> kMethods[];

    VideoTelephony &video_;
};

} // namespace sim
