// SPDX-License-Identifier: Apache-2.0
// The events: a table in each module, a row an event, and how a signal gets to its row.
//
//     constexpr Notification kEvents[] = {
//         {IMS_NOTI_CALL_ENDED, "CallEnded", emit<"(ii)", ims_call_ended_s>},
//
// A subscription keeps its row, the module, whose decoder finds the row by its id, at its place in
// the table, and the handle.
#pragma once

#include "client.hpp"
#include "log.hpp"
#include "wire/wire.hpp"

#include <span>

struct ims_noti_cb_info_s;

namespace ims {

// Takes a module's signals, as their subscriptions get them.
using Decoder = void (*)(ims_h handle, int noti_id, GVariant *parameters,
                         const ims_noti_cb_info_s *subscription);

struct Module;
struct Notification;

} // namespace ims

// One subscription to a signal, which is given it as its user data.
struct ims_noti_cb_info_s {
    guint subscription_id;
    ims_notification_cb callback;
    void *user_data;
    ims_h handle = nullptr;
    const ims::Module *module = nullptr;
    const ims::Notification *row = nullptr;
};

namespace ims {

// One signal on its way to the application. The callback may end its own subscription or release
// the handle, so an event keeps what it needs of both, and nothing touches either after it.
class Event {
  public:
    // Lines about the event are the decoder's.
    Event(ims_h handle, int noti_id, GVariant *parameters, const ims_noti_cb_info_s *subscription,
          Site site = here()) noexcept
        : handle_{handle}, noti_id_{noti_id}, parameters_{parameters},
          callback_{subscription->callback}, user_data_{subscription->user_data}, site_{site} {}

    int id() const noexcept { return noti_id_; }
    Site site() const noexcept { return site_; }
    bool is_wanted() const noexcept { return callback_ != nullptr; }

    void deliver(void *record) const noexcept {
        if (is_wanted())
            callback_(handle_, noti_id_, record, user_data_);
    }

    // Unpacks the signal's members; one that has another signature is dropped with a line.
    template <Literal Format, typename... Out>
    bool read(Out &...out) const noexcept {
        return unpack<Format>(parameters_, out...) || drop(Signature<Format>::type());
    }
    template <Literal Format, typename Record>
    bool read_record(Record &record) const noexcept {
        return unpack_record<Format>(parameters_, record) || drop(Signature<Format>::type());
    }

    // Says that the signal is not what it should be; always false.
    bool drop(const char *expected) const noexcept;

  private:
    ims_h handle_;
    int noti_id_;
    GVariant *parameters_;
    ims_notification_cb callback_;
    void *user_data_;
    Site site_;
};

// One row. Without a member it is a shape that the module knows and no signal has.
struct Notification {
    int id;
    const char *member;
    void (*emit)(const Event &event) noexcept;
};

// The usual way to emit: the fields of the record are the signal's members.
template <Literal Format, typename Record>
void emit(const Event &event) noexcept {
    Record record{};
    if (event.is_wanted() && event.read_record<Format>(record))
        event.deliver(&record);
}

// A module as the registry knows it. Its requests are on the same interface.
struct Module {
    const char *interface;
    Decoder decode;
    std::span<const Notification> notifications;

    template <std::size_t Size>
    consteval Module(const char *on_interface, Decoder decoder, const Notification (&rows)[Size])
        : interface(on_interface), decode(decoder), notifications(rows) {
        for (std::size_t at = 0; at < Size; ++at) {
            if (rows[at].id != rows[0].id + static_cast<int>(at))
                throw "an id does not follow the one before it";
        }
    }

    // NULL for an id that is not the module's.
    const Notification *find(int id) const noexcept {
        const auto at = static_cast<std::size_t>(std::int64_t{id} - notifications.front().id);
        return at < notifications.size() ? &notifications[at] : nullptr;
    }
};

extern const Module kRegModule;
extern const Module kCallModule;
extern const Module kSmsModule;
extern const Module kPocModule;
extern const Module kLoginModule;

// The modules' decoders, and what they share: a handle that is not NULL, a line otherwise; the
// event handed to its row, false when the module has none.
void on_reg_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                const ims_noti_cb_info_s *subscription);
void on_call_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                 const ims_noti_cb_info_s *subscription);
void on_sms_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                const ims_noti_cb_info_s *subscription);
void on_poc_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                const ims_noti_cb_info_s *subscription);
void on_login_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                  const ims_noti_cb_info_s *subscription);
bool is_handle(ims_h handle, Site site = here()) noexcept;
bool emit_row(const Module &module, const Event &event) noexcept;

} // namespace ims
