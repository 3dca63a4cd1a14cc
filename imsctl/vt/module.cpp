// SPDX-License-Identifier: Apache-2.0
#include "imsctl/vt/module.hpp"

namespace imsctl {
namespace {

constexpr VerbGroup kVtVerbGroups[] = {
    {"vt", "video telephony: the picture of a video call"},
    {"vt camera", "the camera"},
    {"vt zoom", "a camera's zoom"},
    {"vt record", "recording the video"},
    {"vt cast", "showing a file to the other party"},
    {"vt surface", "the pixmaps that the video is drawn on"},
    {"vt pixmap", "single pixmaps of a surface"},
    {"vt buffer", "the buffers that pictures go through"},
};

} // namespace

Module vt_module() {
    return {kVtVerbGroups, {vt_verbs()}, {}};
}

} // namespace imsctl
