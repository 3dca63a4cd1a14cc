// SPDX-License-Identifier: Apache-2.0
#include "bench/traffic.hpp"

#include "bench/protocol.hpp"

#include <memory>

namespace bench {
namespace {

void wait_for(const Arrivals &arrivals, std::int64_t count) {
    while (arrivals.count() < count)
        g_main_context_iteration(nullptr, TRUE);
}

} // namespace

RequestTraffic::RequestTraffic(const Client &client, const Side &side)
    : client_{client}, side_{side} {}

void RequestTraffic::send(std::int64_t requests) {
    ims_call_make_info_s info{"+15550100", 0, "sip:+15550199@ims.example", "", "", ""};
    for (; requests > 0; --requests) {
        info.call_type = static_cast<std::int32_t>(++sent_);
        side_.request(client_, info, answers_);
    }
}

void RequestTraffic::exchange(std::int64_t answers) {
    answers_.set_follow_up([this] { send(1); });
    exchanged_ += answers;
    wait_for(answers_, exchanged_);
}

void RequestTraffic::drain() {
    answers_.set_follow_up(nullptr);
    wait_for(answers_, sent_);
    exchanged_ = sent_;
}

SignalTraffic::SignalTraffic(const Client &client, const Side &side)
    : client_{client}, side_{side}, subscription_{side.subscribe(client, events_)} {
    ask();
    ask();
}

SignalTraffic::~SignalTraffic() {
    side_.unsubscribe(client_, subscription_);
}

void SignalTraffic::ask() {
    client_.tell_peer(kEmitMethod, g_variant_new("(ui)", static_cast<guint32>(kBurst),
                                                 static_cast<gint32>(asked_ + 1)));
    asked_ += kBurst;
}

void SignalTraffic::receive() {
    received_ += kBurst;
    wait_for(events_, received_);
    ask();
}

void SignalTraffic::drain() {
    wait_for(events_, asked_);
}

bool read_calls(const Client &client, const Side &side) {
    ims_call_list_info_s list{};
    const bool is_good = side.query(client, list) && list.count == 2 &&
                         list.entries[1].session_id == 2 && list.entries[1].peer_uri != nullptr;
    ims_call_list_info_clear(&list);
    return is_good;
}

} // namespace bench
