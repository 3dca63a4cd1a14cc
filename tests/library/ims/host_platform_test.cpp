// SPDX-License-Identifier: Apache-2.0
// The host's feature query and logger. The query reads its file once in a process, so each answer
// is had from a process of its own.
#include "platform.h"
#include "tests/support/files.hpp"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <string>

namespace {

using ::testing::ExitedWithCode;

enum Answer { kOff = 10, kOn = 11, kFailed = 12 };

class HostPlatform : public ::testing::Test {
  protected:
    void SetUp() override {
        GTEST_FLAG_SET(death_test_style, "threadsafe");
        setenv("KELVO_IMS_FEATURE_FILE", path().c_str(), 1);
    }

    void TearDown() override { unsetenv("KELVO_IMS_FEATURE_FILE"); }

    std::string path() const { return directory_.file("features.conf"); }

    void write(const std::string &text) const { test::put_content(path(), text); }

    // For EXPECT_EXIT: the answer as the exit status.
    [[noreturn]] void exit_with_answer(const char *key) const {
        bool enabled = false;
        const bool is_known = system_info_get_custom_bool(key, &enabled) == 0;
        std::filesystem::remove_all(directory_.path()); // exit() ends no fixture
        if (!is_known)
            std::exit(kFailed);
        std::exit(enabled ? kOn : kOff);
    }

  private:
    test::TemporaryDirectory directory_;
};

TEST_F(HostPlatform, TheFeatureIsOnWithoutAFile) {
    EXPECT_EXIT(exit_with_answer(IMS_PLATFORM_FEATURE_KEY), ExitedWithCode(kOn), "");
}

TEST_F(HostPlatform, TheFeatureIsWhatTheFileSays) {
    write("[features]\nkelvo.org/feature/network.telephony.ims=false\n");
    EXPECT_EXIT(exit_with_answer(IMS_PLATFORM_FEATURE_KEY), ExitedWithCode(kOff), "");
    write("[features]\nkelvo.org/feature/network.telephony.ims=true\n");
    EXPECT_EXIT(exit_with_answer(IMS_PLATFORM_FEATURE_KEY), ExitedWithCode(kOn), "");
}

TEST_F(HostPlatform, AFileThatCannotBeReadFailsTheQuery) {
    write("no key file at all\n");
    EXPECT_EXIT(exit_with_answer(IMS_PLATFORM_FEATURE_KEY), ExitedWithCode(kFailed), "");
}

TEST_F(HostPlatform, AValueThatIsNoBooleanFailsTheQuery) {
    write("[features]\nkelvo.org/feature/network.telephony.ims=perhaps\n");
    EXPECT_EXIT(exit_with_answer(IMS_PLATFORM_FEATURE_KEY), ExitedWithCode(kFailed), "");
}

TEST_F(HostPlatform, AnotherKeyFailsTheQuery) {
    EXPECT_EXIT(exit_with_answer("kelvo.org/feature/other"), ExitedWithCode(kFailed), "");
}

TEST_F(HostPlatform, LinesGoToStandardErrorWithTheirPriorityAndTag) {
    ::testing::internal::CaptureStderr();
    __dlog_print(IMS_PLATFORM_LOG_SYSTEM, IMS_PLATFORM_LOG_ERROR, "TAG", "%s: %s(%d) > %s", "a.cpp",
                 "f", 7, "broken");
    __dlog_print(IMS_PLATFORM_LOG_SYSTEM, IMS_PLATFORM_LOG_WARNING, "TAG", "odd");
    EXPECT_EQ(::testing::internal::GetCapturedStderr(),
              "E/TAG: a.cpp: f(7) > broken\nW/TAG: odd\n");
}

} // namespace
