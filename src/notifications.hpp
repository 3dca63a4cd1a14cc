// SPDX-License-Identifier: Apache-2.0
// The notification ids with their signals, and the modules' decoders.
#pragma once

#include "client.hpp"
#include "log.hpp"
#include "wire/wire.hpp"

#include <span>

namespace ims {

struct Notification {
    int id;
    const char *interface;
    const char *member;
};

// Every id that an application can ask for.
std::span<const Notification> notifications() noexcept;

using Decoder = void (*)(ims_h handle, int noti_id, GVariant *parameters,
                         const ims_noti_cb_info_s *subscription);

// The modules' decoders.
void on_reg_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                const ims_noti_cb_info_s *subscription);
void on_call_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                 const ims_noti_cb_info_s *subscription);
void on_poc_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                const ims_noti_cb_info_s *subscription);
void on_sms_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                const ims_noti_cb_info_s *subscription);
void on_login_signal_emit_handler(ims_h handle, int noti_id, GVariant *parameters,
                                  const ims_noti_cb_info_s *subscription);

// One signal on its way to the application. The callback may end its own subscription or release
// the handle, so a decoder touches neither after it.
class Event {
  public:
    Event(ims_h handle, int noti_id, GVariant *parameters,
          const ims_noti_cb_info_s *subscription) noexcept
        : handle_{handle}, noti_id_{noti_id}, parameters_{parameters}, subscription_{
                                                                           *subscription} {}

    int id() const noexcept { return noti_id_; }
    bool is_wanted() const noexcept { return subscription_.callback != nullptr; }

    void deliver(void *record) const noexcept {
        if (is_wanted())
            subscription_.callback(handle_, noti_id_, record, subscription_.user_data);
    }

    // Unpacks the signal's members; one that has another signature is dropped with a line.
    template <Literal Format, typename... Out>
    bool read(Site site, Out &...out) const noexcept {
        return unpack<Format>(parameters_, out...) || drop(site, Signature<Format>::type());
    }

    // Delivers the signal as the record whose fields are its members.
    template <Literal Format, typename Record>
    void emit(Site site = here()) const noexcept {
        if (!is_wanted())
            return;
        Record record{};
        if (unpack_record<Format>(parameters_, record))
            deliver(&record);
        else
            drop(site, Signature<Format>::type());
    }

    // Says that the signal is not what it should be; always false.
    bool drop(Site site, const char *expected) const noexcept;

  private:
    ims_h handle_;
    int noti_id_;
    GVariant *parameters_;
    ims_noti_cb_info_s subscription_;
};

} // namespace ims
