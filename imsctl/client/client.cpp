// SPDX-License-Identifier: Apache-2.0
#include "imsctl/client/client.hpp"

#include "imsctl/client/last_words.hpp"

#include <algorithm>
#include <fmt/format.h>

namespace imsctl {

Client::Client(const Settings &settings, const Output &output)
    : settings_(settings), output_(output) {
    explain_bus_break(output.failure_texts(bus_break_failure()));
    const BlockingLimit limit(settings.timeout, output_.failure_texts(timeout_failure()));
    if (const int code = ims_init(settings.slot, &handle_); code != IMS_ERROR_NONE)
        throw connect_failure(code, settings.slot);
}

Client::~Client() {
    ims_deinit(handle_);
}

Failure Client::timeout_failure() const {
    return {FailureKind::kTimeout,
            fmt::format("no answer from the service within {} s", settings_.timeout)};
}

Client::Pending &Client::start_request(const Start &start, Decode decode) {
    Pending &pending = pending_.emplace_back();
    pending.decode = std::move(decode);
    if (const int code = start(handle_, on_response, &pending); code != IMS_ERROR_NONE)
        throw library_failure(code);
    return pending;
}

Fields Client::request(const Start &start, Decode decode) {
    Pending &pending = start_request(start, std::move(decode));
    if (!run_until(settings_.timeout, [&] { return pending.answered; }))
        throw timeout_failure();
    if (pending.result != 0)
        throw response_failure(pending.result);
    return pending.data;
}

void Client::send(const Start &start, std::function<void(int result)> done) {
    start_request(start, nullptr).done = std::move(done);
}

void Client::query(const std::function<int(ims_h)> &ask) {
    const BlockingLimit limit(settings_.timeout, output_.failure_texts(timeout_failure()));
    if (const int code = ask(handle_); code != IMS_ERROR_NONE)
        throw library_failure(code);
}

CallList Client::call_list() {
    CallList list(new ims_call_list_info_s());
    query([&](ims_h handle) { return ims_call_get_call_list_info(handle, list.get()); });
    return list;
}

void Client::watch(const EventRow &row) {
    watched_.push_back(&row);
    if (const int code = ims_set_notification_cb(handle_, row.id, on_event, this);
        code != IMS_ERROR_NONE)
        throw library_failure(code);
}

void Client::settle(Seconds limit) {
    // Any answer will do: the bus handles a connection's messages in order.
    const Pending &pending = start_request(ims_call_is_in_epdg_call, nullptr);
    run_until(limit, [&] { return pending.answered; });
}

Event Client::take_event() {
    Event event = std::move(events_.front());
    events_.pop_front();
    return event;
}

void Client::on_response(ims_h, int result, void *data, void *user_data) {
    auto &pending = *static_cast<Pending *>(user_data);
    pending.answered = true;
    pending.result = result;
    // Also beside a failure: what comes with it may have to be released.
    if (pending.decode != nullptr)
        pending.data = pending.decode(data);
    if (pending.done != nullptr)
        pending.done(result);
}

void Client::on_event(ims_h, int noti_id, void *record, void *user_data) {
    auto &client = *static_cast<Client *>(user_data);
    const auto row = std::find_if(client.watched_.begin(), client.watched_.end(),
                                  [&](const EventRow *each) { return each->id == noti_id; });
    client.events_.push_back({*row, take_fields(**row, record), g_get_real_time()});
}

} // namespace imsctl
