// SPDX-License-Identifier: Apache-2.0
// Video telephony: the picture of a video call.
#include "imsctl/line/requests.hpp"
#include "imsctl/vt/module.hpp"

namespace imsctl {
namespace {

constexpr std::int32_t kFrontCamera = 0;
constexpr NamedValue kCameras[] = {{"front", kFrontCamera}, {"back", 1}};
constexpr std::int32_t kFarEnd = 1;
constexpr NamedValue kVideoEnds[] = {{"near", 0}, {"far", kFarEnd}};
constexpr std::int32_t kMp4 = 1;
constexpr NamedValue kVideoFormats[] = {{"3gp", 0}, {"mp4", kMp4}};

// What a verb about a video call does: `record` makes the request's record for the session.
template <class Record, class Make>
Action about(const SessionChoice &session,
             int (*request)(ims_h, const Record *, ims_response_cb, void *), Make record,
             const Decode &decode = nullptr) {
    return [=](Invocation &run) {
        const std::int32_t id = session.resolve(run.client());
        const Record info = record(id);
        run.request(session_id_field(id), with_record(request, info), decode);
    };
}

template <NumberRequest Request>
Action prepare_session_only(Arguments &arguments) {
    return on_session(arguments, kVideoCall, Request);
}

SessionChoice session_option(Arguments &arguments) {
    return arguments.session_option(kVideoCall);
}

Argument<std::int32_t> camera_option(Arguments &arguments) {
    return arguments.choice("--camera", "which camera (default front)", kCameras, kFrontCamera);
}

Argument<std::int32_t> end_option(Arguments &arguments) {
    return arguments.choice("--end", "whose video (default far)", kVideoEnds, kFarEnd);
}

Action prepare_start_camera(Arguments &arguments) {
    const auto camera = camera_option(arguments);
    return about(session_option(arguments), ims_vt_start_camera, [=](std::int32_t id) {
        return ims_vt_camera_s{id, *camera};
    });
}

Action prepare_hide(Arguments &arguments) {
    const auto picture =
        arguments.text_or("--picture", "what is shown instead (default nothing)", "");
    return about(session_option(arguments), ims_vt_hide_me, [=](std::int32_t id) {
        return ims_vt_hide_me_s{id, picture->c_str()};
    });
}

Action prepare_orientation(Arguments &arguments) {
    const auto degrees = arguments.number("DEGREES", "0, 90, 180 or 270");
    return about(session_option(arguments), ims_vt_set_video_orientation, [=](std::int32_t id) {
        return ims_vt_orientation_s{id, *degrees};
    });
}

Action prepare_get_zoom(Arguments &arguments) {
    const auto camera = camera_option(arguments);
    return about(
        session_option(arguments), ims_vt_get_zoom,
        [=](std::int32_t id) {
            return ims_vt_zoom_query_s{id, *camera};
        },
        number_as("zoom"));
}

Action prepare_set_zoom(Arguments &arguments) {
    const auto zoom = arguments.number("ZOOM", "from 0 to what the camera can do");
    const auto camera = camera_option(arguments);
    return about(session_option(arguments), ims_vt_set_zoom, [=](std::int32_t id) {
        return ims_vt_zoom_s{id, *camera, *zoom};
    });
}

Action prepare_capture(Arguments &arguments) {
    const auto file = arguments.text("FILE", "where to, as the service understands it");
    const auto end = end_option(arguments);
    return about(session_option(arguments), ims_vt_capture_surface_image, [=](std::int32_t id) {
        return ims_vt_capture_s{id, *end, file->c_str()};
    });
}

Action prepare_start_record(Arguments &arguments) {
    const auto file = arguments.text("FILE", "where to, as the service understands it");
    const auto end = end_option(arguments);
    const auto format =
        arguments.choice("--format", "the file's format (default mp4)", kVideoFormats, kMp4);
    const auto limit = arguments.number("--limit", "seconds after which it ends (default none)", 0);
    return about(session_option(arguments), ims_vt_start_record_video, [=](std::int32_t id) {
        return ims_vt_record_start_s{id, *end, *format, file->c_str(), *limit};
    });
}

using RecordRequest = int (*)(ims_h, const ims_vt_record_s *, ims_response_cb, void *);

template <RecordRequest Request>
Action prepare_record(Arguments &arguments) {
    const auto end = end_option(arguments);
    return about(session_option(arguments), Request, [=](std::int32_t id) {
        return ims_vt_record_s{id, *end};
    });
}

Action prepare_start_cast(Arguments &arguments) {
    const auto file = arguments.text("FILE", "what to show, as the service understands it");
    return about(session_option(arguments), ims_vt_start_file_cast, [=](std::int32_t id) {
        return ims_vt_file_cast_s{id, file->c_str()};
    });
}

using SurfaceRequest = int (*)(ims_h, const ims_vt_surface_s *, ims_response_cb, void *);

template <SurfaceRequest Request>
Action prepare_surface(Arguments &arguments) {
    const auto pixmaps = arguments.some_numbers("PIXMAP", "what to draw on (default nothing)");
    return about(session_option(arguments), Request, [=](std::int32_t id) {
        return ims_vt_surface_s{id, static_cast<std::int32_t>(pixmaps->size()), pixmaps->data()};
    });
}

Action prepare_swipe(Arguments &arguments) {
    const auto from_x = arguments.number("FROM-X", "where it begins");
    const auto from_y = arguments.number("FROM-Y", "where it begins");
    const auto to_x = arguments.number("TO-X", "where it ends");
    const auto to_y = arguments.number("TO-Y", "where it ends");
    const auto duration = arguments.number("--duration", "milliseconds (default 0)", 0);
    return about(session_option(arguments), ims_vt_swipe_video, [=](std::int32_t id) {
        return ims_vt_swipe_s{id, *from_x, *from_y, *to_x, *to_y, *duration};
    });
}

Action prepare_re_use_pixmap(Arguments &arguments) {
    const auto pixmap = arguments.number("PIXMAP", "the pixmap");
    const auto end = end_option(arguments);
    return about(session_option(arguments), ims_vt_re_use_pix_map_id, [=](std::int32_t id) {
        return ims_vt_pix_map_re_use_s{id, *end, *pixmap};
    });
}

Action prepare_release_pixmap(Arguments &arguments) {
    const auto pixmap = arguments.number("PIXMAP", "the pixmap");
    return about(session_option(arguments), ims_vt_release_pix_map_id, [=](std::int32_t id) {
        return ims_vt_pix_map_s{id, *pixmap};
    });
}

Action prepare_window(Arguments &arguments) {
    const auto window = arguments.number("WINDOW", "the window, 0 for none");
    const auto end = end_option(arguments);
    const auto width = arguments.number("--width", "pixels (default 640)", 640);
    const auto height = arguments.number("--height", "pixels (default 480)", 480);
    const auto layer = arguments.number("--layer", "which is in front (default 0)", 0);
    return about(session_option(arguments), ims_vt_set_window_id, [=](std::int32_t id) {
        return ims_vt_window_s{id, *end, *window, *width, *height, *layer};
    });
}

using BufferRequest = int (*)(ims_h, const ims_vt_buffer_s *, ims_response_cb, void *);

template <BufferRequest Request>
Action prepare_buffer(Arguments &arguments) {
    const auto name = arguments.text_or("NAME", "the buffer's name (default none)", "");
    return about(session_option(arguments), Request, [=](std::int32_t id) {
        return ims_vt_buffer_s{id, name->c_str()};
    });
}

constexpr Verb kVtVerbs[] = {
    {"vt camera start", "start a camera", "vt camera start --camera back", prepare_start_camera},
    {"vt camera stop", "stop the camera", "vt camera stop",
     prepare_session_only<ims_vt_stop_camera>},
    {"vt camera switch", "switch to the other camera", "vt camera switch",
     prepare_session_only<ims_vt_switch_camera>},
    {"vt hide", "hide this side's user", "vt hide --picture away.png", prepare_hide},
    {"vt show", "show this side's user again", "vt show", prepare_session_only<ims_vt_show_me>},
    {"vt orientation", "turn the video", "vt orientation 90", prepare_orientation},
    {"vt zoom get", "show a camera's zoom", "vt zoom get", prepare_get_zoom},
    {"vt zoom set", "set a camera's zoom", "vt zoom set 3", prepare_set_zoom},
    {"vt hold", "hold the video; the call goes on", "vt hold",
     prepare_session_only<ims_vt_hold_video>},
    {"vt resume", "resume the video", "vt resume", prepare_session_only<ims_vt_resume_video>},
    {"vt capture", "take a picture", "vt capture picture.png", prepare_capture},
    {"vt record start", "start recording the video", "vt record start call.mp4",
     prepare_start_record},
    {"vt record pause", "pause the recording", "vt record pause",
     prepare_record<ims_vt_pause_record_video>},
    {"vt record resume", "resume the recording", "vt record resume",
     prepare_record<ims_vt_resume_record_video>},
    {"vt record cancel", "end the recording and keep nothing", "vt record cancel",
     prepare_record<ims_vt_cancel_record_video>},
    {"vt record stop", "end the recording", "vt record stop",
     prepare_record<ims_vt_stop_record_video>},
    {"vt cast start", "show a file to the other party", "vt cast start film.mp4",
     prepare_start_cast},
    {"vt cast stop", "stop showing the file", "vt cast stop",
     prepare_session_only<ims_vt_stop_file_cast>},
    {"vt surface near", "draw this side's video on pixmaps", "vt surface near 4 5",
     prepare_surface<ims_vt_set_near_end_surface>},
    {"vt surface far", "draw the other side's video on pixmaps", "vt surface far 6 7",
     prepare_surface<ims_vt_set_far_end_surface>},
    {"vt surface swap", "let the two sides change places", "vt surface swap",
     prepare_session_only<ims_vt_swap_video_surface>},
    {"vt swipe", "swipe over the video", "vt swipe 0 0 100 50 --duration 300", prepare_swipe},
    {"vt active", "make a call's video the active one", "vt active 3",
     prepare_session_only<ims_vt_set_active_session_id>},
    {"vt pixmap re-use", "let a pixmap be drawn on again", "vt pixmap re-use 6",
     prepare_re_use_pixmap},
    {"vt pixmap release", "take a pixmap away", "vt pixmap release 6", prepare_release_pixmap},
    {"vt window", "draw in a window", "vt window 9 --width 640 --height 480", prepare_window},
    {"vt buffer camera", "name the camera's buffer", "vt buffer camera camera-0",
     prepare_buffer<ims_vt_set_camera_buffer>},
    {"vt buffer media", "name the media's buffer", "vt buffer media media-0",
     prepare_buffer<ims_vt_set_media_buffer>},
};

} // namespace

std::span<const Verb> vt_verbs() {
    return kVtVerbs;
}

} // namespace imsctl
