// SPDX-License-Identifier: Apache-2.0
#include "notifications.hpp"

namespace ims {

bool Event::drop(const char *expected) const noexcept {
    log_error(site_, "Notification dropped - noti_id: [%d], signature %s where %s is expected",
              noti_id_, g_variant_get_type_string(parameters_), expected);
    return false;
}

bool is_handle(ims_h handle, Site site) noexcept {
    if (handle == nullptr)
        log_error(site, "Ims Handle NULL");
    return handle != nullptr;
}

bool emit_row(const Module &module, const Event &event) noexcept {
    const Notification *row = module.find(event.id());
    if (row == nullptr)
        return false;
    row->emit(event);
    return true;
}

} // namespace ims
