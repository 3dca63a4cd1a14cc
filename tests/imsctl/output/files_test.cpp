// SPDX-License-Identifier: Apache-2.0
#include "imsctl/output/files.hpp"

#include "imsctl/output/failure.hpp"
#include "tests/support/files.hpp"

#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

namespace imsctl {
namespace {

namespace fs = std::filesystem;

class WriteFile : public ::testing::Test {
  protected:
    std::string path(const char *name) const { return directory_.file(name); }

    std::ptrdiff_t files() const {
        return std::distance(fs::directory_iterator(directory_.path()), fs::directory_iterator());
    }

    static std::string failure_of(const std::string &name) {
        try {
            write_file(name, "new");
        } catch (const Failure &failure) {
            EXPECT_EQ(failure.kind, FailureKind::kOutput);
            return failure.what();
        }
        return "written";
    }

    static constexpr fs::perms kOwnerOnly = fs::perms::owner_read | fs::perms::owner_write;

    ::test::TemporaryDirectory directory_;
};

TEST_F(WriteFile, MakesAFileOfTheOwnersOwn) {
    write_file(path("a"), "text");
    EXPECT_EQ(read_file(path("a")), "text");
    EXPECT_EQ(fs::status(path("a")).permissions(), kOwnerOnly);
    EXPECT_EQ(files(), 1);
}

TEST_F(WriteFile, TakesTheOthersRightsToAFileThatWasThere) {
    write_file(path("a"), "much longer text");
    fs::permissions(path("a"), fs::perms::others_read | kOwnerOnly);
    write_file(path("a"), "text");
    EXPECT_EQ(read_file(path("a")), "text");
    EXPECT_EQ(fs::status(path("a")).permissions(), kOwnerOnly);
    EXPECT_EQ(files(), 1);
}

TEST_F(WriteFile, FollowsALink) {
    write_file(path("a"), "old");
    fs::create_symlink("a", path("link"));
    write_file(path("link"), "new");
    EXPECT_TRUE(fs::is_symlink(path("link")));
    EXPECT_EQ(read_file(path("a")), "new");
    EXPECT_EQ(files(), 2);
}

TEST_F(WriteFile, LeavesTheOldFileAndOthersNewOneWhenItFails) {
    write_file(path("a"), "old");
    write_file(path("a.new"), "of somebody else");
    EXPECT_EQ(failure_of(path("a")), "cannot write \"" + path("a.new") + "\": File exists");
    EXPECT_EQ(read_file(path("a")), "old");
    EXPECT_EQ(read_file(path("a.new")), "of somebody else");
}

TEST_F(WriteFile, FailsWhereNoFileCanBe) {
    EXPECT_THAT(failure_of(path("none/a")), testing::HasSubstr("No such file"));
    EXPECT_THAT(failure_of(directory_.path()), testing::HasSubstr("Is a directory"));
    EXPECT_EQ(files(), 0);
}

TEST_F(WriteFile, WritesToAPipeItself) {
    ASSERT_EQ(mkfifo(path("pipe").c_str(), S_IRUSR | S_IWUSR), 0);
    const int reader = open(path("pipe").c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC);
    ASSERT_GE(reader, 0);
    write_file(path("pipe"), "text");
    char text[16];
    EXPECT_EQ(read(reader, text, sizeof text), 4);
    close(reader);
    EXPECT_EQ(files(), 1);
}

} // namespace
} // namespace imsctl
