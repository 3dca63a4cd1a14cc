// SPDX-License-Identifier: Apache-2.0
// One handle of the library, with its asynchronous requests turned into waiting for the outcome.
#pragma once

#include "imsctl/client/main_loop.hpp"
#include "imsctl/output/output.hpp"

#include <deque>
#include <functional>
#include <ims.h>
#include <list>
#include <memory>
#include <vector>

namespace imsctl {

struct Settings {
    int slot = 0;
    bool json = false;
    Seconds timeout = 60; // as long as the library itself waits
};

struct CallListDeleter {
    void operator()(ims_call_list_info_s *list) const {
        ims_call_list_info_clear(list);
        delete list;
    }
};
using CallList = std::unique_ptr<ims_call_list_info_s, CallListDeleter>;

// Makes one request on the handle it is given.
using Start = std::function<int(ims_h, ims_response_cb, void *)>;

// Reads what a callback received. It may be NULL.
using Decode = std::function<Fields(void *data)>;

// All that can go wrong is thrown as a Failure.
class Client {
  public:
    Client(const Settings &settings, const Output &output);
    ~Client();
    Client(const Client &) = delete;
    Client &operator=(const Client &) = delete;

    ims_h handle() const { return handle_; }

    // Makes a request and waits for its outcome.
    Fields request(const Start &start, Decode decode = nullptr);

    // Makes a request and does not wait: `done` gets its result from the main context.
    void send(const Start &start, std::function<void(int result)> done);

    // Asks one of the library's blocking questions.
    void query(const std::function<int(ims_h)> &ask);

    CallList call_list();

    // From now on take_event() returns this kind of event.
    void watch(const EventRow &row);

    // Waits until the service answers. By then the bus knows of every watch() before it.
    void settle(Seconds limit);

    bool has_event() const { return !events_.empty(); }
    Event take_event();

  private:
    struct Pending {
        Decode decode = nullptr;
        std::function<void(int)> done = nullptr;
        bool answered = false;
        int result = 0;
        Fields data;
    };

    Pending &start_request(const Start &start, Decode decode);
    Failure timeout_failure() const;

    static void on_response(ims_h, int result, void *data, void *user_data);
    static void on_event(ims_h, int noti_id, void *record, void *user_data);

    const Settings &settings_;
    const Output &output_;
    ims_h handle_ = nullptr;
    // Kept to the end: an answer may come after nobody waits for it any more.
    std::list<Pending> pending_;
    std::vector<const EventRow *> watched_;
    std::deque<Event> events_;
};

} // namespace imsctl
