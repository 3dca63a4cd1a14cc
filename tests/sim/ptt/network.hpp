// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/sim/network.hpp"

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace sim::test {

inline constexpr FourIntegers kDefaults{};

// The four slots of the network and a push-to-talk server. One more group, "sip:team@example.org",
// has the slots 0 to 2.
class PttNetwork : public NetworkTest {
  protected:
    PttNetwork() {
        directory_.add_groups([](std::string_view uri) -> std::optional<std::vector<std::string>> {
            if (uri != kTeam)
                return std::nullopt;
            return std::vector<std::string>{"tel:+15550100", "tel:+15550101", "tel:+15550102"};
        });
    }

    static constexpr const char *kTeam = "sip:team@example.org";

    // What becomes of a call: the names of the signals without their members.
    std::vector<std::string> take_names(int slot) {
        std::vector<std::string> names;
        for (const auto &signal : take(slot))
            names.push_back(signal.substr(0, signal.find(' ')));
        return names;
    }
    // The signals whose names begin so; the others are forgotten.
    std::vector<std::string> take_only(int slot, const std::string &prefix) {
        std::vector<std::string> found;
        for (const auto &signal : take(slot))
            if (signal.starts_with(prefix))
                found.push_back(signal);
        return found;
    }
    std::vector<std::string> take_floor(int slot) { return take_only(slot, "PocCallFloor"); }

    Answer<std::int32_t> try_call(int slot, const std::string &called,
                                  PttCallType type = PttCallType::kOneToOne, PttOffer offer = {}) {
        return ptt_.make_call(slot, {std::move(offer), called, type});
    }
    std::int32_t place(int slot, const std::string &called,
                       PttCallType type = PttCallType::kOneToOne, PttOffer offer = {}) {
        const auto session = try_call(slot, called, type, std::move(offer));
        expect_accepted(session);
        return session ? *session : 0;
    }
    void answer_all(const std::vector<int> &slots, std::int32_t session = 1) {
        for (const int slot : slots)
            expect_accepted(ptt_.answer(slot, {false, false, session, 0, {}, {}}));
        forget_events();
    }
    // Session 1 of the slots 0 and 1.
    void connect_two() {
        place(0, "+15550101");
        advance(700ms);
        answer_all({1});
    }
    // Session 1 of the slots 0, 1 and 2.
    void connect_team(PttOffer offer = {}) {
        place(0, kTeam, PttCallType::kGroup, std::move(offer));
        advance(700ms);
        answer_all({1, 2});
    }
    Status ask_floor(int slot, std::int32_t priority = 0, std::int32_t patience = 0) {
        return floor_.request(slot, {1, {}, priority, patience, {}});
    }
    static PttPeer to(const std::string &uri, bool group = false) { return {0, uri, {}, group}; }

    PttDirectory &directory_ = network_.ptt_directory;
    PttCalls &ptt_ = network_.ptt;
    PttFloorControl &floor_ = ptt_.floor();
    PttChanges &ptt_changes_ = ptt_.changes();
    PttRecorder &recorder_ = network_.ptt_recorder;
    PttMessages &mail_ = network_.ptt_messages;
    PttFiles &files_ = network_.ptt_files;
};

} // namespace sim::test
