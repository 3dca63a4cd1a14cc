// SPDX-License-Identifier: Apache-2.0
// Callbacks that note what they were given. A recorder's own address is the user data.
#pragma once

#include "ims.h"

#include <functional>
#include <vector>

namespace test {

struct Response {
    ims_h handle;
    int result;
    bool has_data;
};

class ResponseRecorder {
  public:
    // Looks at the data while the callback runs.
    using Inspect = std::function<void(const Response &, void *data)>;

    explicit ResponseRecorder(Inspect inspect = {}) : inspect_{std::move(inspect)} {}
    ResponseRecorder(const ResponseRecorder &) = delete;
    ResponseRecorder &operator=(const ResponseRecorder &) = delete;

    static void callback(ims_h handle, int result, void *data, void *user_data) {
        auto &recorder = *static_cast<ResponseRecorder *>(user_data);
        recorder.responses_.push_back({handle, result, data != nullptr});
        if (recorder.inspect_)
            recorder.inspect_(recorder.responses_.back(), data);
    }

    void inspect_with(Inspect inspect) { inspect_ = std::move(inspect); }
    std::size_t count() const { return responses_.size(); }
    const std::vector<Response> &all() const { return responses_; }
    const Response &last() const { return responses_.back(); }

  private:
    Inspect inspect_;
    std::vector<Response> responses_;
};

struct Notified {
    ims_h handle;
    int id;
};

class NotificationRecorder {
  public:
    // Looks at the event while the callback runs, and releases what the application takes over.
    using Inspect = std::function<void(const Notified &, void *event)>;

    explicit NotificationRecorder(Inspect inspect = {}) : inspect_{std::move(inspect)} {}
    NotificationRecorder(const NotificationRecorder &) = delete;
    NotificationRecorder &operator=(const NotificationRecorder &) = delete;

    static void callback(ims_h handle, int noti_id, void *event, void *user_data) {
        auto &recorder = *static_cast<NotificationRecorder *>(user_data);
        const Notified notified{handle, noti_id};
        recorder.all_.push_back(notified);
        if (recorder.inspect_)
            recorder.inspect_(notified, event);
    }

    void inspect_with(Inspect inspect) { inspect_ = std::move(inspect); }
    std::size_t count() const { return all_.size(); }
    std::size_t count(int id) const {
        std::size_t seen = 0;
        for (const Notified &notified : all_)
            seen += notified.id == id ? 1 : 0;
        return seen;
    }
    const std::vector<Notified> &all() const { return all_; }

  private:
    Inspect inspect_;
    std::vector<Notified> all_;
};

} // namespace test
