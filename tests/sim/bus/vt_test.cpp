// SPDX-License-Identifier: Apache-2.0
// A video call as an application steers it.
#include "tests/sim/bus/bus_client.hpp"

namespace sim::test {
namespace {

using testing::HasSubstr;

class BusVideo : public Served {
  protected:
    BusVideo() {
        client_->register_application(0);
        EXPECT_EQ(client_->call(0, kCall, "MakeCall", "(1, '+15550199', 1, '', '', '', '')").body,
                  "(0, 1)");
        client_->wait_for(0, "CallEstablished");
    }

    std::string ask(const char *method, const std::string &arguments) {
        const auto reply = client_->call(0, kVt, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
};

TEST_F(BusVideo, FromTheCameraToTheRecording) {
    EXPECT_EQ(ask("GetZoom", "(1, 0)"), "(13, 0)");
    EXPECT_EQ(ask("StartCamera", "(1, 0)"), "(0,)");
    EXPECT_EQ(ask("SetZoom", "(1, 0, 4)"), "(0,)");
    EXPECT_EQ(ask("GetZoom", "(1, 0)"), "(0, 4)");
    EXPECT_EQ(ask("SwitchCamera", "(1,)"), "(0,)");
    EXPECT_EQ(ask("GetZoom", "(1, 1)"), "(0, 0)");
    EXPECT_EQ(ask("HideMe", "(1, '/tmp/me.png')"), "(0,)");
    EXPECT_EQ(ask("ShowMe", "(1,)"), "(0,)");
    EXPECT_EQ(ask("SetVideoOrientation", "(1, 90)"), "(0,)");
    EXPECT_EQ(ask("HoldVideo", "(1,)"), "(0,)");
    EXPECT_EQ(ask("ResumeVideo", "(1,)"), "(0,)");
    EXPECT_EQ(ask("CaptureSurfaceImage", "(1, 1, '/tmp/picture.png')"), "(0,)");
    EXPECT_EQ(ask("PauseRecordVideo", "(1, 1)"), "(13,)");
    EXPECT_EQ(ask("StartRecordVideo", "(1, 1, 1, '/tmp/video.mp4', 60)"), "(0,)");
    EXPECT_EQ(ask("PauseRecordVideo", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("ResumeRecordVideo", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("StopRecordVideo", "(1, 1)"), "(0,)");
    EXPECT_EQ(ask("CancelRecordVideo", "(1, 1)"), "(13,)");
    EXPECT_EQ(ask("StartFileCast", "(1, '/tmp/film.mp4')"), "(0,)");
    EXPECT_EQ(ask("StopFileCast", "(1,)"), "(0,)");
    EXPECT_EQ(ask("StopCamera", "(1,)"), "(0,)");
}

TEST_F(BusVideo, WhatItIsDrawnOn) {
    EXPECT_EQ(ask("SetNearEndSurface", "(1, 2, <[4, 5]>)"), "(0,)");
    EXPECT_EQ(ask("SetFarEndSurface", "(1, 1, <[6]>)"), "(0,)");
    EXPECT_EQ(ask("SetFarEndSurface", "(1, 0, <@ai []>)"), "(0,)");
    EXPECT_EQ(ask("SetWindowId", "(1, 1, 9, 640, 480, 0)"), "(0,)");
    EXPECT_EQ(ask("SwapVideoSurface", "(1,)"), "(0,)");
    EXPECT_EQ(ask("SwipeVideo", "(1, 0, 0, 10, 10, 300)"), "(0,)");
    EXPECT_EQ(ask("ReUsePixMapId", "(1, 0, 4)"), "(0,)");
    EXPECT_EQ(ask("ReUsePixMapId", "(1, 1, 4)"), "(10,)");
    EXPECT_EQ(ask("ReleasePixMapId", "(1, 4)"), "(0,)");
    EXPECT_EQ(ask("ReleasePixMapId", "(1, 4)"), "(10,)");
    EXPECT_EQ(ask("SetActiveSessionId", "(1,)"), "(0,)");
    EXPECT_EQ(ask("SetCameraBuffer", "(1, 'camera')"), "(0,)");
    EXPECT_EQ(ask("SetMediaBuffer", "(1, 'media')"), "(0,)");
}

TEST_F(BusVideo, ASurfaceOfAnythingElseIsRefused) {
    for (const char *list : {"<['4']>", "<[int64 4]>", "<4>", "<<[4]>>", "<@au [4]>", "<@av []>"}) {
        EXPECT_EQ(ask("SetNearEndSurface", "(1, 1, " + std::string(list) + ")"), "(10,)") << list;
        EXPECT_THAT(program_->read_errors("refused"), HasSubstr("a variant that holds \"ai\""));
    }
    EXPECT_EQ(ask("SetNearEndSurface", "(1, 2, <[4]>)"), "(10,)");
    EXPECT_THAT(program_->read_errors("refused"), HasSubstr("the count is 2, and 1 pixmaps came"));
}

TEST_F(BusVideo, GoesWithTheCall) {
    EXPECT_EQ(ask("StartCamera", "(1, 0)"), "(0,)");
    EXPECT_EQ(client_->call(0, kCall, "EndCall", "(1, 1, 0, 0)").body, "(0,)");
    EXPECT_EQ(ask("StopCamera", "(1,)"), "(12,)");
}

} // namespace
} // namespace sim::test
