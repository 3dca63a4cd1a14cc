// SPDX-License-Identifier: Apache-2.0
// Short messages on their way: what is refused, acknowledged, delivered and reported.
#include "tests/sim/sms/network.hpp"

#include "sim/sms/interface.hpp"

namespace sim::test {
namespace {

TEST_F(Messages, AreAcknowledgedAndDelivered) {
    const auto receipt = try_send(0, submit_to(kSlot1, "Hello", 42));
    ASSERT_TRUE(receipt);
    EXPECT_EQ(receipt->number, 1);
    EXPECT_EQ(receipt->reference, 42);
    advance(299ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    const auto ack = acknowledgement(0);
    EXPECT_EQ(ack.number, 1);
    EXPECT_EQ(ack.cause, 0);
    EXPECT_EQ(ack.reference, 42);
    EXPECT_FALSE(ack.try_again);
    EXPECT_EQ(failure_cause(ack), std::nullopt);
    advance(199ms);
    EXPECT_THAT(take(1), IsEmpty());
    advance(1ms);
    const auto incoming = told<IncomingSms>(1);
    ASSERT_EQ(incoming.size(), 1u);
    EXPECT_EQ(incoming[0].number, 1);
    const auto deliver = must(tpdu::decode_deliver(incoming[0].tpdu));
    EXPECT_EQ(tpdu::to_text(deliver.originator), "+15550100");
    EXPECT_EQ(must(tpdu::decode_text(deliver.data_coding, deliver.user_data.body)), "Hello");
    EXPECT_EQ(tpdu::to_text(deliver.service_centre_time), "2031-05-06T07:08:09+00:00");
    EXPECT_FALSE(deliver.more_messages);
    EXPECT_FALSE(deliver.status_report_indication);
    // Nobody but these two was told anything.
    EXPECT_THAT(take(2), IsEmpty());
    EXPECT_THAT(take(3), IsEmpty());
}

TEST_F(Messages, CarryOverWhatBelongsToTheReceiver) {
    auto submit = submit_to(kSlot1, "", 1);
    submit.protocol_identifier = 0x41;
    submit.data_coding = 0xF6; // 8-bit data, class 2
    submit.reply_path = true;
    submit.status_report_request = true;
    submit.user_data.header = tpdu::UserDataHeader{{{0x05, {0x0B, 0x84, 0x23, 0xF0}}}};
    submit.user_data.body = {0x00, 0xFF, 0x7F, 0x80};
    send_and_deliver(0, submit);
    const auto delivers = received(1);
    ASSERT_EQ(delivers.size(), 1u);
    EXPECT_EQ(delivers[0].protocol_identifier, 0x41);
    EXPECT_EQ(delivers[0].data_coding, 0xF6);
    EXPECT_TRUE(delivers[0].reply_path);
    EXPECT_TRUE(delivers[0].status_report_indication);
    EXPECT_EQ(delivers[0].user_data, submit.user_data);
}

TEST_F(Messages, OfSeveralPartsArriveInOrderAndWhole) {
    std::string text;
    for (int i = 0; text.size() < 400; ++i)
        text += fmt::format("{} bottles, ", i);
    const auto parts = submits_to(kSlot1, text);
    ASSERT_EQ(parts.size(), 3u);
    for (const auto &part : parts)
        send(0, part);
    advance(500ms);
    tpdu::Reassembler reassembler;
    std::optional<tpdu::CompleteMessage> whole;
    for (const auto &deliver : received(1)) {
        EXPECT_FALSE(whole);
        whole = reassembler.add(deliver);
    }
    ASSERT_TRUE(whole);
    EXPECT_EQ(must(whole->text()), text);
    EXPECT_EQ(told<SendSmsAck>(0).size(), 3u);
}

TEST_F(Messages, InUcs2AndToOneself) {
    send_and_deliver(0, submit_to("+15550100", "Привет \xF0\x9F\x98\x80"));
    EXPECT_THAT(texts(0), ElementsAre("Привет \xF0\x9F\x98\x80"));
}

TEST_F(Messages, ReachASlotUnderItsNumberInNationalFormToo) {
    send_and_deliver(0, submit_to("15550101", "Hi"));
    EXPECT_THAT(texts(1), ElementsAre("Hi"));
}

TEST_F(Messages, SayWhenMoreFollow) {
    auto first = request(submit_to(kSlot1, "one"));
    first.option = 1;
    expect_accepted(centre_.submit(0, first));
    send(0, submit_to(kSlot1, "two"));
    advance(500ms);
    const auto delivers = received(1);
    ASSERT_EQ(delivers.size(), 2u);
    EXPECT_TRUE(delivers[0].more_messages);
    EXPECT_FALSE(delivers[1].more_messages);
}

TEST_F(Messages, ThatAreMalformedAreRefused) {
    const auto good = request(submit_to(kSlot1, "Hello"));
    const auto refused = [&](const SubmitRequest &bad, const std::string &why) {
        expect_refused(centre_.submit(0, bad), Result::kInvalidArgument, why);
    };
    auto bad = good;
    bad.length += 1;
    refused(bad, fmt::format("the length says {}, and the TPDU has {} octets", bad.length,
                             bad.tpdu.size()));
    bad.length = -1;
    refused(bad, "the length says -1");
    bad = good;
    bad.tpdu.pop_back();
    bad.length -= 1;
    refused(bad, "this is no SMS-SUBMIT: TP-UD");
    bad = {};
    refused(bad, "this is no SMS-SUBMIT");
    bad = good;
    bad.tpdu[0] = 0x00; // a delivery report
    refused(bad, "this is no SMS-SUBMIT");
    bad = good;
    bad.option = 2;
    refused(bad, "not 2");
    for (const tpdu::Octets &address :
         {tpdu::Octets{0x07, 0x91, 0x51}, tpdu::Octets{0x01}, tpdu::Octets{0x02, 0x91, 0x21, 0x43},
          tpdu::Octets{0x10, 0x91}}) {
        bad = good;
        bad.service_centre = address;
        refused(bad, "the service centre's address is malformed: ");
    }
    // Octets of an absolute validity: 2031-05-06T07:08:09, digits swapped.
    struct Row {
        std::size_t octet;
        std::uint8_t value;
        const char *time;
    };
    constexpr std::size_t kValidity = 10; // behind eight digits, TP-PID and TP-DCS
    auto timed = submit_to(kSlot1, "Hello");
    timed.validity = tpdu::Timestamp{2031, 5, 6, 7, 8, 9, 0};
    for (const auto &[octet, value, time] : {
             Row{1, 0x99, "2031-99-06T07:08:09+00:00"},
             Row{1, 0x00, "2031-00-06T07:08:09+00:00"},
             Row{2, 0x00, "2031-05-00T07:08:09+00:00"},
             Row{2, 0x23, "2031-05-32T07:08:09+00:00"},
             Row{3, 0x42, "2031-05-06T24:08:09+00:00"},
             Row{4, 0x06, "2031-05-06T07:60:09+00:00"},
             Row{5, 0x06, "2031-05-06T07:08:60+00:00"},
         }) {
        bad = request(timed);
        bad.tpdu.at(kValidity + octet) = value;
        refused(bad, fmt::format("the validity ends at {}, which is no date and time", time));
    }
    advance(1h);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_THAT(take(1), IsEmpty());
    // Numbers are not used up by what is refused.
    EXPECT_EQ(centre_.submit(0, request(timed))->number, 1);
    EXPECT_EQ(centre_.submit(0, good)->number, 2);
}

TEST_F(Messages, TakeAnyServiceCentreAndNone) {
    auto message = request(submit_to(kSlot1, "Hello"));
    for (const tpdu::Octets &address :
         {tpdu::Octets{}, tpdu::Octets{0x00}, tpdu::Octets{0x01, 0x91},
          tpdu::Octets{0x06, 0x91, 0x51, 0x55, 0x05, 0x01, 0xF0}}) {
        message.service_centre = address;
        expect_accepted(centre_.submit(0, message));
    }
    advance(1s);
    EXPECT_EQ(texts(1).size(), 4u);
}

TEST_F(Messages, ThatAreReportedOnGiveTheSenderAStatusReport) {
    send_and_deliver(0, asking(submit_to(kSlot1, "Hello", 9)));
    advance(5s);
    EXPECT_THAT(statuses(0), IsEmpty());
    EXPECT_EQ(*try_report(1), 1);
    EXPECT_EQ(take(1).back(), "DeliveryReportAck (1, 0)");
    advance(199ms);
    EXPECT_THAT(statuses(0), IsEmpty());
    advance(1ms);
    const auto reports = status_reports(0);
    ASSERT_EQ(reports.size(), 1u);
    EXPECT_EQ(reports[0].status, 0x00);
    EXPECT_EQ(reports[0].message_reference, 9);
    EXPECT_EQ(tpdu::to_text(reports[0].recipient), kSlot1);
    EXPECT_EQ(tpdu::to_text(reports[0].service_centre_time), "2031-05-06T07:08:09+00:00");
    EXPECT_EQ(tpdu::to_text(reports[0].discharge_time), "2031-05-06T07:08:14+00:00");
    expect_refused(try_report(1), Result::kWrongState, "no message waits for a report");
}

TEST_F(Messages, ThatDoNotAskForAStatusReportGetNone) {
    send_and_deliver(0, submit_to(kSlot1, "Hello"));
    EXPECT_TRUE(try_report(1));
    advance(1h);
    EXPECT_THAT(statuses(0), IsEmpty());
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(Messages, AReportOfFailureReachesTheSender) {
    send_and_deliver(0, asking(submit_to(kSlot1, "Hello")));
    EXPECT_TRUE(try_report(1, 22));
    EXPECT_EQ(take(1).back(), "DeliveryReportAck (1, 22)");
    advance(1s);
    EXPECT_THAT(statuses(0), ElementsAre(0x65));
}

TEST_F(Messages, AreGivenUpWhenNoReportComes) {
    send_and_deliver(0, asking(submit_to(kSlot1, "Hello")));
    advance(29s);
    EXPECT_THAT(statuses(0), IsEmpty());
    advance(2s);
    EXPECT_THAT(statuses(0), ElementsAre(0x62));
    expect_refused(try_report(1), Result::kWrongState, "no message waits");
}

TEST_F(Messages, AReportNamesItsMessage) {
    for (const auto *text : {"one", "two", "three"})
        send_and_deliver(0, submit_to(kSlot1, text));
    EXPECT_EQ(*try_report(1, 0, 2), 2);
    expect_refused(try_report(1, 0, 2), Result::kWrongState, "no message 2 waits");
    expect_refused(try_report(1, 0, -1), Result::kWrongState, "no message -1 waits");
    EXPECT_EQ(*try_report(1), 1);
    EXPECT_EQ(*try_report(1), 3);
    expect_refused(try_report(0), Result::kWrongState, "no message waits");
}

TEST_F(Messages, AReportThatIsMalformedIsRefused) {
    send_and_deliver(0, submit_to(kSlot1, "Hello"));
    const auto refused = [&](const ReportRequest &bad, const std::string &why) {
        expect_refused(centre_.report(1, bad), Result::kInvalidArgument, why);
    };
    refused({128, {}, 0, 0}, "not 128");
    refused({-1, {}, 0, 0}, "not -1");
    refused({0, {0x00, 0x00}, 3, 0}, "the length says 3, and the TPDU has 2 octets");
    refused({0, {0x00}, 1, 0}, "this is no SMS-DELIVER-REPORT of success");
    refused({0, {0x01, 0x00}, 2, 0}, "this is no SMS-DELIVER-REPORT of success");
    // A report of failure has its cause.
    refused({22, {0x00, 0x00}, 2, 0}, "this is no SMS-DELIVER-REPORT of failure");
    EXPECT_TRUE(centre_.report(1, {0, {}, 0, 0}));
}

TEST_F(Messages, NumbersHaveTheirMeanings) {
    struct Row {
        const char *number;
        int cause;
        std::optional<std::uint8_t> failure_cause;
        bool try_again;
        std::vector<int> statuses;
    };
    const Row rows[] = {
        {"+15559999", 0, std::nullopt, false, {0x00}},
        {"+15550200", 42, 0xC0, true, {}},
        {"+15550202", 38, 0xC2, true, {}},
        {"+15550206", 0, std::nullopt, false, {0x42}},
        {"+15550211", 1, 0xC3, false, {}},
        {"*100#", 1, 0xC3, false, {}},
        {"112", 0, std::nullopt, false, {0x00}},
    };
    for (const auto &row : rows) {
        send(0, asking(submit_to(row.number, "Hello")));
        advance(300ms);
        const auto ack = acknowledgement(0);
        EXPECT_EQ(ack.cause, row.cause) << row.number;
        EXPECT_EQ(failure_cause(ack), row.failure_cause) << row.number;
        EXPECT_EQ(ack.try_again, row.try_again) << row.number;
        advance(2s);
        EXPECT_EQ(statuses(0), row.statuses) << row.number;
    }
    auto name = submit_to(kSlot1, "Hello");
    name.destination = must(tpdu::alphanumeric_address("Weather"));
    send(0, name);
    advance(300ms);
    EXPECT_EQ(acknowledgement(0).cause, 1);
}

TEST_F(Messages, OnePartySendsBackWhatItGets) {
    send(0, submit_to("+15550213", "Echo?"));
    advance(1799ms);
    EXPECT_THAT(texts(0), IsEmpty());
    advance(1ms);
    const auto delivers = received(0);
    ASSERT_EQ(delivers.size(), 1u);
    EXPECT_EQ(tpdu::to_text(delivers[0].originator), "+15550213");
    EXPECT_EQ(must(tpdu::decode_text(delivers[0].data_coding, delivers[0].user_data.body)),
              "Echo?");
    EXPECT_EQ(*try_report(0), 1);
}

TEST_F(Messages, SignalsHaveTheirMembersInOrder) {
    const auto printed = [](const MessageEvent &event) {
        const Signal signal = to_signal(event);
        return fmt::format("{} {}", signal.member, signal.body.print());
    };
    EXPECT_EQ(printed(IncomingSms{{1, 2, 3}, 4, IncomingKind::kStatusReport}),
              "IncomingSms (3, 'AQID', 4, 1)");
    EXPECT_EQ(printed(SendSmsAck{1, 2, 3, {4, 5}, true}), "SendSmsAck (1, 2, 3, 'BAU=', 2, 1)");
    EXPECT_EQ(printed(DeliveryReportAck{1, 2}), "DeliveryReportAck (1, 2)");
}

} // namespace
} // namespace sim::test
