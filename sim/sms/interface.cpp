// SPDX-License-Identifier: Apache-2.0
#include "sim/sms/interface.hpp"

namespace sim {

namespace {

using std::int32_t;
using std::string;

constexpr SignalInfo kSignals[] = {
    {"IncomingSms", "(isii)"},
    {"SendSmsAck", "(iiisii)"},
    {"DeliveryReportAck", "(ii)"},
};

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

struct ToSignal {
    Signal operator()(const IncomingSms &e) const {
        return {"IncomingSms", wire::pack(length_of(e.tpdu), to_base64(e.tpdu), e.number, e.kind)};
    }
    Signal operator()(const SendSmsAck &e) const {
        return {"SendSmsAck", wire::pack(e.number, e.cause, e.reference, to_base64(e.tpdu),
                                         length_of(e.tpdu), int32_t{e.try_again})};
    }
    Signal operator()(const DeliveryReportAck &e) const {
        return {"DeliveryReportAck", wire::pack(e.number, e.code)};
    }
};

} // namespace

const MethodRow<SmsInterface> SmsInterface::kMethods[] = {
    {"SendSms", "(isisi)", "(iiii)", Caller::kFirstArgument, &SmsInterface::send_sms},
    {"SendDeliverReport", "(iisii)", "(iiii)", Caller::kFirstArgument,
     &SmsInterface::send_deliver_report},
};

Interface SmsInterface::describe() {
    return {kName, bind_methods<SmsInterface>(*this, kMethods), kSignals};
}

Answer<Variant> SmsInterface::send_sms(const Request &request) {
    const auto [app, tpdu_text, length, address_text, option] =
        request.unpack<int32_t, string, int32_t, string, int32_t>();
    const auto tpdu = from_base64(tpdu_text, "TPDU");
    if (!tpdu)
        return tpdu.refusal();
    const auto address = from_base64(address_text, "service centre's address");
    if (!address)
        return address.refusal();
    const auto receipt = centre_.submit(request.slot, {*tpdu, length, *address, option});
    if (!receipt)
        return receipt.refusal();
    return wire::pack(Result::kOk, receipt->number, receipt->reference, option);
}

Answer<Variant> SmsInterface::send_deliver_report(const Request &request) {
    const auto [app, code, tpdu_text, length, option] =
        request.unpack<int32_t, int32_t, string, int32_t, int32_t>();
    const auto tpdu = from_base64(tpdu_text, "TPDU");
    if (!tpdu)
        return tpdu.refusal();
    const auto number = centre_.report(request.slot, {code, *tpdu, length, option});
    if (!number)
        return number.refusal();
    return wire::pack(Result::kOk, *number, code, option);
}

Signal to_signal(const MessageEvent &event) {
    return std::visit(ToSignal{}, event);
}

} // namespace sim
