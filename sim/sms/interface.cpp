// SPDX-License-Identifier: Apache-2.0
#include "sim/sms/interface.hpp"

#include "sim/bus/ask.hpp"
#include "sim/bus/tell.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;
using enum Caller;

string to_base64(const tpdu::Octets &octets) {
    return wire::encode_base64(string(octets.begin(), octets.end()));
}

int32_t length_of(const tpdu::Octets &octets) {
    return static_cast<int32_t>(octets.size());
}

Answer<tpdu::Octets> from_base64(const string &text, std::string_view what) {
    const auto bytes = wire::decode_base64(text);
    if (!bytes)
        return refuse(Result::kInvalidArgument, "the {} is no base64", what);
    return tpdu::Octets(bytes->begin(), bytes->end());
}

Answer<std::tuple<int32_t, int32_t, int32_t>> send_sms(ServiceCentre &centre, int slot,
                                                       const string &tpdu_text, int32_t length,
                                                       const string &address_text, int32_t option) {
    const auto tpdu = from_base64(tpdu_text, "TPDU");
    if (!tpdu)
        return tpdu.refusal();
    const auto address = from_base64(address_text, "service centre's address");
    if (!address)
        return address.refusal();
    const auto receipt = centre.submit(slot, {*tpdu, length, *address, option});
    if (!receipt)
        return receipt.refusal();
    return std::tuple(receipt->number, receipt->reference, option);
}

Answer<std::tuple<int32_t, int32_t, int32_t>> send_deliver_report(ServiceCentre &centre, int slot,
                                                                  int32_t code,
                                                                  const string &tpdu_text,
                                                                  int32_t length, int32_t option) {
    const auto tpdu = from_base64(tpdu_text, "TPDU");
    if (!tpdu)
        return tpdu.refusal();
    const auto number = centre.report(slot, {code, *tpdu, length, option});
    if (!number)
        return number.refusal();
    return std::tuple(*number, code, option);
}

constexpr MethodRow<ServiceCentre> kMethods[] = {
    {"SendSms", ask<send_sms>, kFirstArgument},
    {"SendDeliverReport", ask<send_deliver_report>, kFirstArgument},
};

auto incoming(const IncomingSms &e) {
    return std::tuple(length_of(e.tpdu), to_base64(e.tpdu), e.number, e.kind);
}

auto send_ack(const SendSmsAck &e) {
    return std::tuple(e.number, e.cause, e.reference, to_base64(e.tpdu), length_of(e.tpdu),
                      int32_t{e.try_again});
}

constexpr SignalTable kSignals{
    SignalRow{"IncomingSms", incoming},
    SignalRow{"SendSmsAck", send_ack},
    SignalRow<DeliveryReportAck>{"DeliveryReportAck"},
};

} // namespace

Interface SmsInterface::describe() {
    return {kName, bind_methods(kMethods, centre_), kSignals.infos()};
}

Signal to_signal(const MessageEvent &event) {
    return kSignals.signal_of(event);
}

} // namespace sim
