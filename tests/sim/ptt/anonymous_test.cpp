// SPDX-License-Identifier: Apache-2.0
// Messages and files of one whose uri the others are not to know.
#include "tests/sim/ptt/network.hpp"

namespace sim::test {
namespace {

class PttAnonymousTest : public PttNetwork {
  protected:
    // Session 1 of the slots 0 and 1 and, anonymous, 2.
    PttAnonymousTest() {
        expect_accepted(
            ptt_.make_ad_hoc_call(0, {{}, {}, {{to("+15550101"), false}, {to(kNumber), true}}}));
        advance(700ms);
        answer_all({1, 2});
    }
    static PttMessage message() {
        PttMessage made;
        made.session = 1;
        made.message_id = "m";
        made.notices = 3;
        made.text = "Hello";
        return made;
    }
    // All that has come to the slots that are not to know.
    std::vector<std::string> take_others() {
        auto all = take(0);
        for (auto &signal : take(1))
            all.push_back(std::move(signal));
        return all;
    }
    static auto has_no_number() { return testing::Each(testing::Not(HasSubstr(kNumber))); }

    static constexpr const char *kNumber = "+15550102";
    static constexpr const char *kNobody = "'uri': <'sip:anonymous@anonymous.invalid'>";
};

TEST_F(PttAnonymousTest, WhatItSendsIntoTheSessionHidesItsUri) {
    expect_accepted(mail_.send(2, message()));
    PttFileOffer file;
    file.session = 1;
    file.attributes.name = "map.png";
    expect_accepted(files_.offer(2, file));
    advance(300ms);
    const auto told = take_others();
    EXPECT_EQ(told.size(), 4u);
    EXPECT_THAT(told, testing::Each(HasSubstr(kNobody)));
    EXPECT_THAT(told, has_no_number());
    // Its message may be told by what the reader has seen of it, and notices still find their way.
    expect_accepted(
        mail_.notify(1, {1, "m", to("sip:anonymous@anonymous.invalid"), PttNotice::kRead}));
    advance(200ms);
    EXPECT_THAT(take(2), ElementsAre(HasSubstr("PocMsgNotification (1, <{'uri_type': <int64 0>, "
                                               "'uri': <'tel:+15550101'>")));
}

TEST_F(PttAnonymousTest, WhatIsSentToItHidesItsUri) {
    expect_accepted(mail_.send(0, message()));
    advance(300ms);
    expect_accepted(mail_.notify(2, {1, "", {}, PttNotice::kRead}));
    advance(200ms);
    EXPECT_THAT(take_only(0, "PocMsgNotification"), ElementsAre(HasSubstr(kNobody)));
    // The same when the message does not get there.
    expect_accepted(mail_.send(0, message()));
    lose(2);
    advance(300ms);
    const auto told = take_others();
    EXPECT_THAT(told, testing::Contains(testing::AllOf(HasSubstr("PocMsgNotification"),
                                                       HasSubstr(kNobody), HasSubstr(", 480,"))));
    EXPECT_THAT(told, has_no_number());
}

TEST_F(PttAnonymousTest, OutsideTheSessionItIsKnown) {
    auto sent = message();
    sent.session = 0;
    sent.targets = {to("+15550100")};
    expect_accepted(mail_.send(2, sent));
    advance(300ms);
    EXPECT_THAT(take(0), ElementsAre(HasSubstr("'uri': <'tel:+15550102'>")));
}

} // namespace
} // namespace sim::test
