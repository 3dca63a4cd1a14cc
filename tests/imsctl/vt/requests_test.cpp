// SPDX-License-Identifier: Apache-2.0
// Video telephony against a scripted service, and how a verb finds the call that it is about.
#include "tests/imsctl/verb_checks.hpp"

#include <gmock/gmock.h>

#include <set>

namespace test {
namespace {

using testing::HasSubstr;

const VerbRow kVtVerbs[] = {
    {"vt camera start --session 7", 3, "Vt.StartCamera", "(ii)", "(7, 0)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt camera start --camera back --session 7", 3, "Vt.StartCamera", "(ii)", "(7, 1)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt camera start --camera 5 --session 7", 3, "Vt.StartCamera", "(ii)", "(7, 5)", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt camera stop 7", 3, "Vt.StopCamera", "(i)", "(7,)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt camera switch 7", 3, "Vt.SwitchCamera", "(i)", "(7,)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt hide --session 7", 2, "Vt.HideMe", "(is)", "(7, '')", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt hide --picture me.png --session 7", 2, "Vt.HideMe", "(is)", "(7, 'me.png')", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt show 7", 2, "Vt.ShowMe", "(i)", "(7,)", "(i)", "(0,)", "(77,)", R"({"session_id":7})",
     "session_id=7"},
    {"vt orientation 270 --session 7", 2, "Vt.SetVideoOrientation", "(ii)", "(7, 270)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt zoom get --session 7", 3, "Vt.GetZoom", "(ii)", "(7, 0)", "(ii)", "(0, 4)", "(77, 0)",
     R"({"session_id":7,"zoom":4})", "session_id=7 zoom=4"},
    {"vt zoom get --camera back --session 7", 3, "Vt.GetZoom", "(ii)", "(7, 1)", "(ii)", "(0, -4)",
     "(77, 0)", R"({"session_id":7,"zoom":-4})", "session_id=7 zoom=-4"},
    {"vt zoom set 3 --camera back --session 7", 3, "Vt.SetZoom", "(iii)", "(7, 1, 3)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt hold 7", 2, "Vt.HoldVideo", "(i)", "(7,)", "(i)", "(0,)", "(77,)", R"({"session_id":7})",
     "session_id=7"},
    {"vt resume 7", 2, "Vt.ResumeVideo", "(i)", "(7,)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt capture a.png --session 7", 2, "Vt.CaptureSurfaceImage", "(iis)", "(7, 1, 'a.png')", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt capture a.png --end near --session 7", 2, "Vt.CaptureSurfaceImage", "(iis)",
     "(7, 0, 'a.png')", "(i)", "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt record start a.mp4 --session 7", 3, "Vt.StartRecordVideo", "(iiisi)",
     "(7, 1, 1, 'a.mp4', 0)", "(i)", "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt record start a --end near --format 3gp --limit 60 --session 7", 3, "Vt.StartRecordVideo",
     "(iiisi)", "(7, 0, 0, 'a', 60)", "(i)", "(0,)", "(77,)", R"({"session_id":7})",
     "session_id=7"},
    {"vt record pause --session 7", 3, "Vt.PauseRecordVideo", "(ii)", "(7, 1)", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt record resume --end near --session 7", 3, "Vt.ResumeRecordVideo", "(ii)", "(7, 0)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt record cancel --end 4 --session 7", 3, "Vt.CancelRecordVideo", "(ii)", "(7, 4)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt record stop --session 7", 3, "Vt.StopRecordVideo", "(ii)", "(7, 1)", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt cast start film.mp4 --session 7", 3, "Vt.StartFileCast", "(is)", "(7, 'film.mp4')", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt cast stop 7", 3, "Vt.StopFileCast", "(i)", "(7,)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt surface swap 7", 3, "Vt.SwapVideoSurface", "(i)", "(7,)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt surface near 4 5 --session 7", 3, "Vt.SetNearEndSurface", "(iiv)", "(7, 2, <[4, 5]>)",
     "(i)", "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt surface near --session 7", 3, "Vt.SetNearEndSurface", "(iiv)", "(7, 0, <@ai []>)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt surface far 6 --session 7", 3, "Vt.SetFarEndSurface", "(iiv)", "(7, 1, <[6]>)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt swipe 1 2 30 40 --session 7", 2, "Vt.SwipeVideo", "(iiiiii)", "(7, 1, 2, 30, 40, 0)",
     "(i)", "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt swipe 1 2 30 40 --duration 300 --session 7", 2, "Vt.SwipeVideo", "(iiiiii)",
     "(7, 1, 2, 30, 40, 300)", "(i)", "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt active 7", 2, "Vt.SetActiveSessionId", "(i)", "(7,)", "(i)", "(0,)", "(77,)",
     R"({"session_id":7})", "session_id=7"},
    {"vt pixmap re-use 4 --session 7", 3, "Vt.ReUsePixMapId", "(iii)", "(7, 1, 4)", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt pixmap re-use 4 --end near --session 7", 3, "Vt.ReUsePixMapId", "(iii)", "(7, 0, 4)",
     "(i)", "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt pixmap release 4 --session 7", 3, "Vt.ReleasePixMapId", "(ii)", "(7, 4)", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt window 9 --session 7", 2, "Vt.SetWindowId", "(iiiiii)", "(7, 1, 9, 640, 480, 0)", "(i)",
     "(0,)", "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt window 9 --end near --width 320 --height 240 --layer 2 --session 7", 2, "Vt.SetWindowId",
     "(iiiiii)", "(7, 0, 9, 320, 240, 2)", "(i)", "(0,)", "(77,)", R"({"session_id":7})",
     "session_id=7"},
    {"vt buffer camera c --session 7", 3, "Vt.SetCameraBuffer", "(is)", "(7, 'c')", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt buffer camera --session 7", 3, "Vt.SetCameraBuffer", "(is)", "(7, '')", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
    {"vt buffer media m --session 7", 3, "Vt.SetMediaBuffer", "(is)", "(7, 'm')", "(i)", "(0,)",
     "(77,)", R"({"session_id":7})", "session_id=7"},
};

INSTANTIATE_TEST_SUITE_P(Vt, ServiceVerbs, ::testing::ValuesIn(kVtVerbs), verb_name);

TEST(VtVerbTable, ReachesEveryRequest) {
    std::set<std::string> methods;
    for (const VerbRow &row : kVtVerbs)
        methods.insert(row.method);
    EXPECT_EQ(methods.size(), 28u);
}

TEST_F(WithService, TakesTheOnlyVideoCall) {
    answer("Call.CallListInfo", "(iuaa{sv})",
           "(0, 2, [{'session_id': <3>, 'call_type': <0>, 'call_state': <6>}, "
           "{'session_id': <4>, 'call_type': <1>, 'call_state': <5>}])");
    answer("Vt.HoldVideo", "(i)", "(0,)");
    answer("Vt.StartCamera", "(i)", "(0,)");
    EXPECT_EQ(run_imsctl({"vt", "hold"}).output, "session_id=4\n");
    EXPECT_EQ(run_imsctl({"vt", "camera", "start"}).output, "session_id=4\n");
}

TEST_F(WithService, SaysThatThereIsNoVideoCall) {
    answer("Call.CallListInfo", "(iuaa{sv})",
           "(0, 1, [{'session_id': <3>, 'call_type': <0>, 'call_state': <5>}])");
    const Outcome outcome = run_imsctl({"vt", "hold", "--json"});
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.json()["error"]["kind"], "session");
    EXPECT_THAT(outcome.error, HasSubstr("there are no video calls; all calls: 3 (-, active)"));
    EXPECT_TRUE(calls_to("Vt.HoldVideo").empty());
}

TEST_F(WithService, RefusesPixmapsThatAreNoNumbers) {
    const Outcome outcome = run_imsctl(split("vt surface near 4 five --session 7"));
    EXPECT_EQ(outcome.status, 2);
    EXPECT_THAT(outcome.error, HasSubstr("PIXMAP: \"five\" is not a whole number of 32 bits"));
    EXPECT_TRUE(peer_.calls().empty());
}

} // namespace
} // namespace test
