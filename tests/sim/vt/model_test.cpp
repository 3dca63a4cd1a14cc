// SPDX-License-Identifier: Apache-2.0
// The video of a call: what goes when, and what makes no sense.
#include "tests/sim/network.hpp"

namespace sim::test {
namespace {

class VideoCall : public NetworkTest {
  protected:
    VideoCall() : id_(connect(0, 1, CallType::kVideo).caller) {}

    void refused(const Status &status, Result code, const std::string &reason) {
        expect_refused(status, code, reason);
    }
    void wrong_state(const Status &status, const std::string &reason) {
        expect_refused(status, Result::kWrongState, reason);
    }
    void bad_argument(const Status &status, const std::string &reason) {
        expect_refused(status, Result::kInvalidArgument, reason);
    }
    const Video &state() { return *video_.find(0, id_); }

    // Every request, with arguments that would do.
    std::vector<Status> every_request(int slot, int id) {
        const auto zoom = video_.zoom(slot, id, Camera::kFront);
        return {video_.start_camera(slot, id, Camera::kFront),
                video_.stop_camera(slot, id),
                video_.switch_camera(slot, id),
                video_.hide_me(slot, id, "/me.png"),
                video_.show_me(slot, id),
                video_.set_orientation(slot, id, 90),
                zoom ? Status(Done{}) : Status(zoom.refusal()),
                video_.set_zoom(slot, id, Camera::kFront, 1),
                video_.hold(slot, id),
                video_.resume(slot, id),
                video_.capture(slot, id, VideoEnd::kFar, "/p.png"),
                video_.start_recording(slot, id, {VideoEnd::kFar, VideoFormat::kMp4, "/v.mp4", 0}),
                video_.pause_recording(slot, id, VideoEnd::kFar),
                video_.resume_recording(slot, id, VideoEnd::kFar),
                video_.end_recording(slot, id, VideoEnd::kFar),
                video_.start_cast(slot, id, "/film.mp4"),
                video_.stop_cast(slot, id),
                video_.set_surface(slot, id, VideoEnd::kNear, 1, {{5}}),
                video_.re_use_pixmap(slot, id, VideoEnd::kNear, 5),
                video_.release_pixmap(slot, id, 5),
                video_.set_window(slot, id, {VideoEnd::kFar, 7, 640, 480, 0}),
                video_.swap_ends(slot, id),
                video_.swipe(slot, id, {0, 0, 10, 10, 100}),
                video_.set_active(slot, id),
                video_.set_camera_buffer(slot, id, "camera"),
                video_.set_media_buffer(slot, id, "media")};
    }

    int id_;
};

TEST_F(VideoCall, OnlyVideoCallsHaveVideo) {
    for (const Status &status : every_request(0, 9))
        refused(status, Result::kUnknownSession, "there is no call 9");
    const int voice = connect_party(2);
    for (const Status &status : every_request(2, voice))
        wrong_state(status, "no video call but of type 0");
    EXPECT_EQ(video_.find(2, voice), nullptr);
    EXPECT_EQ(video_.active(2), 0);
}

TEST_F(VideoCall, AnotherSlotsCallIsNotThisOnes) {
    refused(video_.start_camera(3, id_, Camera::kFront), Result::kUnknownSession, "no call");
}

TEST_F(VideoCall, PreparesItsPictureBeforeItIsAnswered) {
    const int id = dial(2, "+15550207", CallType::kVideo);
    expect_accepted(video_.start_camera(2, id, Camera::kFront));
    expect_accepted(video_.set_surface(2, id, VideoEnd::kNear, 2, {{4, 5}}));
    for (const Status &status :
         {video_.hold(2, id), video_.resume(2, id), video_.start_cast(2, id, "/f"),
          video_.capture(2, id, VideoEnd::kNear, "/p"),
          video_.start_recording(2, id, {VideoEnd::kNear, VideoFormat::k3gp, "/v", 0})})
        wrong_state(status, "not established yet");
}

TEST_F(VideoCall, TheCameraStartsSwitchesAndStopsOnce) {
    wrong_state(video_.stop_camera(0, id_), "start one first");
    wrong_state(video_.switch_camera(0, id_), "start one first");
    bad_argument(video_.start_camera(0, id_, Camera{2}), "not 2");
    bad_argument(video_.start_camera(0, id_, Camera{-1}), "not -1");
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    wrong_state(video_.start_camera(0, id_, Camera::kBack), "camera 0 is on already");
    expect_accepted(video_.switch_camera(0, id_));
    EXPECT_EQ(state().camera, Camera::kBack);
    expect_accepted(video_.switch_camera(0, id_));
    EXPECT_EQ(state().camera, Camera::kFront);
    expect_accepted(video_.stop_camera(0, id_));
    EXPECT_EQ(state().camera, std::nullopt);
}

TEST_F(VideoCall, TheUserHidesAndShowsAgain) {
    wrong_state(video_.hide_me(0, id_, "/me.png"), "start one first");
    wrong_state(video_.show_me(0, id_), "start one first");
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    wrong_state(video_.show_me(0, id_), "not hidden");
    expect_accepted(video_.hide_me(0, id_, ""));
    wrong_state(video_.hide_me(0, id_, "/me.png"), "hidden already");
    expect_accepted(video_.show_me(0, id_));
    expect_accepted(video_.hide_me(0, id_, "/me.png"));
    EXPECT_EQ(state().shown_instead, "/me.png");
    // A camera that starts anew shows the user.
    expect_accepted(video_.stop_camera(0, id_));
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    EXPECT_EQ(state().shown_instead, std::nullopt);
}

TEST_F(VideoCall, ZoomIsKeptForEachCamera) {
    expect_refused(video_.zoom(0, id_, Camera::kFront), Result::kWrongState, "start one first");
    wrong_state(video_.set_zoom(0, id_, Camera::kFront, 3), "start one first");
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    EXPECT_EQ(*video_.zoom(0, id_, Camera::kFront), 0);
    wrong_state(video_.set_zoom(0, id_, Camera::kBack, 3), "camera 1 is off: camera 0 is on");
    bad_argument(video_.set_zoom(0, id_, Camera{7}, 3), "not 7");
    bad_argument(video_.set_zoom(0, id_, Camera::kFront, 11), "0 to 10");
    bad_argument(video_.set_zoom(0, id_, Camera::kFront, -1), "0 to 10");
    expect_accepted(video_.set_zoom(0, id_, Camera::kFront, 10));
    expect_accepted(video_.switch_camera(0, id_));
    EXPECT_EQ(*video_.zoom(0, id_, Camera::kBack), 0);
    expect_accepted(video_.switch_camera(0, id_));
    EXPECT_EQ(*video_.zoom(0, id_, Camera::kFront), 10);
}

TEST_F(VideoCall, OrientationsAreQuarterTurns) {
    for (const std::int32_t degrees : {0, 90, 180, 270})
        expect_accepted(video_.set_orientation(0, id_, degrees));
    EXPECT_EQ(state().orientation, 270);
    for (const std::int32_t degrees : {-90, 1, 45, 360})
        bad_argument(video_.set_orientation(0, id_, degrees), "0, 90, 180 or 270");
}

TEST_F(VideoCall, TheStreamIsHeldOnce) {
    wrong_state(video_.resume(0, id_), "not on hold");
    expect_accepted(video_.hold(0, id_));
    wrong_state(video_.hold(0, id_), "on hold already");
    wrong_state(video_.start_cast(0, id_, "/film.mp4"), "on hold");
    expect_accepted(video_.resume(0, id_));
    EXPECT_FALSE(state().held);
}

TEST_F(VideoCall, PicturesNeedSomethingToSeeAndAFile) {
    wrong_state(video_.capture(0, id_, VideoEnd::kNear, "/p.png"), "shows nothing");
    expect_accepted(video_.capture(0, id_, VideoEnd::kFar, "/p.png"));
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    expect_accepted(video_.capture(0, id_, VideoEnd::kNear, "/p.png"));
    bad_argument(video_.capture(0, id_, VideoEnd{2}, "/p.png"), "not 2");
    bad_argument(video_.capture(0, id_, VideoEnd::kFar, ""), "path");
}

TEST_F(VideoCall, EachEndIsRecordedOnItsOwn) {
    const VideoFile far{VideoEnd::kFar, VideoFormat::kMp4, "/far.mp4", 60};
    const VideoFile near{VideoEnd::kNear, VideoFormat::k3gp, "/near.3gp", 0};
    wrong_state(video_.start_recording(0, id_, near), "shows nothing");
    expect_accepted(video_.start_recording(0, id_, far));
    wrong_state(video_.start_recording(0, id_, far), "recorded already, to /far.mp4");
    expect_accepted(video_.start_cast(0, id_, "/film.mp4")); // shows something without a camera
    expect_accepted(video_.start_recording(0, id_, near));
    EXPECT_EQ(state().recordings.size(), 2U);
    expect_accepted(video_.end_recording(0, id_, VideoEnd::kFar));
    EXPECT_EQ(state().recordings.size(), 1U);
    wrong_state(video_.end_recording(0, id_, VideoEnd::kFar), "not being recorded");
}

// Where the camera comes back, the recording has it again.
TEST_F(VideoCall, ARecordingOfTheNearEndOutlivesItsCamera) {
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    expect_accepted(video_.start_recording(0, id_, {VideoEnd::kNear, VideoFormat::kMp4, "/v", 0}));
    expect_accepted(video_.stop_camera(0, id_));
    expect_accepted(video_.pause_recording(0, id_, VideoEnd::kNear));
    expect_accepted(video_.end_recording(0, id_, VideoEnd::kNear));
}

TEST_F(VideoCall, RecordingsPauseAndResume) {
    const auto every_step = [&](VideoEnd end) {
        return std::vector<Status>{video_.pause_recording(0, id_, end),
                                   video_.resume_recording(0, id_, end),
                                   video_.end_recording(0, id_, end)};
    };
    for (const Status &status : every_step(VideoEnd::kFar))
        wrong_state(status, "not being recorded");
    for (const Status &status : every_step(VideoEnd{2}))
        bad_argument(status, "not 2");
    expect_accepted(
        video_.start_recording(0, id_, {VideoEnd::kFar, VideoFormat::kMp4, "/v.mp4", 0}));
    wrong_state(video_.resume_recording(0, id_, VideoEnd::kFar), "does not pause");
    expect_accepted(video_.pause_recording(0, id_, VideoEnd::kFar));
    wrong_state(video_.pause_recording(0, id_, VideoEnd::kFar), "pauses already");
    expect_accepted(video_.resume_recording(0, id_, VideoEnd::kFar));
    EXPECT_FALSE(state().recordings.at(VideoEnd::kFar).paused);
}

TEST_F(VideoCall, RecordingsAreChecked) {
    const auto start = [&](VideoEnd end, VideoFormat format, const char *path, int limit) {
        return video_.start_recording(0, id_, {end, format, path, limit});
    };
    bad_argument(start(VideoEnd{2}, VideoFormat::kMp4, "/v", 0), "not 2");
    bad_argument(start(VideoEnd::kFar, VideoFormat{2}, "/v", 0), "not 2");
    bad_argument(start(VideoEnd::kFar, VideoFormat::kMp4, "", 0), "path");
    bad_argument(start(VideoEnd::kFar, VideoFormat::kMp4, "/v", -1), "not -1");
    EXPECT_TRUE(state().recordings.empty());
}

TEST_F(VideoCall, OneFileIsCastAtATime) {
    wrong_state(video_.stop_cast(0, id_), "no file");
    bad_argument(video_.start_cast(0, id_, ""), "path");
    expect_accepted(video_.start_cast(0, id_, "/film.mp4"));
    wrong_state(video_.start_cast(0, id_, "/other.mp4"), "/film.mp4 is being cast");
    expect_accepted(video_.stop_cast(0, id_));
    EXPECT_EQ(state().cast, std::nullopt);
}

TEST_F(VideoCall, SurfacesAreListsOfPixmaps) {
    const auto set = [&](std::int32_t count, const VideoTelephony::Ids &ids) {
        return video_.set_surface(0, id_, VideoEnd::kNear, count, ids);
    };
    bad_argument(set(0, std::nullopt), "\"ai\"");
    bad_argument(set(3, {{4, 5}}), "the count is 3, and 2 pixmaps came");
    bad_argument(set(-1, {{}}), "the count is -1");
    bad_argument(set(2, {{4, 0}}), "positive");
    bad_argument(set(2, {{4, 4}}), "twice");
    expect_accepted(set(2, {{4, 5}}));
    expect_accepted(set(1, {{6}}));
    EXPECT_THAT(state().canvases[0].pixmaps, ElementsAre(6));
    expect_accepted(set(0, {std::vector<std::int32_t>{}}));
    EXPECT_THAT(state().canvases[0].pixmaps, IsEmpty());
}

TEST_F(VideoCall, PixmapsAreUsedAgainUntilTheyAreReleased) {
    bad_argument(video_.release_pixmap(0, id_, 4), "no surface has a pixmap 4");
    expect_accepted(video_.set_surface(0, id_, VideoEnd::kNear, 2, {{4, 5}}));
    expect_accepted(video_.re_use_pixmap(0, id_, VideoEnd::kNear, 4));
    bad_argument(video_.re_use_pixmap(0, id_, VideoEnd::kFar, 4), "no surface has a pixmap 4");
    bad_argument(video_.re_use_pixmap(0, id_, VideoEnd{2}, 4), "not 2");
    expect_accepted(video_.release_pixmap(0, id_, 4));
    bad_argument(video_.re_use_pixmap(0, id_, VideoEnd::kNear, 4), "no surface has a pixmap 4");
    bad_argument(video_.release_pixmap(0, id_, 4), "no surface has a pixmap 4");
    EXPECT_THAT(state().canvases[0].pixmaps, ElementsAre(5));
}

TEST_F(VideoCall, WindowsAreSetAndTakenAway) {
    const auto set = [&](const VideoWindow &window) { return video_.set_window(0, id_, window); };
    bad_argument(set({VideoEnd{2}, 1, 640, 480, 0}), "not 2");
    bad_argument(set({VideoEnd::kNear, -1, 640, 480, 0}), "positive");
    bad_argument(set({VideoEnd::kNear, 1, 0, 480, 0}), "0 by 480");
    bad_argument(set({VideoEnd::kNear, 1, 640, -1, 0}), "640 by -1");
    expect_accepted(set({VideoEnd::kNear, 1, 640, 480, 3}));
    EXPECT_EQ(state().canvases[0].window, 1);
    expect_accepted(set({VideoEnd::kNear, 0, 0, 0, 0}));
    EXPECT_FALSE(state().canvases[0].exists());
}

TEST_F(VideoCall, EndsSwapWhenBothAreDrawn) {
    expect_accepted(video_.set_surface(0, id_, VideoEnd::kNear, 1, {{4}}));
    wrong_state(video_.swap_ends(0, id_), "set both first");
    expect_accepted(video_.set_window(0, id_, {VideoEnd::kFar, 1, 640, 480, 0}));
    expect_accepted(video_.swap_ends(0, id_));
    EXPECT_TRUE(state().swapped);
    expect_accepted(video_.swap_ends(0, id_));
    EXPECT_FALSE(state().swapped);
}

TEST_F(VideoCall, SwipesGoOverSomethingDrawn) {
    wrong_state(video_.swipe(0, id_, {0, 0, 1, 1, 0}), "neither end");
    expect_accepted(video_.set_surface(0, id_, VideoEnd::kFar, 1, {{4}}));
    expect_accepted(video_.swipe(0, id_, {0, 0, 1, 1, 0}));
    for (const Swipe &swipe :
         {Swipe{-1, 0, 0, 0, 0}, {0, -1, 0, 0, 0}, {0, 0, -1, 0, 0}, {0, 0, 0, -1, 0}})
        bad_argument(video_.swipe(0, id_, swipe), "count from 0");
    bad_argument(video_.swipe(0, id_, {0, 0, 1, 1, -5}), "not -5");
}

TEST_F(VideoCall, BuffersAreKeptByName) {
    expect_accepted(video_.set_camera_buffer(0, id_, "camera"));
    expect_accepted(video_.set_media_buffer(0, id_, "media"));
    EXPECT_EQ(state().camera_buffer, "camera");
    EXPECT_EQ(state().media_buffer, "media");
    expect_accepted(video_.set_camera_buffer(0, id_, ""));
    EXPECT_EQ(state().camera_buffer, "");
}

TEST_F(VideoCall, BothSlotsHaveVideoOfTheirOwn) {
    const int callee = calls_.list(1).front().session_id;
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    expect_accepted(video_.start_camera(1, callee, Camera::kBack));
    EXPECT_EQ(state().camera, Camera::kFront);
    EXPECT_EQ(video_.find(1, callee)->camera, Camera::kBack);
}

TEST_F(VideoCall, VideoGoesWithTheCall) {
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    expect_accepted(video_.set_active(0, id_));
    EXPECT_EQ(video_.active(0), id_);
    expect_accepted(calls_.end(0, id_));
    EXPECT_EQ(video_.find(0, id_), nullptr);
    EXPECT_EQ(video_.active(0), 0);
    refused(video_.stop_camera(0, id_), Result::kUnknownSession, "there is no call");
}

TEST_F(VideoCall, VideoGoesWithTheRadio) {
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    lose(0);
    EXPECT_EQ(video_.find(0, id_), nullptr);
}

TEST_F(VideoCall, ACallThatBecomesAVoiceCallStartsAnewAsAVideoCall) {
    expect_accepted(video_.start_camera(0, id_, Camera::kFront));
    expect_accepted(video_.set_active(0, id_));
    expect_accepted(changes_.downgrade(0, id_, CallType::kVoice));
    EXPECT_EQ(video_.find(0, id_), nullptr);
    EXPECT_EQ(video_.active(0), 0);
    wrong_state(video_.stop_camera(0, id_), "no video call");
    expect_accepted(changes_.upgrade(0, id_, CallType::kVideo));
    expect_accepted(changes_.accept(1, calls_.list(1).front().session_id));
    wrong_state(video_.stop_camera(0, id_), "start one first");
}

TEST_F(VideoCall, ACallThatIsAnsweredAsAVoiceCallHasNoVideo) {
    const auto ends = ring(2, 3, CallType::kVideo);
    expect_accepted(video_.start_camera(2, ends.caller, Camera::kFront));
    expect_accepted(calls_.answer(3, ends.callee, CallType::kVoice));
    EXPECT_EQ(video_.find(2, ends.caller), nullptr);
}

} // namespace
} // namespace sim::test
