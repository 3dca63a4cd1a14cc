// SPDX-License-Identifier: Apache-2.0
// What the registration's reply becomes.
#include "tests/support/expectations.hpp"
#include "tests/support/guarded.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

constexpr const char *kMethod = "org.kelvo.ims.Registration.GetRegistrationInfo";
constexpr const char *kFunction = "ims_get_registration_info";

class Registration : public WithPeer {
  protected:
    int ask(const std::string &text) {
        peer().on(kMethod, reply("(buuiiii)", text));
        return ims_get_registration_info(handle_, &info());
    }

    void expect_info(std::int32_t registered, std::uint32_t value_1, std::uint32_t value_2,
                     std::int32_t value_3, std::int32_t value_4, std::int32_t value_5) {
        EXPECT_EQ(info().registered, registered);
        EXPECT_EQ(info().value_1, value_1);
        EXPECT_EQ(info().value_2, value_2);
        EXPECT_EQ(info().value_3, value_3);
        EXPECT_EQ(info().value_4, value_4);
        EXPECT_EQ(info().value_5, value_5);
        EXPECT_TRUE(guarded_.is_intact());
    }

    ims_registration_info_s &info() { return guarded_.record; }

    Guarded<ims_registration_info_s> guarded_;
};

TEST_F(Registration, LastMemberZeroFillsTheRecordAndReturnsZero) {
    EXPECT_EQ(ask("(true, 1, 2, 3, 4, 5, 0)"), IMS_ERROR_NONE);
    expect_info(1, 1, 2, 3, 4, 5);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Registration, LastMemberSixFailsIsLoggedAndLeavesTheValuesInTheRecord) {
    EXPECT_EQ(ask("(true, 1, 2, 3, 4, 5, 6)"), IMS_ERROR_OPERATION_FAILED);
    expect_info(1, 1, 2, 3, 4, 5);
    expect_one_line("ims_reg.cpp", kFunction, "Failed to get registration info: 6");
}

TEST_F(Registration, NoneOfTheFirstSixMembersIsTheResult) {
    EXPECT_EQ(ask("(false, 0, 0, 0, 0, 0, 0)"), IMS_ERROR_NONE);
    expect_info(0, 0, 0, 0, 0, 0);
    EXPECT_EQ(ask("(false, 0, 0, 0, 0, 0, -1)"), IMS_ERROR_OPERATION_FAILED);
    expect_one_line("ims_reg.cpp", kFunction, "Failed to get registration info: -1");
    EXPECT_EQ(ask("(true, 4294967295, 2147483648, -1, -2147483648, 2147483647, 0)"),
              IMS_ERROR_NONE);
    expect_info(1, 4294967295U, 2147483648U, -1, -2147483647 - 1, 2147483647);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(Registration, ResultsOfAllKindsAreLoggedAsTheyCame) {
    for (const int result : {1, 2, -13, -2147483647 - 1, 2147483647}) {
        const std::string number = std::to_string(result);
        EXPECT_EQ(ask("(true, 1, 2, 3, 4, 5, " + number + ")"), IMS_ERROR_OPERATION_FAILED);
        expect_one_line("ims_reg.cpp", kFunction, "Failed to get registration info: " + number);
    }
}

TEST_F(Registration, TheRecordIsUntouchedWhenNoUsableReplyComes) {
    const std::string before = guarded_.image();
    const std::pair<Answer, int> answers[] = {
        {failure(error_name::kAccessDenied), IMS_ERROR_PERMISSION_DENIED},
        {failure(error_name::kNoReply), IMS_ERROR_OPERATION_FAILED},
        {empty_reply(), IMS_ERROR_OPERATION_FAILED},
        {reply("(buuiii)", "(true, 1, 2, 3, 4, 0)"), IMS_ERROR_OPERATION_FAILED},
        {reply("(buuiiiii)", "(true, 1, 2, 3, 4, 5, 0, 0)"), IMS_ERROR_OPERATION_FAILED},
        {reply("(ibuuiii)", "(0, true, 1, 2, 3, 4, 5)"), IMS_ERROR_OPERATION_FAILED}};
    for (const auto &[answer, result] : answers) {
        peer().on(kMethod, answer);
        EXPECT_EQ(ims_get_registration_info(handle_, &info()), result);
        EXPECT_EQ(guarded_.image(), before);
    }
    EXPECT_EQ(ims_get_registration_info(nullptr, &info()), IMS_ERROR_INVALID_PARAMETER);
    set_gate(Gate::kOff);
    EXPECT_EQ(ims_get_registration_info(handle_, &info()), IMS_ERROR_NOT_SUPPORTED);
    EXPECT_EQ(guarded_.image(), before);
    EXPECT_TRUE(guarded_.is_intact());
}

} // namespace
} // namespace test
