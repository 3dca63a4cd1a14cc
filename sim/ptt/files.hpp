// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "sim/base/clock.hpp"
#include "sim/base/per_slot.hpp"
#include "sim/base/result.hpp"
#include "sim/ptt/directory.hpp"
#include "sim/ptt/events.hpp"
#include "sim/ptt/model.hpp"
#include "sim/registration/registrations.hpp"

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace sim {

struct PttFileOffer {
    std::int32_t session = 0; // 0: to the targets
    std::vector<PttPeer> targets;
    PttFileAttributes attributes;
    PttPeer originator; // with no uri, or the slot's own
};

struct PttFileReceipt {
    std::int32_t number = 0; // from 1 in each slot, sent and received ones together
    std::int32_t count = 0;  // parties, or bytes to come
};

// Files between parties and into calls. No bytes are read or written: a file is what its
// attributes say, and takes its time. The server's, but for what a slot may ask when.
class PttFiles {
  public:
    PttFiles(const PttDirectory &directory, PttCalls &calls, Timers &timers,
             const Registrations &registrations, PttCalls::Sink sink);

    // To how many parties it goes.
    Answer<PttFileReceipt> offer(int slot, PttFileOffer offer);
    // How many bytes there are.
    Answer<PttFileReceipt> accept(int slot, std::int32_t session, const std::string &transfer_id);
    Answer<PttFileReceipt> reject(int slot, std::int32_t session, const std::string &transfer_id);
    // How many parties it went to.
    Answer<PttFileReceipt> cancel(int slot, std::int32_t number);
    // The radio is off.
    void drop_transfers(int slot);

  private:
    // The way of a file to one party.
    struct Leg {
        PttContact to;
        std::int32_t number = 0; // the receiver's
        bool running = false;
        std::int32_t done = 0;
        Timer timer;
    };
    struct Transfer {
        int sender = -1;
        std::int32_t number = 0; // the sender's
        PttPeer originator;
        PttFileAttributes attributes;
        std::map<std::int32_t, Leg> legs; // by party, from 1

        std::int32_t bytes() const;
    };
    struct LegRef {
        int transfer = 0;
        std::int32_t party = 0;
    };

    std::optional<Refusal> bad_attributes(const PttFileAttributes &attributes) const;
    Answer<LegRef> offered(int slot, std::int32_t session, const std::string &transfer_id) const;
    Leg *find(LegRef ref);
    void present(LegRef ref);
    void present_to_slot(LegRef ref);
    void present_to_party(LegRef ref);
    void expect_answer(LegRef ref);
    void run(LegRef ref);
    void step(LegRef ref);
    void finish(LegRef ref, PttFileEnd to_sender, PttFileEnd to_receiver);

    const PttDirectory &directory_;
    PttCalls &calls_;
    Timers &timers_;
    const Registrations &registrations_;
    PttCalls::Sink sink_;
    PerSlot<std::int32_t> next_number_;
    std::map<int, Transfer> transfers_;
    int next_transfer_ = 1;
};

} // namespace sim
