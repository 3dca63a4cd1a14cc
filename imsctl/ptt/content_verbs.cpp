// SPDX-License-Identifier: Apache-2.0
// What is sent and kept: messages, files, recordings.
#include "imsctl/line/requests.hpp"
#include "imsctl/ptt/file.hpp"
#include "imsctl/ptt/module.hpp"
#include "imsctl/ptt/parties.hpp"

namespace imsctl {
namespace {

Fields decode_message_result(void *data) {
    if (data == nullptr)
        return {};
    const auto &result = *static_cast<const ims_poc_msg_result_s *>(data);
    return {{"value_1", std::int64_t{result.value_1}},
            {"value_2", std::int64_t{result.value_2}},
            {"value_3", std::int64_t{result.value_3}}};
}

Action prepare_message_send(Arguments &arguments) {
    const auto text = arguments.text("TEXT", "the message");
    const PttTargets targets = ptt_targets(arguments);
    const auto session = arguments.number("--session", "send it to the parties of this session", 0);
    const auto id = arguments.text_or("--id", "names the message; the service's when left out", "");
    const auto notices =
        arguments.choice("--notices", "which notices to send back", kPttWantedNotices, 0);
    const auto type = arguments.text_or("--type", "the media type of the text", "text/plain");
    const auto lifetime =
        arguments.number("--lifetime", "how many seconds it is worth delivering; 0: as usual", 0);
    const auto reference = arguments.number("--reference", "a number that goes with it", 0);
    return [=](Invocation &run) {
        const PttPeerChain chain(targets);
        const ims_poc_message_s message{*session,  id->c_str(),   chain.head(),
                                        *notices,  type->c_str(), text->c_str(),
                                        *lifetime, nullptr,       *reference};
        run.request({}, with_record(ims_poc_send_msg, message), decode_message_result);
    };
}

Action prepare_message_notify(Arguments &arguments) {
    const auto number = arguments.number("NUMBER", "the number of the received message");
    const auto notice = arguments.choice("NOTICE", "what happened to it", kPttNotices);
    const auto id = arguments.text_or("--id", "the message's id", "");
    const auto from = arguments.text_or("--from", "who sent the message", "");
    const auto text = arguments.text_or("--text", "a text that the service defines", "");
    return [=](Invocation &run) {
        const ims_poc_peer_info_s originator = ptt_peer(*from);
        const ims_poc_msg_notification_s notification{
            *number, id->c_str(),   from->empty() ? nullptr : &originator,
            nullptr, text->c_str(), *notice};
        run.request({}, with_record(ims_poc_send_received_msg_notification, notification),
                    decode_message_result);
    };
}

Action prepare_file_answer(Arguments &arguments,
                           int (*request)(ims_h, const ims_poc_transfer_answer_s *, ims_response_cb,
                                          void *)) {
    const auto id = arguments.text("ID", "the transfer's id");
    const auto session = arguments.number("--session", "the session that it came through", 0);
    return [=](Invocation &run) {
        const ims_poc_transfer_answer_s answer{*session, id->c_str()};
        run.request({}, with_record(request, answer), decode_transfer_result);
    };
}

Start with_value(NumberRequest request, std::int32_t value) {
    return [=](ims_h handle, ims_response_cb callback, void *user_data) {
        return request(handle, value, callback, user_data);
    };
}

Action prepare_file_cancel(Arguments &arguments) {
    const auto number = arguments.number("NUMBER", "the transfer's number");
    return [=](Invocation &run) {
        run.request({}, with_value(ims_poc_cancel_file_transfer, *number), decode_transfer_result);
    };
}

Fields decode_recording(void *data) {
    if (data == nullptr)
        return {};
    const auto &info = *static_cast<const ims_poc_recording_info_s *>(data);
    return {{"session_id", std::int64_t{info.session_id}},
            {"record_state", std::int64_t{info.record_state}},
            {"record_error", std::int64_t{info.record_error}},
            {"record_file_path", info.record_file_path == nullptr
                                     ? Value()
                                     : Value(std::string(info.record_file_path))}};
}

Action prepare_record_start(Arguments &arguments) {
    const auto session = arguments.number("SESSION,--session", "the session");
    const auto source = arguments.choice("--source", "whom to record", kPttRecordSources, 0);
    const auto longest =
        arguments.number("--longest", "end after so many seconds; 0: without limit", 0);
    const auto file = arguments.text_or("--file", "the service's file; its own when left out", "");
    return [=](Invocation &run) {
        const ims_poc_record_request_s info{*session, *source, *longest, file->c_str()};
        run.request({}, with_record(ims_poc_start_call_recording, info), decode_recording);
    };
}

Action prepare_recording(Arguments &arguments, NumberRequest request) {
    const auto session = arguments.number("SESSION,--session", "the session");
    return [=](Invocation &run) {
        run.request(session_id_field(*session), with_value(request, *session));
    };
}

constexpr Verb kPttContentVerbs[] = {
    {"ptt message send", "send a message", "ptt message send Hello --to +15550101",
     prepare_message_send},
    {"ptt message notify", "tell that a received message was delivered or read",
     "ptt message notify 1 read", prepare_message_notify},
    {"ptt file send", "offer a file", "ptt file send map.png --to +15550101",
     prepare_ptt_file_send},
    {"ptt file accept", "accept a file that is offered", "ptt file accept transfer-1",
     [](Arguments &arguments) {
         return prepare_file_answer(arguments, ims_poc_accept_file_transfer);
     }},
    {"ptt file reject", "reject a file that is offered", "ptt file reject transfer-1",
     [](Arguments &arguments) {
         return prepare_file_answer(arguments, ims_poc_reject_file_transfer);
     }},
    {"ptt file cancel", "end a file transfer before its time", "ptt file cancel 1",
     prepare_file_cancel},
    {"ptt record start", "start to record a call", "ptt record start 1 --source others",
     prepare_record_start},
    {"ptt record pause", "pause a recording", "ptt record pause 1",
     [](Arguments &arguments) {
         return prepare_recording(arguments, ims_poc_pause_call_recording);
     }},
    {"ptt record resume", "resume a paused recording", "ptt record resume 1",
     [](Arguments &arguments) {
         return prepare_recording(arguments, ims_poc_resume_call_recording);
     }},
    {"ptt record stop", "end a recording", "ptt record stop 1",
     [](Arguments &arguments) {
         return prepare_recording(arguments, ims_poc_stop_call_recording);
     }},
    {"ptt record cancel", "end a recording of which nothing is to stay", "ptt record cancel 1",
     [](Arguments &arguments) {
         return prepare_recording(arguments, ims_poc_cancel_call_recording);
     }},
};

} // namespace

std::span<const Verb> ptt_content_verbs() {
    return kPttContentVerbs;
}

} // namespace imsctl
