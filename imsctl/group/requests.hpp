// SPDX-License-Identifier: Apache-2.0
// What the verbs about groups share.
#pragma once

#include "imsctl/group/json.hpp"
#include "imsctl/line/requests.hpp"
#include "imsctl/output/failure.hpp"

#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {

inline Argument<std::string> group_place(Arguments &arguments) {
    return arguments.text("GROUP", "the group's URI");
}

// A URI that the library takes in a buffer. Throws a usage failure when it is too long.
template <std::size_t Size>
void put_uri(char (&buffer)[Size], const std::string &uri, const char *place) {
    if (uri.size() >= Size)
        throw Failure(FailureKind::kUsage,
                      fmt::format("{}: this URI has at most {} bytes", place, Size - 1));
    uri.copy(buffer, Size - 1);
}

// A request about a group and one more value.
template <class Content>
using GroupRequest = int (*)(ims_h, const char *group_uri, Content, ims_response_cb, void *);

template <class Content>
void request_about(Invocation &run, const std::string &group, GroupRequest<Content> request,
                   Content content) {
    run.request({{"group_uri", group}},
                [&](ims_h handle, ims_response_cb callback, void *user_data) {
                    return request(handle, group.c_str(), content, callback, user_data);
                });
}

// Makes a request whose reply is a record, and returns that as JSON.
template <class Record>
Json fetch(Invocation &run, const Start &start) {
    // Outlives a request that nobody waits for any more.
    const auto fetched = std::make_shared<Json>();
    run.client().request(start, [fetched](void *data) -> Fields {
        if (data != nullptr)
            *fetched = to_json(*static_cast<Record *>(data));
        return {};
    });
    return *fetched;
}

} // namespace imsctl
