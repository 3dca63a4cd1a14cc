// SPDX-License-Identifier: Apache-2.0
// Recordings, which are files of who spoke when.
#include "tests/sim/ptt/network.hpp"
#include "tests/sim/settings/directory.hpp"

#include <filesystem>
#include <fstream>

namespace sim::test {
namespace {

class PttRecorderTest : public PttNetwork {
  protected:
    std::string path() const { return directory_of_files_.path() + "/call.txt"; }
    static std::vector<std::string> lines_of(const std::string &path) {
        std::vector<std::string> lines;
        std::ifstream file(path);
        for (std::string line; std::getline(file, line);)
            lines.push_back(line);
        return lines;
    }
    Answer<PttRecordingInfo> start(PttRecordSource source = PttRecordSource::kAll,
                                   std::int32_t longest = 0) {
        return recorder_.start(0, {1, source, longest, path()});
    }

    TemporaryDirectory directory_of_files_;
};

TEST_F(PttRecorderTest, KeepsWhoSpeaksWhen) {
    connect_team();
    expect_accepted(ask_floor(1));
    const auto info = start();
    ASSERT_TRUE(info);
    EXPECT_EQ(info->path, path());
    advance(1s);
    expect_accepted(floor_.release(1, 1));
    expect_accepted(recorder_.pause(0, 1));
    expect_accepted(ask_floor(0));
    expect_accepted(floor_.release(0, 1));
    advance(1s);
    expect_accepted(recorder_.resume(0, 1));
    expect_accepted(ask_floor(0));
    expect_accepted(recorder_.stop(0, 1));
    EXPECT_THAT(lines_of(path()),
                ElementsAre("1.000 recording of session 1 of slot 0 with sip:team@example.org",
                            "1.000 tel:+15550101 speaks", "2.000 nobody speaks", "2.000 paused",
                            "3.000 resumed", "3.000 tel:+15550100 speaks", "3.000 stopped"));
}

TEST_F(PttRecorderTest, KeepsOneSideWhenAsked) {
    connect_team();
    expect_accepted(start(PttRecordSource::kOwn));
    expect_accepted(ask_floor(1));
    expect_accepted(floor_.release(1, 1));
    expect_accepted(ask_floor(0));
    expect_accepted(ptt_.end(0, 1, PttEndScope::kLeave));
    EXPECT_THAT(lines_of(path()),
                ElementsAre("1.000 recording of session 1 of slot 0 with sip:team@example.org",
                            "1.000 nobody speaks", "1.000 tel:+15550100 speaks",
                            "1.000 the call has ended"));
    expect_refused(recorder_.stop(0, 1), Result::kUnknownSession, "session 1");
}

TEST_F(PttRecorderTest, EndsAfterItsTime) {
    connect_two();
    expect_accepted(start(PttRecordSource::kOthers, 10));
    expect_accepted(recorder_.pause(0, 1));
    advance(10s);
    EXPECT_EQ(lines_of(path()).back(), "11.000 the time is over");
    expect_refused(recorder_.stop(0, 1), Result::kWrongState, "not being recorded");
}

TEST_F(PttRecorderTest, ACancelledOneIsGone) {
    connect_two();
    expect_accepted(start());
    expect_accepted(recorder_.cancel(0, 1));
    EXPECT_FALSE(std::filesystem::exists(path()));
    const auto own = recorder_.start(0, {1, PttRecordSource::kAll, 0, {}});
    ASSERT_TRUE(own);
    EXPECT_TRUE(std::filesystem::exists(own->path)) << own->path;
    expect_accepted(recorder_.cancel(0, 1));
    EXPECT_FALSE(std::filesystem::exists(own->path)) << own->path;
}

TEST_F(PttRecorderTest, CancellingRemovesNoFileThatIsNotItsOwn) {
    namespace fs = std::filesystem;
    const auto file = [this](const char *name) { return directory_of_files_.file(name); };
    connect_two();
    fs::create_directory(file("chosen"));
    fs::create_directory(file("precious"));
    put_content(file("precious/call.txt"), "precious");
    // Another directory where the one it was made in has been.
    expect_accepted(recorder_.start(0, {1, PttRecordSource::kAll, 0, file("chosen/call.txt")}));
    fs::rename(file("chosen"), file("moved"));
    fs::create_directory_symlink(file("precious"), file("chosen"));
    expect_accepted(recorder_.cancel(0, 1));
    EXPECT_EQ(content_of(file("precious/call.txt")), "precious");
    EXPECT_FALSE(fs::exists(file("moved/call.txt")));
    // Another file, or a link to one, where it has been itself.
    expect_accepted(recorder_.start(0, {1, PttRecordSource::kAll, 0, file("moved/call.txt")}));
    fs::rename(file("precious/call.txt"), file("moved/call.txt"));
    expect_accepted(recorder_.cancel(0, 1));
    EXPECT_EQ(content_of(file("moved/call.txt")), "precious");
    expect_accepted(recorder_.start(0, {1, PttRecordSource::kAll, 0, file("moved/link.txt")}));
    fs::rename(file("moved/link.txt"), file("moved/own.txt"));
    fs::create_symlink("own.txt", file("moved/link.txt"));
    expect_accepted(recorder_.cancel(0, 1));
    EXPECT_TRUE(fs::is_symlink(file("moved/link.txt")));
}

TEST_F(PttRecorderTest, WhatMakesNoSenseIsRefused) {
    expect_refused(start(), Result::kUnknownSession, "session 1");
    expect_refused(recorder_.pause(0, 1), Result::kUnknownSession, "session 1");
    place(0, "+15550101");
    expect_refused(start(), Result::kWrongState, "not established");
    advance(700ms);
    answer_all({1});
    expect_refused(start(PttRecordSource{3}), Result::kInvalidArgument, "not 3");
    expect_refused(start(PttRecordSource::kAll, -1), Result::kInvalidArgument, "the longest");
    expect_refused(recorder_.start(0, {1, PttRecordSource::kAll, 0, "here.txt"}),
                   Result::kInvalidArgument, "no absolute path");
    expect_refused(recorder_.start(0, {1, PttRecordSource::kAll, 0, path() + "/deeper"}),
                   Result::kFailed, "cannot be made");
    for (const auto &status : {recorder_.pause(0, 1), recorder_.resume(0, 1), recorder_.stop(0, 1),
                               recorder_.cancel(0, 1)})
        expect_refused(status, Result::kWrongState, "not being recorded");
    expect_accepted(start());
    expect_refused(start(), Result::kWrongState, "being recorded already");
    expect_refused(recorder_.resume(0, 1), Result::kWrongState, "not paused");
    expect_accepted(recorder_.pause(0, 1));
    expect_refused(recorder_.pause(0, 1), Result::kWrongState, "paused already");
    // No file of somebody else's is overwritten.
    expect_refused(recorder_.start(1, {1, PttRecordSource::kAll, 0, path()}), Result::kFailed,
                   "File exists");
}

} // namespace
} // namespace sim::test
