// SPDX-License-Identifier: Apache-2.0
// Messages and files.
#include "tests/sim/ptt/network.hpp"

namespace sim::test {
namespace {

class PttContentTest : public PttNetwork {
  protected:
    PttMessage message(const std::vector<PttPeer> &targets, std::int32_t notices = 0) {
        PttMessage made;
        made.message_id = "m";
        made.targets = targets;
        made.notices = notices;
        made.text = "Hello";
        made.reference = 9;
        return made;
    }
    PttMessageReceipt send(PttMessage sent) {
        const auto receipt = mail_.send(0, std::move(sent));
        expect_accepted(receipt);
        return receipt ? *receipt : PttMessageReceipt{};
    }
    PttFileOffer file(const std::vector<PttPeer> &targets, std::int32_t size = 1 << 20) {
        PttFileOffer offer;
        offer.targets = targets;
        offer.attributes.name = "map.png";
        offer.attributes.size = size;
        offer.attributes.transfer_id = "t";
        return offer;
    }
    void offer(PttFileOffer offered) { expect_accepted(files_.offer(0, std::move(offered))); }
};

TEST_F(PttContentTest, AMessageReachesTheOtherSlotAndTheSenderIsToldOfIt) {
    const auto receipt = send(message({to("+15550101")}, 3));
    EXPECT_EQ(receipt.number, 1);
    EXPECT_EQ(receipt.parties, 1);
    advance(300ms);
    EXPECT_THAT(
        take(1),
        ElementsAre("PocIncomingMsgInfo (1, <{'uri_type': <int64 0>, 'uri': <'tel:+15550100'>, "
                    "'is_group_uri': <false>}>, 'm', 3, 'text/plain', 'Hello', "
                    "<[{'uri': <'sip:ptt@ims-sim.invalid'>, 'display_name': <'ims-sim'>}]>, '', "
                    "0, 0, 9, <{'uri_type': <int64 0>, 'uri': <'tel:+15550101'>, 'is_group_uri': "
                    "<false>}>)"));
    EXPECT_EQ(*mail_.notify(1, {1, "m", {}, PttNotice::kDelivered}), 1);
    EXPECT_EQ(*mail_.notify(1, {1, "", to("tel:+15550100"), PttNotice::kRead}), 1);
    advance(200ms);
    const auto told = take(0);
    ASSERT_EQ(told.size(), 2u);
    EXPECT_EQ(told[0], "PocMsgNotification (1, <{'uri_type': <int64 0>, 'uri': <'tel:+15550101'>, "
                       "'is_group_uri': <false>}>, 'm', 1, 0, <{'uri_type': <int64 0>, 'uri': "
                       "<'tel:+15550100'>, 'is_group_uri': <false>}>)");
    EXPECT_THAT(told[1], HasSubstr("'m', 2, 0,"));
}

TEST_F(PttContentTest, ANoticeThatIsNotWantedGoesNowhere) {
    send(message({to("+15550101")}, 2));
    advance(300ms);
    EXPECT_EQ(*mail_.notify(1, {1, "", {}, PttNotice::kDelivered}), 0);
    advance(1s);
    EXPECT_THAT(take(0), IsEmpty());
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttContentTest, AMessageToAGroupOrIntoACallReachesAllOthers) {
    EXPECT_EQ(send(message({to(kTeam, true), to("+15550102")})).parties, 2);
    advance(300ms);
    EXPECT_THAT(take(2), ElementsAre(HasSubstr("{'uri': <'sip:team@example.org'>}]>, "
                                               "'sip:team@example.org', 0,")));
    EXPECT_EQ(take(1).size(), 1u);
    connect_team();
    auto sent = message({});
    sent.session = 1;
    const auto receipt = send(sent);
    EXPECT_EQ(receipt.number, 2);
    EXPECT_EQ(receipt.session, 1);
    EXPECT_EQ(receipt.parties, 2);
    advance(300ms);
    EXPECT_THAT(take(1), ElementsAre(HasSubstr("'sip:team@example.org', 1, 0, 9,")));
}

TEST_F(PttContentTest, WhatFailsIsToldEvenWhenNoNoticeIsWanted) {
    struct Row {
        const char *target;
        const char *code;
    };
    expect_accepted(registrations_.enable_flight_mode(3));
    for (const Row &row :
         {Row{"+15550200", "486"}, Row{"+15550201", "408"}, Row{"+15550202", "503"},
          Row{"+15550206", "603"}, Row{"+15550211", "404"}, Row{"+15550103", "480"}}) {
        send(message({to(row.target)}));
        advance(2min);
        EXPECT_THAT(take(0), ElementsAre(HasSubstr(fmt::format("'m', 3, {},", row.code))))
            << row.target;
    }
}

TEST_F(PttContentTest, PartiesOfTheNetworkReadAndOneWritesBack) {
    send(message({to("+15550221"), to("+15550213")}, 3));
    advance(5s);
    EXPECT_EQ(take_only(0, "PocMsgNotification").size(), 4u);
    send(message({to("+15550213")}));
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre(HasSubstr("'Hello'")));
    EXPECT_EQ(*mail_.notify(0, {2, "", {}, PttNotice::kRead}), 0);
}

TEST_F(PttContentTest, MessagesThatMakeNoSenseAreRefused) {
    expect_refused(mail_.send(0, message({})), Result::kInvalidArgument, "nobody");
    expect_refused(mail_.send(0, message({to("bob")})), Result::kInvalidArgument, "no number");
    expect_refused(mail_.send(0, message({to("+15550101")}, 4)), Result::kInvalidArgument, "not 4");
    auto wrong = message({to("+15550101")});
    wrong.lifetime = -1;
    expect_refused(mail_.send(0, wrong), Result::kInvalidArgument, "a lifetime");
    wrong = message({to("+15550101")});
    wrong.originator = to("+15550102");
    expect_refused(mail_.send(0, wrong), Result::kInvalidArgument, "sends as tel:+15550100");
    wrong = message({to("+15550101")});
    wrong.session = 1;
    expect_refused(mail_.send(0, wrong), Result::kInvalidArgument, "both are there");
    wrong.targets.clear();
    expect_refused(mail_.send(0, wrong), Result::kUnknownSession, "session 1");
    place(0, "+15550101", PttCallType::kOneToOne, {.automatic = true, .media = {1, 0, 0, 0}});
    advance(1s);
    expect_refused(mail_.send(0, wrong), Result::kWrongState, "no messages among its media");

    expect_refused(mail_.notify(1, {1, "", {}, PttNotice::kRead}), Result::kUnknownRecord,
                   "received no message 1");
    send(message({to("+15550101")}));
    advance(1s);
    expect_refused(mail_.notify(1, {1, "", {}, PttNotice::kFailed}), Result::kInvalidArgument,
                   "not 3");
    expect_refused(mail_.notify(1, {1, "x", {}, PttNotice::kRead}), Result::kInvalidArgument,
                   "has the id \"m\"");
    expect_refused(mail_.notify(1, {1, "", to("tel:+15550102"), PttNotice::kRead}),
                   Result::kInvalidArgument, "is from tel:+15550100");
    expect_accepted(mail_.notify(1, {1, "", {}, PttNotice::kRead}));
    expect_refused(mail_.notify(1, {1, "", {}, PttNotice::kRead}), Result::kWrongState,
                   "has been sent");
    lose(0);
    expect_refused(mail_.send(0, message({to("+15550101")})), Result::kWrongState, "flight mode");
    expect_refused(mail_.notify(0, {1, "", {}, PttNotice::kRead}), Result::kWrongState, "flight");
}

TEST_F(PttContentTest, AFileOfAMebibyteCrossesWithProgress) {
    const auto receipt = files_.offer(0, file({to("+15550101")}));
    EXPECT_EQ(receipt->number, 1);
    EXPECT_EQ(receipt->count, 1);
    advance(300ms);
    EXPECT_THAT(take(1),
                ElementsAre("PocIncomingFileTransfer (1, <{'uri_type': <int64 0>, 'uri': "
                            "<'tel:+15550100'>, 'is_group_uri': <false>}>, <{'file_name': "
                            "<'map.png'>, 'file_size': <int64 1048576>, 'push': <false>, 'start': "
                            "<int64 0>, 'end': <int64 0>, 'transfer_id': <'t'>}>, 0, <{'uri_type': "
                            "<int64 0>, 'uri': <'tel:+15550101'>, 'is_group_uri': <false>}>)"));
    EXPECT_EQ(files_.accept(1, 0, "t")->count, 1 << 20);
    advance(249ms);
    EXPECT_THAT(take(0), IsEmpty());
    advance(1ms);
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferProgress (1, 131072, 1048576, 1)"));
    EXPECT_THAT(take(1), ElementsAre("PocFileTransferProgress (1, 131072, 1048576, 0)"));
    advance(5s);
    const auto told = take(0);
    ASSERT_EQ(told.size(), 8u);
    EXPECT_EQ(told[6], "PocFileTransferProgress (1, 1048576, 1048576, 1)");
    EXPECT_EQ(told[7], "PocFileTransferTerminated (1, 0, 1)");
    EXPECT_EQ(take(1).back(), "PocFileTransferTerminated (1, 0, 0)");
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttContentTest, PartOfAFileAndTheLargestOneCross) {
    auto part = file({to("+15550221")});
    part.attributes.start = 101;
    part.attributes.end = 300;
    offer(part);
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferProgress (1, 200, 200, 1)",
                                     "PocFileTransferTerminated (1, 0, 1)"));
    offer(file({to("+15550221")}, 0x7fffffff));
    advance(10s);
    EXPECT_EQ(take(0).size(), 17u);
    offer(file({to("+15550221")}, 0));
    advance(5s);
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferProgress (3, 0, 0, 1)",
                                     "PocFileTransferTerminated (3, 0, 1)"));
}

TEST_F(PttContentTest, EachPartyOfATransferAnswersForItself) {
    offer(file({to("+15550101"), to("+15550102"), to("+15550206")}));
    advance(1s);
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferTerminated (1, 1, 3)"));
    expect_accepted(files_.reject(1, 0, "t"));
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferTerminated (1, 1, 1)"));
    EXPECT_EQ(take(1).back(), "PocFileTransferTerminated (1, 1, 0)");
    expect_accepted(files_.accept(2, 0, "t"));
    expect_refused(files_.accept(2, 0, "t"), Result::kWrongState, "has been accepted");
    advance(300ms);
    forget_events();
    expect_accepted(files_.cancel(2, 1));
    EXPECT_THAT(take(2), ElementsAre("PocFileTransferTerminated (1, 2, 0)"));
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferTerminated (1, 3, 2)"));
    EXPECT_EQ(timers_.next_due(), std::nullopt);
}

TEST_F(PttContentTest, TheSenderCancelsForAllOfThem) {
    offer(file({to("+15550101"), to("+15550102")}));
    advance(300ms);
    expect_refused(files_.cancel(1, 1), Result::kWrongState, "reject it");
    expect_accepted(files_.accept(2, 0, "t"));
    forget_events();
    EXPECT_EQ(files_.cancel(0, 1)->count, 2);
    EXPECT_THAT(take(0), ElementsAre("PocFileTransferTerminated (1, 2, 1)",
                                     "PocFileTransferTerminated (1, 2, 2)"));
    EXPECT_THAT(take(1), ElementsAre("PocFileTransferTerminated (1, 3, 0)"));
    EXPECT_THAT(take(2), ElementsAre("PocFileTransferTerminated (1, 3, 0)"));
}

TEST_F(PttContentTest, AFileMayEndInManyWays) {
    expect_accepted(registrations_.enable_flight_mode(3));
    struct Row {
        const char *target;
        int reason;
    };
    for (const Row &row : {Row{"+15550101", 4}, Row{"+15550201", 4}, Row{"+15550200", 1},
                           Row{"+15550202", 6}, Row{"+15550211", 5}, Row{"+15550103", 5}}) {
        offer(file({to(row.target)}));
        advance(2min);
        EXPECT_THAT(take_names(0), testing::SizeIs(1)) << row.target;
        offer(file({to(row.target)}));
        advance(2min);
        EXPECT_THAT(take(0), ElementsAre(testing::EndsWith(fmt::format(", {}, 1)", row.reason))));
    }
    forget_events();
    offer(file({to("+15550101")}));
    advance(300ms);
    expect_accepted(files_.accept(1, 0, "t"));
    expect_accepted(registrations_.enable_flight_mode(1));
    EXPECT_THAT(take(0), ElementsAre(testing::EndsWith(", 6, 1)")));
}

TEST_F(PttContentTest, FilesGoIntoCalls) {
    connect_team();
    auto into = file({});
    into.session = 1;
    EXPECT_EQ(files_.offer(0, into)->count, 2);
    advance(300ms);
    expect_refused(files_.accept(1, 0, "t"), Result::kUnknownRecord, "in session 0");
    expect_accepted(files_.accept(1, 1, "t"));
}

TEST_F(PttContentTest, FilesThatMakeNoSenseAreRefused) {
    auto wrong = file({to("+15550101")});
    wrong.attributes.name.clear();
    expect_refused(files_.offer(0, wrong), Result::kInvalidArgument, "name no file");
    for (const auto &[start, end] :
         {std::pair{-1, 0}, {5, 4}, {0, (1 << 20) + 1}, {(1 << 20) + 1, 0}, {0, -1}}) {
        wrong = file({to("+15550101")});
        wrong.attributes.start = start;
        wrong.attributes.end = end;
        expect_refused(files_.offer(0, wrong), Result::kInvalidArgument, "no part of a file");
    }
    expect_refused(files_.offer(0, file({to("+15550101")}, -1)), Result::kInvalidArgument, "-1");
    expect_refused(files_.offer(0, file({})), Result::kInvalidArgument, "nobody");
    wrong = file({to("+15550101")});
    wrong.originator = to("+15550102");
    expect_refused(files_.offer(0, wrong), Result::kInvalidArgument, "sends as");
    wrong = file({to("+15550101")});
    wrong.session = 1;
    expect_refused(files_.offer(0, wrong), Result::kInvalidArgument, "both are there");
    wrong.targets.clear();
    expect_refused(files_.offer(0, wrong), Result::kUnknownSession, "session 1");
    expect_refused(files_.accept(1, 0, "t"), Result::kUnknownRecord, "nobody has offered");
    expect_refused(files_.reject(1, 0, "t"), Result::kUnknownRecord, "nobody has offered");
    expect_refused(files_.cancel(1, 1), Result::kUnknownRecord, "no transfer 1");
    offer(file({to("+15550101")}));
    expect_refused(files_.offer(2, file({to("+15550101")})), Result::kDuplicate, "\"t\"");
    lose(0);
    expect_refused(files_.offer(0, file({to("+15550101")})), Result::kWrongState, "flight mode");
}

} // namespace
} // namespace sim::test
