// SPDX-License-Identifier: Apache-2.0
// The video telephony rows through every check, and what the requests do beside that.
#include "tests/library/vt/vt_rows.hpp"
#include "tests/support/declarations.hpp"
#include "tests/support/expectations.hpp"
#include "tests/support/request_checks.hpp"

#include <climits>

namespace test {

using ::testing::ValuesIn;

INSTANTIATE_TEST_SUITE_P(Vt, Requests, ValuesIn(vt_request_rows()), row_name<RequestRow>);
INSTANTIATE_TEST_SUITE_P(Vt, RequestGates, ValuesIn(vt_request_rows()), row_name<RequestRow>);

namespace {

TEST(VtRows, CoverEveryDeclaredRequest) {
    EXPECT_EQ(vt_request_rows().size(), 28U);
    EXPECT_EQ(functions_of(vt_request_rows()), declared_functions("ims_vt.h"));
}

class VtRequest : public WithPeer {};

TEST_F(VtRequest, NumbersPassThroughUnchecked) {
    for (const std::int32_t value : {INT_MIN, -1, 0, INT_MAX}) {
        const std::string number = std::to_string(value);
        EXPECT_EQ(ims_vt_stop_camera(handle_, value, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(i)", "(" + number + ",)");
        const ims_vt_zoom_s zoom{value, value, value};
        EXPECT_EQ(ims_vt_set_zoom(handle_, &zoom, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(iii)", "(" + number + ", " + number + ", " + number + ")");
    }
}

// A missing text does not bring the process down.
TEST_F(VtRequest, NullTextsAreSentAsEmptyOnes) {
    const ims_vt_hide_me_s hidden{7, nullptr};
    EXPECT_EQ(ims_vt_hide_me(handle_, &hidden, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(is)", "(7, '')");
    const ims_vt_capture_s capture{7, 2, nullptr};
    EXPECT_EQ(ims_vt_capture_surface_image(handle_, &capture, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(iis)", "(7, 2, '')");
    const ims_vt_record_start_s start{7, 2, 3, nullptr, 4};
    EXPECT_EQ(ims_vt_start_record_video(handle_, &start, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(iiisi)", "(7, 2, 3, '', 4)");
    const ims_vt_file_cast_s cast{7, nullptr};
    EXPECT_EQ(ims_vt_start_file_cast(handle_, &cast, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(is)", "(7, '')");
    const ims_vt_buffer_s buffer{7, nullptr};
    EXPECT_EQ(ims_vt_set_camera_buffer(handle_, &buffer, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(is)", "(7, '')");
    EXPECT_EQ(ims_vt_set_media_buffer(handle_, &buffer, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(is)", "(7, '')");
}

// Another handle has another application id; no video telephony tuple holds one.
TEST_F(VtRequest, NoTupleCarriesTheApplicationId) {
    peer().on(kRegisterApplication, reply("(ii)", "(0, 4711)"));
    const ims_h other = init();
    for (const RequestRow &row : vt_request_rows()) {
        EXPECT_EQ(row.function.call(other, nullptr, nullptr), IMS_ERROR_NONE);
        expect_sent(requests().back(), row.type, row.arguments);
    }
}

class Zoom : public WithPeer {
  protected:
    // What the callback gets when the service answers like this.
    Response ask(const Answer &answer, std::optional<std::int32_t> zoom) {
        peer().on("org.kelvo.ims.Vt.GetZoom", answer);
        ResponseRecorder recorder{[zoom](const Response &, void *data) {
            ASSERT_EQ(data != nullptr, zoom.has_value());
            if (zoom) {
                EXPECT_EQ(*static_cast<std::int32_t *>(data), *zoom);
            }
        }};
        const ims_vt_zoom_query_s query{7, 1};
        EXPECT_EQ(ims_vt_get_zoom(handle_, &query, ResponseRecorder::callback, &recorder),
                  IMS_ERROR_NONE);
        fence();
        return recorder.count() == 1 ? recorder.last() : Response{};
    }
};

TEST_F(Zoom, AnyValueReachesTheCallback) {
    for (const std::int32_t zoom : {INT_MIN, -1, 0, INT_MAX})
        EXPECT_EQ(ask(reply("(ii)", "(0, " + std::to_string(zoom) + ")"), zoom).result, 0);
}

TEST_F(Zoom, AReplyWithAFailureStillBringsTheZoom) {
    EXPECT_EQ(ask(reply("(ii)", "(5, 3)"), 3).result, 5);
}

TEST_F(Zoom, AFailedCallBringsNone) {
    EXPECT_EQ(ask(failure(error_name::kFailed), std::nullopt).result, 1);
    EXPECT_TRUE(take_log().empty());
    EXPECT_EQ(ask(failure(error_name::kAccessDenied), std::nullopt).result, 2);
    expect_one_line("ims_vt.cpp", "on_response_vt_get_zoom", "Permission denied");
}

} // namespace
} // namespace test
