// SPDX-License-Identifier: Apache-2.0
#include "bench/side.hpp"

#include <stdexcept>

namespace bench {
namespace {

void on_answer(ims_h, int result, void *data, void *answers) {
    const auto *session = static_cast<const std::int32_t *>(data);
    static_cast<Arrivals *>(answers)->add(result == 0 && session, session ? *session : 0);
}

void request(const Client &client, const ims_call_make_info_s &info, Arrivals &answers) {
    if (ims_call_make_call(client.handle(), &info, on_answer, &answers) != IMS_ERROR_NONE)
        answers.add(false, 0);
}

bool query(const Client &client, ims_call_list_info_s &list) {
    return ims_call_get_call_list_info(client.handle(), &list) == IMS_ERROR_NONE;
}

void on_call_ended(ims_h, int, void *event, void *events) {
    static_cast<Arrivals *>(events)->add(true,
                                         static_cast<const ims_call_ended_s *>(event)->session_id);
}

guint subscribe(const Client &client, Arrivals &events) {
    if (ims_set_notification_cb(client.handle(), IMS_NOTI_CALL_ENDED, on_call_ended, &events) !=
        IMS_ERROR_NONE)
        throw std::runtime_error("ims_set_notification_cb() failed");
    return IMS_NOTI_CALL_ENDED;
}

void unsubscribe(const Client &client, guint subscription) {
    ims_unset_notification_cb(client.handle(), static_cast<int>(subscription));
}

} // namespace

const Side kLibrarySide{"library", request, query, subscribe, unsubscribe};

} // namespace bench
