// SPDX-License-Identifier: Apache-2.0
// Placing, answering, ending and changing calls.
#include "imsctl/call/dial.hpp"
#include "imsctl/call/module.hpp"
#include "imsctl/call/session_value.hpp"
#include "imsctl/call/values.hpp"
#include "imsctl/line/requests.hpp"

#include <cstdlib>
#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace imsctl {
namespace {

Action prepare_answer(Arguments &arguments) {
    const auto session = arguments.session_place(kRingingHere);
    const auto type = arguments.choice("--type", "the kind of call to answer it as", kCallTypes, 0);
    const auto value = arguments.number("--value", "another value that the service defines", 0);
    return [=](Invocation &run) {
        const ims_call_id_info_s info{session.resolve(run.client()), *type, *value};
        run.request(session_id_field(info.session_id), with_record(ims_call_answer_call, info));
    };
}

Action prepare_end(Arguments &arguments) {
    const auto session = arguments.session_place(kAnyCall);
    const auto reason = arguments.number("--reason", "why, as the service defines it", 0);
    const auto value = arguments.number("--value", "another value that the service defines", 0);
    return [=](Invocation &run) {
        const ims_call_id_info_s info{session.resolve(run.client()), *reason, *value};
        run.request(session_id_field(info.session_id), with_record(ims_call_end_call, info));
    };
}

Action prepare_reject(Arguments &arguments) {
    const auto session = arguments.session_place(kRingingHere);
    return on_session(session, arguments.choice("--reason", "why", kRejectReasons, 0),
                      ims_call_reject_call);
}

// The text in it is taken over and released.
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

Action prepare_change_to(Arguments &arguments, std::int32_t usual_type, PairRequest request,
                         const Decode &decode = nullptr) {
    const auto session = arguments.session_place(kInConversation);
    return on_session(session,
                      arguments.choice("--type", "what it becomes", kCallTypes, usual_type),
                      request, decode);
}

Action prepare_ussd(Arguments &arguments) {
    const auto text = arguments.text_or("TEXT", "for example *100#; none with --type cancel", "");
    const auto type = arguments.choice("--type", "start (the default)", kUssdTypes, 1);
    const auto value = arguments.number("--value", "another value that the service defines", 0);
    return [=](Invocation &run) {
        if (text->empty() && *type != IMS_CALL_USSD_TYPE_WITHOUT_TEXT)
            throw Failure(FailureKind::kUsage, "TEXT is missing", "try: imsctl call ussd '*100#'");
        // The library writes a zero byte behind the text.
        std::string buffer = *text;
        const ims_call_ussd_info_s info{*type, *value, buffer.data(),
                                        static_cast<std::int32_t>(buffer.size())};
        run.request({}, with_record(ims_call_send_ussd, info));
    };
}

std::string peer_text(const ims_call_info_s &call) {
    return call.peer_uri == nullptr ? "-" : escape(call.peer_uri);
}

std::string call_table(std::span<const ims_call_info_s> calls) {
    if (calls.empty())
        return "no calls";
    std::size_t width = std::string_view("PEER").size();
    for (const auto &call : calls)
        width = std::max(width, peer_text(call).size());
    std::string table = fmt::format("{:<7}  {:<{}}  {:<9}  {:<12}  {:<9}  {}", "SESSION", "PEER",
                                    width, "TYPE", "STATE", "DIRECTION", "CONFERENCE");
    for (const auto &call : calls)
        table += fmt::format("\n{:<7}  {:<{}}  {:<9}  {:<12}  {:<9}  {}", call.session_id,
                             peer_text(call), width, name_of(kCallTypes, call.call_type),
                             name_of(kCallStates, call.call_state),
                             call.bmocall ? "outgoing" : "incoming", call.bconfcall ? "yes" : "no");
    return table;
}

Json to_json(const ims_call_info_s &call) {
    return {{"session_id", call.session_id},
            {"peer_uri", call.peer_uri == nullptr ? Json(nullptr) : Json(call.peer_uri)},
            {"call_type", call.call_type},
            {"bmocall", call.bmocall},
            {"call_state", call.call_state},
            {"bconfcall", call.bconfcall}};
}

void list_calls(Invocation &run) {
    const CallList list = run.client().call_list();
    const std::span<const ims_call_info_s> calls(list->entries, list->count);
    Json entries = Json::array();
    for (const auto &call : calls)
        entries.push_back(to_json(call));
    run.output().result({{"calls", entries}}, call_table(calls));
}

constexpr Verb kCallVerbs[] = {
    {"call dial", "place a call", "call dial +15550101 --wait", prepare_dial},
    {"call answer", "answer an incoming call", "call answer", prepare_answer},
    {"call end", "end a call", "call end 1", prepare_end},
    {"call reject", "reject an incoming call", "call reject --reason busy", prepare_reject},
    {"call hold", "put a call on hold", "call hold",
     [](Arguments &arguments) {
         return on_session(arguments, kInConversation, ims_call_hold_call);
     }},
    {"call resume", "take a call off hold", "call resume",
     [](Arguments &arguments) { return on_session(arguments, kOnHold, ims_call_resume_call); }},
    {"call swap", "swap the active and the held call", "call swap",
     [](Arguments &) { return plain(ims_call_swap_call); }},
    {"call upgrade", "ask for a richer kind of call", "call upgrade --type video",
     [](Arguments &arguments) { return prepare_change_to(arguments, 1, ims_call_upgrade_call); }},
    {"call downgrade", "ask for a plainer kind of call", "call downgrade --type voice",
     [](Arguments &arguments) { return prepare_change_to(arguments, 0, ims_call_downgrade_call); }},
    {"call change", "ask for another kind of call", "call change --type video",
     [](Arguments &arguments) {
         return prepare_change_to(arguments, 1, ims_call_change_call, decode_change_result);
     }},
    {"call accept-change", "accept the peer's request for another kind of call",
     "call accept-change",
     [](Arguments &arguments) {
         return on_session(arguments, kInConversation, ims_call_accept_change_request);
     }},
    {"call reject-change", "reject the peer's request for another kind of call",
     "call reject-change",
     [](Arguments &arguments) {
         return on_session(arguments, kInConversation, ims_call_reject_change_request);
     }},
    {"call ussd", "send a USSD text; the answer is the event call-ussd-indication",
     "call ussd '*100#'", prepare_ussd},
    {"call list", "show the current calls", "call list",
     [](Arguments &) -> Action { return list_calls; }},
};

} // namespace

std::span<const Verb> call_verbs() {
    return kCallVerbs;
}

} // namespace imsctl
