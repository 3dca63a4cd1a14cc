// SPDX-License-Identifier: Apache-2.0
// The requests about what is kept and sent: recordings, messages, files.
#include "sim/ptt/interface.hpp"

#include "sim/bus/replies.hpp"
#include "sim/ptt/wire.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;

Answer<Variant> result_of_file(const Answer<PttFileReceipt> &receipt) {
    if (!receipt)
        return receipt.refusal();
    return wire::pack(Result::kOk, receipt->number, receipt->count);
}

} // namespace

Answer<Variant> PttInterface::start_recording(const Request &request) {
    const auto [session, source, longest, path] =
        request.unpack<int32_t, int32_t, int32_t, string>();
    const auto info =
        recorder_.start(request.slot, {session, PttRecordSource{source}, longest, path});
    if (!info)
        return info.refusal();
    return wire::pack(Result::kOk, ptt_wire::recording(*info));
}

Answer<Variant> PttInterface::pause_recording(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(recorder_.pause(request.slot, session));
}

Answer<Variant> PttInterface::resume_recording(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(recorder_.resume(request.slot, session));
}

Answer<Variant> PttInterface::stop_recording(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(recorder_.stop(request.slot, session));
}

Answer<Variant> PttInterface::cancel_recording(const Request &request) {
    const auto [session] = request.unpack<int32_t>();
    return result_of(recorder_.cancel(request.slot, session));
}

Answer<Variant> PttInterface::send_message(const Request &request) {
    const auto [session, message_id, target_list, notices, content_type, text, lifetime,
                originator_entry, reference] =
        request
            .unpack<int32_t, string, Variant, int32_t, string, string, int32_t, Variant, int32_t>();
    const auto targets = ptt_wire::peers(target_list);
    if (!targets)
        return targets.refusal();
    const auto originator = ptt_wire::peer(originator_entry);
    if (!originator)
        return originator.refusal();
    const auto receipt =
        messages_.send(request.slot, {session, message_id, *targets, notices, content_type, text,
                                      lifetime, *originator, reference});
    if (!receipt)
        return receipt.refusal();
    return wire::pack(Result::kOk, receipt->number, receipt->session, receipt->parties);
}

Answer<Variant> PttInterface::send_notice(const Request &request) {
    const auto [number, message_id, originator_entry, party_list, no_effect, notice] =
        request.unpack<int32_t, string, Variant, Variant, string, int32_t>();
    const auto originator = ptt_wire::peer(originator_entry);
    if (!originator)
        return originator.refusal();
    if (const auto parties = ptt_wire::names(party_list); !parties)
        return parties.refusal();
    const auto told =
        messages_.notify(request.slot, {number, message_id, *originator, PttNotice{notice}});
    if (!told)
        return told.refusal();
    return wire::pack(Result::kOk, number, notice, *told);
}

Answer<Variant> PttInterface::transfer_file(const Request &request) {
    const auto [session, target_list, attribute_entry, originator_entry] =
        request.unpack<int32_t, Variant, Variant, Variant>();
    const auto targets = ptt_wire::peers(target_list);
    if (!targets)
        return targets.refusal();
    const auto attributes = ptt_wire::attributes(attribute_entry);
    if (!attributes)
        return attributes.refusal();
    const auto originator = ptt_wire::peer(originator_entry);
    if (!originator)
        return originator.refusal();
    return result_of_file(
        files_.offer(request.slot, {session, *targets, *attributes, *originator}));
}

Answer<Variant> PttInterface::accept_file(const Request &request) {
    const auto [session, transfer_id] = request.unpack<int32_t, string>();
    return result_of_file(files_.accept(request.slot, session, transfer_id));
}

Answer<Variant> PttInterface::reject_file(const Request &request) {
    const auto [session, transfer_id] = request.unpack<int32_t, string>();
    return result_of_file(files_.reject(request.slot, session, transfer_id));
}

Answer<Variant> PttInterface::cancel_file(const Request &request) {
    const auto [number] = request.unpack<int32_t>();
    return result_of_file(files_.cancel(request.slot, number));
}

} // namespace sim
