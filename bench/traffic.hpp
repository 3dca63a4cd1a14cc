// SPDX-License-Identifier: Apache-2.0
// The three kinds of traffic that are measured, for either side.
#pragma once

#include "bench/side.hpp"

namespace bench {

// Calls, so many of them on their way at any time: each answer is followed by the next request.
class RequestTraffic {
  public:
    RequestTraffic(const Client &client, const Side &side);

    void send(std::int64_t requests);
    // Waits until so many more requests have been answered, counted from the last wait's end. While
    // it waits, each answer is followed by a new request.
    void exchange(std::int64_t answers);
    // Waits until every request has been answered.
    void drain();
    std::int64_t wrong() const { return answers_.wrong(); }

  private:
    const Client &client_;
    const Side &side_;
    Arrivals answers_;
    std::int64_t sent_ = 0;
    std::int64_t exchanged_ = 0;
};

// Two bursts of signals are on their way at any time, so that the peer never has to be waited for.
class SignalTraffic {
  public:
    static constexpr std::int64_t kBurst = 500;

    SignalTraffic(const Client &client, const Side &side);
    ~SignalTraffic();
    SignalTraffic(const SignalTraffic &) = delete;
    SignalTraffic &operator=(const SignalTraffic &) = delete;

    // Waits for one more burst.
    void receive();
    void drain();
    std::int64_t wrong() const { return events_.wrong(); }

  private:
    void ask();

    const Client &client_;
    const Side &side_;
    Arrivals events_;
    guint subscription_;
    std::int64_t asked_ = 0;
    std::int64_t received_ = 0;
};

// Reads the list of calls once and says whether it was all there.
bool read_calls(const Client &client, const Side &side);

} // namespace bench
