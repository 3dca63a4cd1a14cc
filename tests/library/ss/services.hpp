// SPDX-License-Identifier: Apache-2.0
// The three services whose entries come as a list: what differs between them.
#pragma once

#include "ims.h"

#include <ostream>
#include <span>
#include <string>
#include <vector>

namespace test {

// An entry of any of them.
struct Entry {
    std::vector<std::int32_t> numbers; // in the order of Service::keys
    const char *uri = nullptr;
};

struct Service {
    const char *name;
    const char *method;
    const char *handler;
    const char *refusal;               // up to the result
    const char *count_warning;         // up to the count
    std::span<const char *const> keys; // of the numbers, in the record's order
    bool has_uri;
    int (*ask)(ims_h handle, ims_response_cb callback, void *user_data);
    const void *(*entries)(const ims_ss_status_list_s &list);
    Entry (*entry)(const ims_ss_status_list_s &list, std::size_t at);
};

inline void PrintTo(const Service &service, std::ostream *out) {
    *out << service.name;
}

std::span<const Service> services();

// A dictionary with all of the service's keys; the numbers count from this one.
std::string dictionary(const Service &service, std::int32_t first);

// "(0, count, [dictionaries])"
std::string list_reply(const std::string &count, const std::vector<std::string> &dictionaries);

} // namespace test
