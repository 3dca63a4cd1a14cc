// SPDX-License-Identifier: Apache-2.0
// What the callback of a started recording gets.
#include "tests/support/expectations.hpp"
#include "tests/support/released.hpp"
#include "tests/support/with_peer.hpp"

#include <climits>

namespace test {
namespace {

class Recording : public WithPeer {
  protected:
    // Starts a recording, with this reply, and looks at what the callback gets.
    void start(const char *value, ResponseRecorder &recorder) {
        peer().on("org.kelvo.ims.Poc.PocStartCallRecording", reply("(ia{sv})", value));
        const ims_poc_record_request_s info{1, 2, 3, nullptr};
        ASSERT_EQ(
            ims_poc_start_call_recording(handle_, &info, ResponseRecorder::callback, &recorder),
            IMS_ERROR_NONE);
        fence();
        ASSERT_EQ(recorder.count(), 1U);
    }

    void expect(const char *value, const ims_poc_recording_info_s &expected) {
        SCOPED_TRACE(value);
        ResponseRecorder recorder{[&](const Response &, void *data) {
            ASSERT_NE(data, nullptr);
            const auto &info = *static_cast<ims_poc_recording_info_s *>(data);
            EXPECT_EQ(info.session_id, expected.session_id);
            EXPECT_EQ(info.record_state, expected.record_state);
            EXPECT_EQ(info.record_error, expected.record_error);
            EXPECT_STREQ(info.record_file_path, expected.record_file_path);
        }};
        start(value, recorder);
    }
};

TEST_F(Recording, SendsANullTextAsAnEmptyOne) {
    ResponseRecorder recorder;
    start("(0, {})", recorder);
    const std::vector<Call> sent = requests();
    ASSERT_EQ(sent.size(), 1U);
    expect_sent(sent[0], "(iiis)", "(1, 2, 3, '')");
}

TEST_F(Recording, WithoutAPathHasNone) {
    expect("(0, {'session_id': <int64 7>, 'record_state': <int64 1>, 'record_error': <int64 2>})",
           {7, 1, 2, nullptr});
}

TEST_F(Recording, IsHandedOverWhatever) {
    expect("(0, {})", {0, 0, 0, nullptr});
    expect("(0, {'record_file_path': <''>})", {0, 0, 0, ""});
    expect("(0, {'session_id': <7>, 'record_state': <'on'>, 'record_error': <true>, "
           "'record_file_path': <int64 1>, 'unheard': <'of'>})",
           {0, 0, 0, nullptr});
    expect("(0, {'record_file_path': <<<'/tmp/a'>>>, 'session_id': <<int64 7>>})",
           {7, 0, 0, "/tmp/a"});
    expect("(0, {'session_id': <int64 -1>, 'record_state': <int64 4294967296>, 'record_error': "
           "<int64 -9223372036854775808>})",
           {-1, 0, 0, nullptr});
}

TEST_F(Recording, OfAKeyThatComesTwiceKeepsTheLaterValue) {
    expect("(0, {'session_id': <int64 1>, 'record_file_path': <'/tmp/a'>, 'session_id': <int64 2>, "
           "'record_file_path': <'/tmp/b'>})",
           {2, 0, 0, "/tmp/b"});
}

TEST_F(Recording, ComesWithEveryResult) {
    ResponseRecorder recorder{[](const Response &, void *data) {
        ASSERT_NE(data, nullptr);
        EXPECT_EQ(static_cast<ims_poc_recording_info_s *>(data)->record_error, 4);
    }};
    start("(-5, {'record_error': <int64 4>})", recorder);
    EXPECT_EQ(recorder.last().result, -5);
}

TEST_F(Recording, PathIsGoneAfterTheCallback) {
    const void *path = nullptr;
    ResponseRecorder recorder{[&](const Response &, void *data) {
        path = static_cast<ims_poc_recording_info_s *>(data)->record_file_path;
    }};
    start("(0, {'record_file_path': <'/tmp/a'>})", recorder);
    expect_released(path);
}

} // namespace
} // namespace test
