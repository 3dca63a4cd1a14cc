// SPDX-License-Identifier: Apache-2.0
// What the login state's reply becomes.
#include "tests/support/expectations.hpp"
#include "tests/support/guarded.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

constexpr const char *kMethod = "org.kelvo.ims.Login.GetLoginState";
constexpr const char *kFunction = "ims_get_login_state";

class LoginState : public WithPeer {
  protected:
    int ask(const std::string &text, std::int32_t value = 2) {
        peer().on(kMethod, reply("(iiui)", text));
        return ims_get_login_state(handle_, value, &state());
    }

    void expect_state(std::int32_t value_1, std::uint32_t value_2, std::int32_t value_3) {
        EXPECT_EQ(state().value_1, value_1);
        EXPECT_EQ(state().value_2, value_2);
        EXPECT_EQ(state().value_3, value_3);
        EXPECT_TRUE(guarded_.is_intact());
    }

    ims_login_state_s &state() { return guarded_.record; }

    Guarded<ims_login_state_s> guarded_;
};

TEST_F(LoginState, AsksWithTheArgumentFirstAndTheApplicationIdSecond) {
    peer().on(kRegisterApplication, reply("(ii)", "(0, 4)"));
    peer().on(kMethod, reply("(iiui)", "(0, 1, 2, 3)"));
    EXPECT_EQ(ims_get_login_state(init(), 2, &state()), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(ii)", "(2, 4)");
    expect_state(1, 2, 3);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(LoginState, TheFirstMemberIsTheResultAndTheOthersFillTheRecord) {
    EXPECT_EQ(ask("(0, 1, 2, 3)"), IMS_ERROR_NONE);
    expect_state(1, 2, 3);
    EXPECT_EQ(ask("(0, -2147483648, 4294967295, 2147483647)"), IMS_ERROR_NONE);
    expect_state(-2147483647 - 1, 4294967295U, 2147483647);
    EXPECT_TRUE(take_log().empty());
}

TEST_F(LoginState, ResultFiveFailsAndIsLogged) {
    EXPECT_EQ(ask("(5, 1, 2, 3)"), IMS_ERROR_OPERATION_FAILED);
    expect_one_line("ims_login.cpp", kFunction, "Failed to get Login Status: [5]");
    // The record has been written before the result was looked at.
    expect_state(1, 2, 3);
}

TEST_F(LoginState, NegativeResultsFailAndAreLoggedAsTheyCame) {
    EXPECT_EQ(ask("(-2147483648, 0, 0, 0)"), IMS_ERROR_OPERATION_FAILED);
    expect_one_line("ims_login.cpp", kFunction, "Failed to get Login Status: [-2147483648]");
}

TEST_F(LoginState, AnyArgumentIsSentUnchecked) {
    for (const std::int32_t value : {-2147483647 - 1, -1, 0, 2147483647}) {
        EXPECT_EQ(ask("(0, 1, 2, 3)", value), IMS_ERROR_NONE);
        expect_sent(requests().back(), "(ii)", "(" + std::to_string(value) + ", 42)");
    }
}

TEST_F(LoginState, TheRecordIsUntouchedWhenNoUsableReplyComes) {
    const std::string before = guarded_.image();
    const std::pair<Answer, int> answers[] = {
        {failure(error_name::kAccessDenied), IMS_ERROR_PERMISSION_DENIED},
        {failure(error_name::kNoReply), IMS_ERROR_OPERATION_FAILED},
        {empty_reply(), IMS_ERROR_OPERATION_FAILED},
        {reply("(iuii)", "(0, 1, 2, 3)"), IMS_ERROR_OPERATION_FAILED},
        {reply("(iiu)", "(0, 1, 2)"), IMS_ERROR_OPERATION_FAILED},
        {reply("(iiuii)", "(0, 1, 2, 3, 4)"), IMS_ERROR_OPERATION_FAILED}};
    for (const auto &[answer, result] : answers) {
        peer().on(kMethod, answer);
        EXPECT_EQ(ims_get_login_state(handle_, 2, &state()), result);
        EXPECT_EQ(guarded_.image(), before);
    }
    EXPECT_EQ(ims_get_login_state(nullptr, 2, &state()), IMS_ERROR_INVALID_PARAMETER);
    set_gate(Gate::kOff);
    EXPECT_EQ(ims_get_login_state(handle_, 2, &state()), IMS_ERROR_NOT_SUPPORTED);
    EXPECT_EQ(guarded_.image(), before);
    EXPECT_TRUE(guarded_.is_intact());
}

} // namespace
} // namespace test
