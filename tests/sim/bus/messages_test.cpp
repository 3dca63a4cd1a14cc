// SPDX-License-Identifier: Apache-2.0
// Short messages between two applications.
#include "tests/sim/bus/bus_client.hpp"
#include "tests/sim/sms/messages.hpp"

#include "sim/bus/wire.hpp"

namespace sim::test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::StartsWith;

std::string base64(const tpdu::Octets &octets) {
    return wire::encode_base64(std::string(octets.begin(), octets.end()));
}

tpdu::Octets octets_of(const std::string &base64_text) {
    const auto bytes = wire::decode_base64(base64_text);
    EXPECT_TRUE(bytes) << base64_text;
    return bytes ? tpdu::Octets(bytes->begin(), bytes->end()) : tpdu::Octets{};
}

class BusMessages : public Served {
  protected:
    BusMessages() : BusMessages({"--speed", "0"}) {}
    explicit BusMessages(std::vector<std::string> options) : Served(std::move(options)) {
        other_ = another();
        client_->register_application(0); // application 1
        other_->register_application(1);  // application 2
    }

    std::string ask(const char *method, const std::string &arguments) {
        const auto reply = client_->call(0, kSms, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
    std::string ask_other(const char *method, const std::string &arguments) {
        const auto reply = other_->call(1, kSms, method, arguments);
        return reply.error.empty() ? reply.body : reply.error + ": " + reply.text;
    }
    std::string send(const tpdu::Submit &submit) {
        const auto octets = must(tpdu::encode(submit));
        return ask("SendSms",
                   fmt::format("(1, '{}', {}, 'BpFRVQUB8A==', 0)", base64(octets), octets.size()));
    }
    // The next message or status report of a slot, with the length that its signal says checked.
    struct Incoming {
        tpdu::Octets tpdu;
        int number;
        int kind;
    };
    static Incoming next_incoming(Client &client, int slot) {
        const auto text = client.wait_for(slot, "IncomingSms");
        const auto body = Variant::adopt(
            g_variant_parse(G_VARIANT_TYPE("(isii)"), text.c_str(), nullptr, nullptr, nullptr));
        const char *encoded = "";
        gint32 length = -1;
        gint32 number = -1;
        gint32 kind = -1;
        g_variant_get(body.get(), "(i&sii)", &length, &encoded, &number, &kind);
        auto tpdu = octets_of(encoded);
        EXPECT_EQ(static_cast<std::size_t>(length), tpdu.size());
        return {std::move(tpdu), number, kind};
    }
    tpdu::Deliver next_message() {
        return must(tpdu::decode_deliver(next_incoming(*other_, 1).tpdu));
    }
    static std::string text_of(const tpdu::Deliver &deliver) {
        return must(tpdu::decode_text(deliver.data_coding, deliver.user_data.body));
    }

    std::unique_ptr<Client> other_;
};

TEST_F(BusMessages, Gsm7) {
    EXPECT_EQ(send(submit_to("+15550101", "Grüße @ {home} 5€", 17)), "(0, 1, 17, 0)");
    EXPECT_THAT(client_->next_signal(), StartsWith("sub0 SendSmsAck (1, 0, 17, "));
    const auto deliver = next_message();
    EXPECT_EQ(text_of(deliver), "Grüße @ {home} 5€");
    EXPECT_EQ(deliver.data_coding, 0);
    EXPECT_EQ(tpdu::to_text(deliver.originator), "+15550100");
}

TEST_F(BusMessages, Ucs2) {
    EXPECT_EQ(send(submit_to("+15550101", "日本語 и русский")), "(0, 1, 0, 0)");
    const auto deliver = next_message();
    EXPECT_EQ(text_of(deliver), "日本語 и русский");
    EXPECT_EQ(deliver.data_coding, 8);
}

TEST_F(BusMessages, ThreeParts) {
    std::string text;
    while (text.size() < 440)
        text += "All good things come in threes. ";
    const auto parts = submits_to("+15550101", text);
    ASSERT_EQ(parts.size(), 3u);
    for (int i = 0; i < 3; ++i)
        EXPECT_EQ(send(parts[static_cast<std::size_t>(i)]), fmt::format("(0, {0}, {0}, 0)", i + 1));
    tpdu::Reassembler reassembler;
    EXPECT_FALSE(reassembler.add(next_message()));
    EXPECT_FALSE(reassembler.add(next_message()));
    const auto whole = reassembler.add(next_message());
    ASSERT_TRUE(whole);
    EXPECT_EQ(must(whole->text()), text);
}

TEST_F(BusMessages, TheAcknowledgementCarriesASubmitReport) {
    send(submit_to("+15550211", "Hello", 3));
    const auto text = client_->wait_for(0, "SendSmsAck");
    EXPECT_THAT(text, StartsWith("(1, 1, 3, '"));
    EXPECT_THAT(text, HasSubstr("', 10, 0)"));
    const auto start = text.find('\'') + 1;
    const auto report = must(tpdu::decode_submit_report(
        octets_of(text.substr(start, text.rfind('\'') - start)), tpdu::ReportKind::kError));
    EXPECT_EQ(report.failure_cause, 0xC3);
}

TEST_F(BusMessages, AReportIsAcknowledgedAndReachesTheSenderAsAStatusReport) {
    auto submit = submit_to("+15550101", "Please confirm", 99);
    submit.status_report_request = true;
    send(submit);
    const auto incoming = next_incoming(*other_, 1);
    EXPECT_EQ(incoming.number, 1);
    EXPECT_EQ(incoming.kind, 0);
    const auto report = must(tpdu::encode(tpdu::DeliverReport{}));
    EXPECT_EQ(ask_other("SendDeliverReport",
                        fmt::format("(2, 0, '{}', {}, 1)", base64(report), report.size())),
              "(0, 1, 0, 1)");
    EXPECT_EQ(other_->wait_for(1, "DeliveryReportAck"), "(1, 0)");
    const auto status = next_incoming(*client_, 0);
    EXPECT_EQ(status.kind, 1);
    const auto decoded = must(tpdu::decode_status_report(status.tpdu));
    EXPECT_EQ(decoded.message_reference, 99);
    EXPECT_EQ(decoded.status, 0x00);
    EXPECT_EQ(tpdu::to_text(decoded.recipient), "+15550101");
    EXPECT_EQ(ask_other("SendDeliverReport", "(2, 0, '', 0, 0)"), "(13, 0, 0, 0)");
}

TEST_F(BusMessages, AReportOfFailureIsTakenToo) {
    auto submit = submit_to("+15550101", "Please confirm");
    submit.status_report_request = true;
    send(submit);
    next_incoming(*other_, 1);
    EXPECT_EQ(ask_other("SendDeliverReport", "(2, 22, 'ANMA', 3, 0)"), "(0, 1, 22, 0)");
    EXPECT_EQ(other_->wait_for(1, "DeliveryReportAck"), "(1, 22)");
    EXPECT_EQ(must(tpdu::decode_status_report(next_incoming(*client_, 0).tpdu)).status, 0x65);
}

TEST_F(BusMessages, ASlotThatNobodyListensOnHearsItsMessages) {
    // The one who sends listens to both slots, and nobody has registered on the other.
    other_->close();
    send(submit_to("+15550101", "Anybody there?"));
    EXPECT_EQ(text_of(must(tpdu::decode_deliver(next_incoming(*client_, 1).tpdu))),
              "Anybody there?");
}

TEST_F(BusMessages, WhatIsMalformedIsRefusedAndTheLogSaysWhy) {
    const auto octets = must(tpdu::encode(submit_to("+15550101", "Hello")));
    const auto good = base64(octets);
    const auto refused = [&](const std::string &arguments, const std::string &why) {
        EXPECT_EQ(ask("SendSms", arguments), "(10, 0, 0, 0)");
        EXPECT_THAT(program_->read_errors("refused"), HasSubstr(why));
    };
    refused("(1, 'not base64', 9, '', 0)", "the TPDU is no base64");
    refused(fmt::format("(1, '{}', {}, '!', 0)", good, octets.size()),
            "the service centre's address is no base64");
    refused(fmt::format("(1, '{}', {}, '', 0)", good, octets.size() - 1), "the length says");
    refused(fmt::format("(1, '{}', {}, 'CZFRVQUB8A==', 0)", good, octets.size()),
            "the service centre's address is malformed");
    refused(fmt::format("(1, '{}', {}, '', 7)", good, octets.size()), "not 7");
    refused("(1, 'AQAB', 3, '', 0)", "this is no SMS-SUBMIT: TP-DA");
    refused("(1, '', 0, '', 0)", "this is no SMS-SUBMIT");
    send(submit_to("+15550101", "Hello"));
    next_incoming(*other_, 1);
    for (const auto &[arguments, why] : {std::pair{"(2, 0, '?', 0, 0)", "is no base64"},
                                         {"(2, 0, 'AAA=', 1, 0)", "the length says 1"},
                                         {"(2, 0, 'AQA=', 2, 0)", "this is no SMS-DELIVER-REPORT"},
                                         {"(2, 128, 'AAA=', 2, 0)", "not 128"}}) {
        EXPECT_EQ(ask_other("SendDeliverReport", arguments), "(10, 0, 0, 0)");
        EXPECT_THAT(program_->read_errors("refused"), HasSubstr(why));
    }
}

TEST_F(BusMessages, FlightModeStoresThemUntilTheSlotIsBack) {
    EXPECT_EQ(other_->call(1, kRegistration, "EnableFlightMode").body, "(0,)");
    send(submit_to("+15550101", "See you later"));
    EXPECT_THAT(client_->wait_for(0, "SendSmsAck"), StartsWith("(1, 0, "));
    EXPECT_EQ(ask_other("SendSms", "(2, 'AQAB', 3, '', 0)"), "(13, 0, 0, 0)");
    EXPECT_EQ(ask_other("SendDeliverReport", "(2, 0, '', 0, 0)"), "(13, 0, 0, 0)");
    EXPECT_EQ(other_->wait_for(1, "RegistrationStatus"), "(false, 0, 0, 2, 0, 0)");
    EXPECT_EQ(other_->call(1, kRegistration, "RegisterApplication").body, "(0, 2)");
    EXPECT_THAT(other_->next_signal(), StartsWith("sub0 SendSmsAck"));
    EXPECT_EQ(other_->next_signal(), "sub1 RegistrationStatus (true, 1, 15, 0, 200, 3600)");
    EXPECT_EQ(text_of(next_message()), "See you later");
}

} // namespace
} // namespace sim::test
