// SPDX-License-Identifier: Apache-2.0
// Requests in any order at any time: whatever they are, the server stays in order.
#include "tests/sim/ptt/network.hpp"
#include "tests/sim/settings/directory.hpp"

#include <algorithm>
#include <filesystem>
#include <random>

namespace sim::test {
namespace {

class PttWalk : public PttNetwork, public testing::WithParamInterface<unsigned> {
  protected:
    PttWalk() : random_(GetParam()) {}

    std::int32_t upto(std::int32_t most) {
        return static_cast<std::int32_t>(random_() % static_cast<unsigned>(most + 1));
    }
    bool coin() { return upto(1) == 1; }
    FourIntegers media() { return {upto(1), upto(1), upto(1), upto(1)}; }
    FourIntegers terms() { return {upto(7), upto(1), upto(20), 0}; }
    PttOffer offer() {
        return {upto(5) == 0, coin(), coin(), coin() ? media() : kDefaults, terms(), {}, upto(20)};
    }
    std::string anybody() {
        return coin() ? plan_.number_of(upto(3)) : fmt::format("+155502{:02}", upto(21));
    }
    std::vector<PttUser> users() {
        std::vector<PttUser> some;
        for (std::int32_t i = upto(3); i >= 0; --i)
            some.push_back({to(anybody()), coin()});
        return some;
    }
    // Mostly one that there is.
    std::int32_t session_of(int slot) {
        const auto status = floor_.status(slot, {});
        if (status->empty() || upto(9) == 0)
            return upto(9);
        return (*status)[static_cast<std::size_t>(
                             upto(static_cast<std::int32_t>(status->size()) - 1))]
            .session;
    }
    // What the slot has heard of ends of sessions, in the order of these.
    std::vector<int> ended(int slot) {
        std::vector<int> sessions;
        for (const auto &signal : take_only(slot, "PocCallEnded"))
            sessions.push_back(std::stoi(signal.substr(signal.find('(') + 1)));
        std::ranges::sort(sessions);
        return sessions;
    }
    void call(int slot) {
        constexpr const char *kGroups[] = {kTeam, "sip:all@groups.invalid",
                                           "sip:mixed@groups.invalid"};
        if (coin())
            static_cast<void>(ptt_.make_call(slot, {offer(), anybody(), PttCallType{upto(3)}}));
        else
            static_cast<void>(
                ptt_.make_call(slot, {offer(), kGroups[upto(2)], PttCallType::kGroup}));
    }
    void send_message(int slot, std::int32_t session) {
        PttMessage message;
        message.notices = upto(3);
        message.lifetime = upto(5);
        if (coin())
            message.session = session;
        else
            message.targets = {to(anybody()), to(kTeam, true)};
        count(messages_sent_, mail_.send(slot, message));
    }
    void offer_file(int slot, std::int32_t session) {
        PttFileOffer offer;
        offer.attributes.name = "map.png";
        offer.attributes.size = upto(1 << 20);
        if (coin())
            offer.session = session;
        else
            offer.targets = {to(anybody()), to(kTeam, true)};
        count(files_offered_, files_.offer(slot, offer));
    }
    // The latest one, by all whom it has reached.
    void answer_file(std::int32_t session) {
        const auto id = fmt::format("transfer-{}", files_offered_);
        for (int slot = 0; slot < 4; ++slot)
            for (const std::int32_t where : {0, session})
                if (coin())
                    count(files_accepted_, files_.accept(slot, where, id));
                else
                    static_cast<void>(files_.reject(slot, where, id));
    }
    void start_recording(int slot, std::int32_t session) {
        const auto path = recordings_.file(std::to_string(recorded_ + 1));
        count(recorded_,
              recorder_.start(slot, {session, PttRecordSource{upto(2)}, upto(60), path}));
    }
    void change_recording(int slot, std::int32_t session) {
        if (coin())
            static_cast<void>(recorder_.pause(slot, session));
        else
            static_cast<void>(recorder_.resume(slot, session));
    }
    void end_recordings() {
        for (int slot = 0; slot < 4; ++slot) {
            const auto session = session_of(slot);
            if (upto(2) == 0)
                static_cast<void>(recorder_.stop(slot, session));
            else
                count(recordings_cancelled_, recorder_.cancel(slot, session));
        }
    }
    static void count(int &counter, const auto &answer) { counter += answer ? 1 : 0; }

    void send_or_record(int slot, std::int32_t session) {
        switch (upto(8)) {
        case 0:
            return send_message(slot, session);
        case 1:
            return static_cast<void>(
                mail_.notify(slot, {upto(messages_sent_), {}, {}, PttNotice{1 + upto(1)}}));
        case 2:
            return offer_file(slot, session);
        case 3:
            return answer_file(session);
        case 4:
            return static_cast<void>(files_.cancel(slot, upto(files_offered_)));
        case 5:
        case 6:
            return start_recording(slot, session);
        case 7:
            return change_recording(slot, session);
        default:
            return end_recordings();
        }
    }
    // What is over is not known any longer.
    void expect_nothing_kept(int slot, int sessions) {
        for (std::int32_t session = 1; session <= sessions; ++session)
            expect_refused(recorder_.stop(slot, session), Result::kUnknownSession, "session");
        // A slot gets at most a number for each transfer.
        for (std::int32_t number = 1; number <= files_offered_; ++number)
            expect_refused(files_.cancel(slot, number), Result::kUnknownRecord, "no transfer");
    }
    void step() {
        const int slot = upto(3);
        const std::int32_t session = session_of(slot);
        const PttModifyRequest change{coin(), coin(), session, 0, media(), terms()};
        switch (upto(22)) {
        case 0:
        case 1:
            return call(slot);
        case 2:
            return static_cast<void>(ptt_.make_ad_hoc_call(slot, {offer(), {}, users()}));
        case 3:
        case 4:
        case 5:
            return static_cast<void>(ptt_.answer(slot, change));
        case 6:
            return static_cast<void>(ptt_.reject(slot, session, PttRejectReason{upto(1)}));
        case 7:
            return static_cast<void>(ptt_.end(slot, session, PttEndScope{upto(1)}));
        case 8:
            return static_cast<void>(ptt_.set_channel(slot, upto(1), PttChannelMode{upto(1)}));
        case 9:
        case 10:
            return static_cast<void>(floor_.request(slot, {session, {}, upto(7), upto(9), {}}));
        case 11:
            return static_cast<void>(floor_.release(slot, session));
        case 12:
            return static_cast<void>(ptt_changes_.modify(slot, change));
        case 13:
            return static_cast<void>(coin() ? ptt_changes_.accept(slot, change)
                                            : ptt_changes_.reject(slot, session));
        case 14:
            return static_cast<void>(ptt_.add_users(slot, {session, coin(), users(), 0, {}}));
        case 15:
            return static_cast<void>(ptt_.remove_users(slot, session, {to(anybody())}));
        case 16:
            return static_cast<void>(ptt_.convert_to_crisis(slot, session));
        case 17:
            return static_cast<void>(ptt_.keep_alive(slot, upto(30)));
        case 18:
            if (upto(4) == 0)
                static_cast<void>(registrations_.enable_flight_mode(slot));
            return registrations_.switch_on(upto(3));
        default:
            return send_or_record(slot, session);
        }
    }

    std::mt19937 random_;
    TemporaryDirectory recordings_;
    int messages_sent_ = 0;
    int files_offered_ = 0;
    int files_accepted_ = 0;
    int recorded_ = 0;
    int recordings_cancelled_ = 0;
};

TEST_P(PttWalk, NothingIsLeftWhenAllHaveGone) {
    for (int i = 0; i < 3000; ++i) {
        step();
        advance(std::chrono::milliseconds(upto(800)));
        for (int slot = 0; slot < 4; ++slot) {
            const auto status = floor_.status(slot, {});
            ASSERT_TRUE(status);
            ASSERT_LE(status->size(), 4u);
        }
    }
    for (int slot = 0; slot < 4; ++slot)
        registrations_.switch_on(slot);
    advance(300ms);
    for (int slot = 0; slot < 4; ++slot) {
        while (!floor_.status(slot, {})->empty()) {
            const auto session = floor_.status(slot, {})->front().session;
            if (!ptt_.end(slot, session, PttEndScope::kLeave))
                expect_accepted(ptt_.reject(slot, session, PttRejectReason::kDecline));
        }
        expect_accepted(ptt_.set_channel(slot, 0, PttChannelMode::kTalkAndListen));
        expect_accepted(ptt_.keep_alive(slot, 0));
    }
    advance(2min); // offers of files lapse, parties answer
    EXPECT_EQ(timers_.next_due(), std::nullopt);
    EXPECT_THAT((std::vector{messages_sent_, files_offered_, files_accepted_, recorded_,
                             recordings_cancelled_}),
                testing::Each(testing::Gt(0))); // or the walk has left something out
    const auto kept = std::distance(std::filesystem::directory_iterator(recordings_.path()), {});
    EXPECT_EQ(kept, recorded_ - recordings_cancelled_);
    // Each session has its end, told once.
    for (int slot = 0; slot < 4; ++slot) {
        const auto sessions = ended(slot);
        EXPECT_GT(sessions.size(), 50u); // or the walk has led nowhere
        expect_nothing_kept(slot, static_cast<int>(sessions.size()));
        for (std::size_t i = 0; i < sessions.size(); ++i)
            ASSERT_EQ(sessions[i], static_cast<int>(i) + 1);
    }
}

INSTANTIATE_TEST_SUITE_P(Seeds, PttWalk, testing::Range(1u, 9u));

} // namespace
} // namespace sim::test
