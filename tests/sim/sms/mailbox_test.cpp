// SPDX-License-Identifier: Apache-2.0
// Short messages that wait: for a slot that is not there, until they expire, at another pace.
#include "tests/sim/sms/network.hpp"

namespace sim::test {
namespace {

TEST_F(Messages, AreRefusedInFlightMode) {
    send_and_deliver(1, submit_to("+15550100", "before"));
    lose(0);
    expect_refused(try_send(0, submit_to(kSlot1, "Hello")), Result::kWrongState, "flight mode");
    expect_refused(try_report(0), Result::kWrongState, "flight mode");
}

TEST_F(Messages, OvertakenByFlightModeAreNotSent) {
    send(0, submit_to(kSlot1, "Hello"));
    lose(0);
    advance(300ms);
    const auto ack = acknowledgement(0);
    EXPECT_EQ(ack.cause, 38);
    EXPECT_TRUE(ack.try_again);
    EXPECT_EQ(failure_cause(ack), 0xFF);
    advance(1h);
    EXPECT_THAT(texts(1), IsEmpty());
}

TEST_F(Messages, ToASlotInFlightModeWaitInOrder) {
    lose(1);
    send_and_deliver(0, submit_to(kSlot1, "one"));
    send_and_deliver(2, submit_to(kSlot1, "two"));
    EXPECT_EQ(acknowledgement(0).cause, 0);
    advance(1h);
    EXPECT_THAT(texts(1), IsEmpty());
    registrations_.switch_on(1);
    advance(299ms);
    EXPECT_THAT(texts(1), IsEmpty());
    advance(1ms);
    const auto delivers = received(1);
    ASSERT_EQ(delivers.size(), 2u);
    EXPECT_EQ(tpdu::to_text(delivers[0].originator), "+15550100");
    EXPECT_TRUE(delivers[0].more_messages);
    EXPECT_EQ(tpdu::to_text(delivers[1].originator), "+15550102");
    EXPECT_FALSE(delivers[1].more_messages);
    // They say when they were sent.
    EXPECT_EQ(delivers[0].service_centre_time.hour, 7);
}

TEST_F(Messages, StatusReportsWaitForASenderInFlightMode) {
    send_and_deliver(0, asking(submit_to(kSlot1, "Hello")));
    lose(0);
    EXPECT_TRUE(try_report(1));
    advance(1h);
    EXPECT_THAT(statuses(0), IsEmpty());
    come_back(0);
    EXPECT_THAT(statuses(0), ElementsAre(0x00));
}

TEST_F(Messages, NotReportedOnBeforeFlightModeComeAgain) {
    send_and_deliver(0, asking(submit_to(kSlot1, "one")));
    send_and_deliver(0, submit_to(kSlot1, "two"));
    EXPECT_EQ(*try_report(1, 0, 2), 2);
    lose(1);
    come_back(1);
    const auto again = told<IncomingSms>(1);
    ASSERT_EQ(again.size(), 1u);
    EXPECT_EQ(again[0].number, 3);
    expect_refused(try_report(1, 0, 1), Result::kWrongState, "no message 1 waits");
    EXPECT_TRUE(try_report(1, 0, 3));
    advance(1s);
    EXPECT_THAT(statuses(0), ElementsAre(0x00));
    // A status report is not repeated.
    lose(0);
    come_back(0);
    EXPECT_THAT(statuses(0), IsEmpty());
}

TEST_F(Messages, AreKeptForTheirValidityPeriod) {
    lose(1);
    auto submit = asking(submit_to(kSlot1, "late"));
    submit.validity = tpdu::RelativeValidity{0}; // 5 minutes
    send(0, submit);
    advance(5min);
    EXPECT_THAT(statuses(0), IsEmpty());
    advance(1s);
    EXPECT_THAT(statuses(0), ElementsAre(0x46));
    come_back(1);
    EXPECT_THAT(texts(1), IsEmpty());
}

TEST_F(Messages, AreKeptForTwoDaysWithoutOne) {
    lose(1);
    send(0, asking(submit_to(kSlot1, "late")));
    advance(47h);
    EXPECT_THAT(statuses(0), IsEmpty());
    advance(2h);
    EXPECT_THAT(statuses(0), ElementsAre(0x46));
    come_back(1);
    EXPECT_THAT(texts(1), IsEmpty());
    EXPECT_THAT(take(1), ElementsAre(testing::StartsWith("RegistrationStatus (true")));
}

TEST_F(Messages, WhoseTimeIsPastAreNotDelivered) {
    auto submit = asking(submit_to(kSlot1, "late"));
    submit.validity = tpdu::Timestamp{2031, 5, 6, 7, 8, 0, 0};
    send(0, submit);
    advance(1s);
    EXPECT_THAT(texts(1), IsEmpty());
    EXPECT_THAT(statuses(0), ElementsAre(0x46));
}

TEST_F(Messages, ToBeTriedOnceAreNotStored) {
    lose(1);
    for (const auto *number : {kSlot1, "+15550201"}) {
        auto submit = asking(submit_to(number, "now or never"));
        submit.validity = tpdu::EnhancedValidity{true, {}};
        send(0, submit);
        advance(1s);
        EXPECT_THAT(statuses(0), ElementsAre(0x43)) << number;
    }
    come_back(1);
    EXPECT_THAT(texts(1), IsEmpty());
}

TEST_F(Messages, ThatAreDeliveredDoNotExpire) {
    auto submit = asking(submit_to(kSlot1, "in time"));
    submit.validity = tpdu::EnhancedValidity{false, tpdu::SecondsValidity{10}};
    send_and_deliver(0, submit);
    EXPECT_THAT(texts(1), ElementsAre("in time"));
    advance(20s);
    EXPECT_TRUE(try_report(1));
    advance(1s);
    EXPECT_THAT(statuses(0), ElementsAre(0x00));
}

TEST_F(Messages, ThatExpiredMeanwhileDoNotComeAgain) {
    auto submit = asking(submit_to(kSlot1, "in time"));
    submit.validity = tpdu::EnhancedValidity{false, tpdu::SecondsValidity{10}};
    send_and_deliver(0, submit);
    advance(20s);
    lose(1);
    come_back(1);
    EXPECT_THAT(texts(1), IsEmpty());
    EXPECT_THAT(statuses(0), ElementsAre(0x46));
}

TEST_F(Messages, ToSomebodyWhoIsNeverReachableExpire) {
    auto submit = asking(submit_to("+15550201", "Hello?"));
    submit.validity = tpdu::EnhancedValidity{false, tpdu::SecondsValidity{60}};
    send(0, submit);
    advance(60s);
    EXPECT_THAT(statuses(0), IsEmpty());
    advance(1s);
    EXPECT_THAT(statuses(0), ElementsAre(0x46));
}

TEST_F(Messages, DuplicatesAreRefusedWhenAskedTo) {
    auto submit = submit_to(kSlot1, "Hello", 5);
    submit.reject_duplicates = true;
    send_and_deliver(0, submit);
    EXPECT_EQ(acknowledgement(0).cause, 0);
    send_and_deliver(0, submit);
    const auto ack = acknowledgement(0);
    EXPECT_EQ(ack.cause, 21);
    EXPECT_EQ(failure_cause(ack), 0xC5);
    EXPECT_EQ(texts(1).size(), 1u);

    // Others are not duplicates: of another sender, reference or destination, or not to be refused.
    send_and_deliver(2, submit);
    EXPECT_EQ(acknowledgement(2).cause, 0);
    auto other = submit;
    other.message_reference = 6;
    send_and_deliver(0, other);
    EXPECT_EQ(acknowledgement(0).cause, 0);
    other = submit;
    other.destination = must(tpdu::number_address("+15550102"));
    send_and_deliver(0, other);
    EXPECT_EQ(acknowledgement(0).cause, 0);
    other = submit;
    other.reject_duplicates = false;
    send_and_deliver(0, other);
    EXPECT_EQ(acknowledgement(0).cause, 0);
}

TEST_F(Messages, ADuplicateOfWhatIsGoneIsNone) {
    auto submit = submit_to(kSlot1, "Hello", 5);
    submit.reject_duplicates = true;
    send_and_deliver(0, submit);
    EXPECT_TRUE(try_report(1));
    send_and_deliver(0, submit);
    for (const auto &ack : told<SendSmsAck>(0))
        EXPECT_EQ(ack.cause, 0);
    EXPECT_EQ(texts(1).size(), 2u);
}

// A network at another pace.
class Pace : public testing::Test {
  protected:
    explicit Pace(double speed)
        : timers_(speed, [this] { return now_; }),
          network_({.numbers = {"+15550100", "+15550101"}, .epoch = 1935817689}, timers_,
                   {.registration = [](int, const RegistrationEvent &) {},
                    .login = {},
                    .call = {},
                    .sms =
                        [this](int, const MessageEvent &event) {
                            if (const auto *incoming = std::get_if<IncomingSms>(&event))
                                incoming_.push_back(*incoming);
                        },
                    .ptt = {}}) {
        registrations_.start();
        timers_.run_due();
    }
    void advance(std::chrono::nanoseconds by) {
        now_ += by;
        timers_.run_due();
    }
    void send(const tpdu::Submit &submit) {
        const auto octets = must(tpdu::encode(submit));
        ASSERT_TRUE(centre_.submit(0, {octets, static_cast<std::int32_t>(octets.size()), {}, 0}));
    }

    std::chrono::nanoseconds now_{0};
    Timers timers_;
    std::vector<IncomingSms> incoming_;
    Network network_;
    Registrations &registrations_ = network_.registrations;
    ServiceCentre &centre_ = network_.centre;
};

class Fast : public Pace {
  protected:
    Fast() : Pace(1000) {}
};

TEST_F(Fast, TheServiceCentresClockRunsWithTheNetwork) {
    advance(10s); // 10,000 s there
    send(submit_to("+15550101", "Hello"));
    advance(1ms);
    advance(1ms);
    ASSERT_EQ(incoming_.size(), 1u);
    EXPECT_EQ(tpdu::to_text(must(tpdu::decode_deliver(incoming_[0].tpdu)).service_centre_time),
              "2031-05-06T09:54:49+00:00");
}

TEST_F(Fast, ValidityPassesWithTheNetwork) {
    advance(10ms);
    ASSERT_TRUE(registrations_.enable_flight_mode(1));
    auto submit = submit_to("+15550101", "Hello");
    submit.status_report_request = true;
    submit.validity = tpdu::RelativeValidity{0}; // 5 minutes, 0.3 s here
    send(submit);
    for (int i = 0; i < 299; ++i)
        advance(1ms);
    EXPECT_TRUE(incoming_.empty());
    advance(2ms);
    advance(1ms);
    ASSERT_EQ(incoming_.size(), 1u);
    EXPECT_EQ(must(tpdu::decode_status_report(incoming_[0].tpdu)).status, 0x46);
}

class AtOnce : public Pace {
  protected:
    AtOnce() : Pace(0) {}
};

TEST_F(AtOnce, EverythingHappensAtOnceButExpiry) {
    ASSERT_TRUE(registrations_.enable_flight_mode(1));
    auto submit = submit_to("+15550101", "Hello");
    submit.validity = tpdu::RelativeValidity{0};
    send(submit);
    advance(4min);
    EXPECT_TRUE(incoming_.empty());
    registrations_.switch_on(1);
    advance(1ns);
    ASSERT_EQ(incoming_.size(), 1u);
    EXPECT_EQ(incoming_[0].kind, IncomingKind::kMessage);
}

} // namespace
} // namespace sim::test
