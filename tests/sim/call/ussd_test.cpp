// SPDX-License-Identifier: Apache-2.0
#include "tests/sim/network.hpp"

#include "sim/bus/wire.hpp"

namespace sim::test {
namespace {

class Ussd : public NetworkTest {
  protected:
    Status request(const std::string &code) { return ussd_.send(0, UssdRequest::kStart, 15, code); }
    Status reply(const std::string &text) { return ussd_.send(0, UssdRequest::kReply, 15, text); }
    Status cancel() { return ussd_.send(0, UssdRequest::kCancel, 15, ""); }
    static std::string indication(int type, int dialogue, const std::string &text) {
        return fmt::format("CallUssdIndication ({}, 15, {}, '{}')", type, dialogue,
                           wire::encode_base64(text));
    }
};

TEST_F(Ussd, ACodeIsAnsweredByTheNetwork) {
    expect_accepted(request("*100#"));
    advance(499ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre(indication(1, 1, "Your balance is 12.50")));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
    expect_accepted(request("*102#"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(1, 2, "+15550100")));
}

TEST_F(Ussd, AMenuAsksUntilItHasItsAnswer) {
    expect_accepted(request("*101#"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(2, 1, "1 Balance\n2 My number\n3 Data")));
    expect_accepted(reply("3"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(2, 1, "1 Today\n2 This month")));
    expect_accepted(reply("1"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(1, 1, "120 MB used today")));
    expect_refused(reply("1"), Result::kWrongState, "asked nothing");
}

TEST_F(Ussd, UnknownCodesAndChoicesEndTheDialogue) {
    expect_accepted(request("*999#"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(4, 1, "Unknown code or choice")));
    expect_accepted(request("*101#"));
    advance(1s);
    forget_events();
    expect_accepted(reply("9"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(4, 2, "Unknown code or choice")));
    expect_accepted(request("*100#"));
}

TEST_F(Ussd, AReplyIsOneChoiceHoweverItIsWritten) {
    expect_accepted(request("*101#"));
    advance(1s);
    forget_events();
    expect_accepted(reply("3/1"));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre(indication(4, 1, "Unknown code or choice")));
}

TEST_F(Ussd, TheNetworkReleasesADialogueThatNobodyContinues) {
    expect_accepted(request("*101#"));
    advance(1s);
    forget_events();
    advance(60s);
    EXPECT_THAT(take(0), ElementsAre(indication(3, 1, "No reply")));
    expect_refused(reply("1"), Result::kWrongState, "asked nothing");
}

TEST_F(Ussd, TheUserCancelsAtAnyMoment) {
    expect_refused(cancel(), Result::kWrongState, "no USSD dialogue");
    expect_accepted(request("*101#"));
    expect_accepted(cancel());
    advance(1min);
    EXPECT_THAT(take(0), IsEmpty());
    expect_accepted(request("*101#"));
    advance(1s);
    expect_accepted(cancel());
    forget_events();
    advance(2min);
    EXPECT_THAT(take(0), IsEmpty());
    expect_refused(cancel(), Result::kWrongState, "no USSD dialogue");
}

TEST_F(Ussd, RequestsThatMakeNoSenseAreRefused) {
    for (const auto *bad : {"", "*", "#", "100", "*100", "*10a#", "100#"})
        expect_refused(request(bad), Result::kInvalidArgument, "is no USSD code");
    expect_refused(ussd_.send(0, UssdRequest{4}, 15, "*100#"), Result::kInvalidArgument, "not 4");
    expect_refused(ussd_.send(0, UssdRequest::kStart, 256, "*100#"), Result::kInvalidArgument,
                   "0 to 255");
    expect_refused(reply("1"), Result::kWrongState, "asked nothing");
    expect_accepted(request("*101#"));
    expect_refused(request("*100#"), Result::kWrongState, "dialogue 1 is open");
    expect_refused(reply("1"), Result::kWrongState, "asked nothing");
    advance(1s);
    expect_refused(request("*100#"), Result::kWrongState, "dialogue 1 is open");
    expect_refused(reply(""), Result::kInvalidArgument, "reply is empty");
}

TEST_F(Ussd, EachSlotHasItsOwnDialogue) {
    expect_accepted(request("*101#"));
    expect_accepted(ussd_.send(1, UssdRequest::kStart, 0, "*102#"));
    advance(1s);
    EXPECT_THAT(take(1), ElementsAre("CallUssdIndication (1, 0, 1, 'KzE1NTUwMTAx')"));
}

} // namespace
} // namespace sim::test
