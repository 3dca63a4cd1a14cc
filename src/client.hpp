// SPDX-License-Identifier: Apache-2.0
// What a handle is.
#pragma once

#include "ims_types.h"
#include "wire/glib.hpp"

#include <cstdint>

struct ims_client_s {
    ims::Connection connection;
    ims::Text object_path;
    // The signal string, "interface:member", to its ims_noti_cb_info_s; both freed with g_free.
    ims::HashTable noti_table;
    // What the service gave this client when it registered; part of most requests.
    std::int32_t app_id;
};

// What travels with one asynchronous request.
struct ims_request_ctx_s {
    ims_h handle;
    ims_response_cb callback;
    void *user_data;
};
