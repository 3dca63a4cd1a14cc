// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/requests.hpp"

namespace imsctl {

Action plain(PlainRequest request, const Decode &decode) {
    return [=](Invocation &run) { run.request({}, request, decode); };
}

Action on_session(Arguments &arguments, const Fitting &fitting, NumberRequest request,
                  const Decode &decode) {
    const SessionChoice session = arguments.session_place(fitting);
    return [=](Invocation &run) {
        const std::int32_t id = session.resolve(run.client());
        const auto start = [&](ims_h handle, ims_response_cb callback, void *user_data) {
            return request(handle, id, callback, user_data);
        };
        run.request(session_id_field(id), start, decode);
    };
}

Action with_number(Argument<std::int32_t> value, NumberRequest request) {
    return [=](Invocation &run) {
        const auto start = [&](ims_h handle, ims_response_cb callback, void *user_data) {
            return request(handle, *value, callback, user_data);
        };
        run.request({}, start);
    };
}

Fields session_id_field(std::int32_t session_id) {
    return {{"session_id", std::int64_t{session_id}}};
}

Decode number_as(std::string_view name) {
    return [name](const void *data) -> Fields {
        if (data == nullptr)
            return {};
        return {{name, std::int64_t{*static_cast<const std::int32_t *>(data)}}};
    };
}

Decode flag_as(std::string_view name) {
    return [name](const void *data) -> Fields {
        if (data == nullptr)
            return {};
        return {{name, *static_cast<const bool *>(data)}};
    };
}

Decode number_in_place_as(std::string_view name) {
    return [name](const void *data) -> Fields {
        return {{name, std::int64_t{static_cast<int>(reinterpret_cast<std::intptr_t>(data))}}};
    };
}

} // namespace imsctl
