// SPDX-License-Identifier: Apache-2.0
// The two sides of the comparison: the same work through the library, and with GDBus alone as an
// application without the library would write it.
#pragma once

#include "bench/client.hpp"

#include <array>
#include <cstdint>
#include <functional>
#include <utility>

namespace bench {

// Answers to calls or call events, as they reach the application. Each carries the number after
// the one before it; anything else is counted as wrong.
class Arrivals {
  public:
    void add(bool is_good, std::int32_t number) {
        ++count_;
        if (!is_good || number != next_number_)
            ++wrong_;
        next_number_ = number + 1;
        if (follow_up_)
            follow_up_();
    }

    std::int64_t count() const { return count_; }
    std::int64_t wrong() const { return wrong_; }
    // Called after each arrival.
    void set_follow_up(std::function<void()> follow_up) { follow_up_ = std::move(follow_up); }

  private:
    std::int64_t count_ = 0;
    std::int64_t wrong_ = 0;
    std::int32_t next_number_ = 1;
    std::function<void()> follow_up_;
};

struct Side {
    const char *name;
    // Places the call without waiting; its answer is added to the arrivals.
    void (*request)(const Client &client, const ims_call_make_info_s &info, Arrivals &answers);
    // Reads the list of calls into a record that was zeroed, and says whether that went well.
    bool (*query)(const Client &client, ims_call_list_info_s &list);
    // Adds each CallEnded event to the arrivals, until unsubscribe() is given what this returned.
    guint (*subscribe)(const Client &client, Arrivals &events);
    void (*unsubscribe)(const Client &client, guint subscription);
};

extern const Side kLibrarySide;
extern const Side kBareSide;

inline const std::array<const Side *, 2> kSides{&kLibrarySide, &kBareSide};

} // namespace bench
