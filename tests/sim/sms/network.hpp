// SPDX-License-Identifier: Apache-2.0
#pragma once

#include "tests/sim/network.hpp"
#include "tests/sim/sms/messages.hpp"

#include <optional>
#include <string>
#include <vector>

namespace sim::test {

inline constexpr const char *kSlot1 = "+15550101";

// The network as those who write to each other see it.
class Messages : public NetworkTest {
  protected:
    static SubmitRequest request(const tpdu::Submit &submit) {
        const auto octets = must(tpdu::encode(submit));
        return {octets, static_cast<std::int32_t>(octets.size()), {}, 0};
    }
    Answer<SubmitReceipt> try_send(int slot, const tpdu::Submit &submit) {
        return centre_.submit(slot, request(submit));
    }
    void send(int slot, const tpdu::Submit &submit) { expect_accepted(try_send(slot, submit)); }
    void send_and_deliver(int slot, const tpdu::Submit &submit) {
        send(slot, submit);
        advance(500ms);
    }
    Answer<std::int32_t> try_report(int slot, std::int32_t code = 0, std::int32_t option = 0) {
        tpdu::DeliverReport report;
        if (code != 0)
            report.failure_cause = 0xD3;
        const auto octets = must(tpdu::encode(report));
        return centre_.report(slot,
                              {code, octets, static_cast<std::int32_t>(octets.size()), option});
    }

    // What a slot has been told of one kind since it was last asked.
    template <typename T>
    std::vector<T> told(int slot) {
        std::vector<T> found;
        std::vector<MessageEvent> others;
        for (auto &event : messages_[slot])
            if (auto *wanted = std::get_if<T>(&event))
                found.push_back(*wanted);
            else
                others.push_back(event);
        messages_[slot] = others;
        return found;
    }
    SendSmsAck acknowledgement(int slot) {
        const auto found = told<SendSmsAck>(slot);
        EXPECT_EQ(found.size(), 1u);
        return found.empty() ? SendSmsAck{} : found.front();
    }
    std::optional<std::uint8_t> failure_cause(const SendSmsAck &ack) {
        const auto kind = ack.cause == 0 ? tpdu::ReportKind::kAck : tpdu::ReportKind::kError;
        return must(tpdu::decode_submit_report(ack.tpdu, kind)).failure_cause;
    }
    std::vector<tpdu::Deliver> received(int slot) {
        std::vector<tpdu::Deliver> found;
        for (const auto &incoming : told<IncomingSms>(slot))
            if (incoming.kind == IncomingKind::kMessage)
                found.push_back(must(tpdu::decode_deliver(incoming.tpdu)));
        return found;
    }
    std::vector<std::string> texts(int slot) {
        std::vector<std::string> found;
        for (const auto &deliver : received(slot))
            found.push_back(must(tpdu::decode_text(deliver.data_coding, deliver.user_data.body)));
        return found;
    }
    std::vector<tpdu::StatusReport> status_reports(int slot) {
        std::vector<tpdu::StatusReport> found;
        for (const auto &incoming : told<IncomingSms>(slot))
            if (incoming.kind == IncomingKind::kStatusReport)
                found.push_back(must(tpdu::decode_status_report(incoming.tpdu)));
        return found;
    }
    std::vector<int> statuses(int slot) {
        std::vector<int> found;
        for (const auto &report : status_reports(slot))
            found.push_back(report.status);
        return found;
    }
    static tpdu::Submit asking(tpdu::Submit submit) {
        submit.status_report_request = true;
        return submit;
    }
};

} // namespace sim::test
