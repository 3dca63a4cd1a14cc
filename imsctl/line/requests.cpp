// SPDX-License-Identifier: Apache-2.0
#include "imsctl/line/requests.hpp"

#include <cstdlib>

namespace imsctl {
namespace {

Fields number_field(std::string_view name, const void *data) {
    if (data == nullptr)
        return {};
    return {{name, std::int64_t{*static_cast<const std::int32_t *>(data)}}};
}

Fields flag_field(std::string_view name, const void *data) {
    if (data == nullptr)
        return {};
    return {{name, *static_cast<const bool *>(data)}};
}

Fields in_place_field(std::string_view name, const void *data) {
    return {{name, std::int64_t{static_cast<int>(reinterpret_cast<std::intptr_t>(data))}}};
}

} // namespace

Action plain(PlainRequest request, Decode decode) {
    return [=](Invocation &run) { run.request({}, request, decode); };
}

Action on_session(Arguments &arguments, const Fitting &fitting, NumberRequest request,
                  Decode decode) {
    const SessionChoice session = arguments.session_place(fitting);
    return [=](Invocation &run) {
        const std::int32_t id = session.resolve(run.client());
        const auto start = [&](ims_h handle, ims_response_cb callback, void *user_data) {
            return request(handle, id, callback, user_data);
        };
        run.request(session_id_field(id), start, decode);
    };
}

Action on_session(SessionChoice session, Argument<std::int32_t> value, PairRequest request,
                  Decode decode) {
    return [=](Invocation &run) {
        const ims_call_pair_info_s pair{session.resolve(run.client()), *value};
        run.request(session_id_field(pair.session_id), with_record(request, pair), decode);
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

Fields decode_session_id(void *data) {
    return number_field("session_id", data);
}

Fields decode_max_volume(void *data) {
    return number_field("max_volume", data);
}

Fields decode_zoom(void *data) {
    return number_field("zoom", data);
}

Fields decode_muted(void *data) {
    return flag_field("muted", data);
}

Fields decode_in_epdg_call(void *data) {
    return flag_field("in_epdg_call", data);
}

Fields decode_session_id_in_place(void *data) {
    return in_place_field("session_id", data);
}

Fields decode_value_in_place(void *data) {
    return in_place_field("value_1", data);
}

Fields decode_change_result(void *data) {
    if (data == nullptr)
        return {};
    const auto &result = *static_cast<const ims_call_change_result_s *>(data);
    Value text;
    if (result.text_1 != nullptr)
        text = std::string(result.text_1);
    std::free(result.text_1);
    return {{"value_1", std::int64_t{result.value_1}}, {"text_1", text}};
}

Fields decode_tty_mode(void *data) {
    if (data == nullptr)
        return {};
    const auto &mode = *static_cast<const ims_call_tty_mode_s *>(data);
    Bytes bytes;
    if (mode.data != nullptr && mode.length > 0)
        bytes.assign(mode.data, mode.data + mode.length);
    return {{"value_1", std::int64_t{mode.value_1}},
            {"value_2", std::int64_t{mode.value_2}},
            {"data", bytes}};
}

} // namespace imsctl
