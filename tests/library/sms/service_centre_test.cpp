// SPDX-License-Identifier: Apache-2.0
// The service centre's address: rewritten in the caller's buffer, sent, and left rewritten.
#include "tests/support/expectations.hpp"
#include "tests/support/with_peer.hpp"

namespace test {
namespace {

using Octets = std::vector<std::uint8_t>;

// So many digits, the type of address, and what belongs to it. On the heap and not one byte longer
// than what is to be sent: reading past the end is noticed.
Octets address(std::uint8_t digits, std::size_t size) {
    Octets octets(size);
    for (std::size_t i = 0; i < size; ++i)
        octets[i] = static_cast<std::uint8_t>(0x91 + 7 * i);
    octets[0] = digits;
    return octets;
}

Octets with_first(Octets octets, std::uint8_t first) {
    octets[0] = first;
    return octets;
}

class ServiceCentre : public WithPeer {
  protected:
    // Sends the buffer's address; what the service gets.
    Octets send(Octets &sca) {
        const ims_sms_send_info_s info{nullptr, 0, sca.data(), 9};
        EXPECT_EQ(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
        const Call sent = requests().back();
        EXPECT_EQ(sent.member, "SendSms");
        EXPECT_EQ(sent.signature, "isisi");
        const Variant text{g_variant_get_child_value(sent.body.get(), 3)};
        gsize length = 0;
        guchar *decoded = g_base64_decode(g_variant_get_string(text.get(), nullptr), &length);
        const Octets octets(decoded, decoded + length);
        g_free(decoded);
        return octets;
    }
};

struct DigitCase {
    std::uint8_t digits;
    std::uint8_t rewritten; // the octets behind the first
    std::size_t sent;       // all of them
};

void PrintTo(const DigitCase &tested, std::ostream *out) {
    *out << int{tested.digits} << " digits";
}

constexpr DigitCase kDigitCases[] = {
    {0, 1, 2},     {1, 2, 3},       {2, 2, 3},       {3, 3, 4},      {4, 3, 4},     {11, 7, 8},
    {12, 7, 8},    {20, 11, 12},    {21, 12, 13},    {126, 64, 65},  {127, 65, 66}, {128, 65, 66},
    {129, 66, 67}, {253, 128, 129}, {254, 128, 129}, {255, 129, 130}};

class DigitCount : public ServiceCentre, public ::testing::WithParamInterface<DigitCase> {};

INSTANTIATE_TEST_SUITE_P(Sms, DigitCount, ::testing::ValuesIn(kDigitCases),
                         [](const auto &tested) { return std::to_string(tested.param.digits); });

TEST_P(DigitCount, BecomesAnOctetCountInTheCallersBufferWhichIsSent) {
    const auto &[digits, rewritten, size] = GetParam();
    Octets buffer = address(digits, size);
    const Octets expected = with_first(buffer, rewritten);
    EXPECT_EQ(send(buffer), expected);
    EXPECT_EQ(buffer, expected);
    EXPECT_TRUE(take_log().empty());
}

TEST_P(DigitCount, LeavesWhatFollowsTheAddressUnreadAndUntouched) {
    const auto &[digits, rewritten, size] = GetParam();
    Octets buffer = address(digits, size + 16);
    const Octets expected = with_first(buffer, rewritten);
    EXPECT_EQ(send(buffer), Octets(expected.begin(), expected.begin() + std::ptrdiff_t(size)));
    EXPECT_EQ(buffer, expected);
}

TEST_F(ServiceCentre, ElevenDigitsAreSentAsSevenOctetsAfterTheLengthAndTheBufferHoldsSeven) {
    Octets buffer{11, 0x91, 0x44, 0x77, 0x58, 0x10, 0x06, 0xF0};
    EXPECT_EQ(send(buffer), (Octets{7, 0x91, 0x44, 0x77, 0x58, 0x10, 0x06, 0xF0}));
    EXPECT_EQ(buffer[0], 7);
}

TEST_F(ServiceCentre, NoDigitsBecomeOneOctetTheTypeOfAddressAlone) {
    Octets buffer{0, 0x81};
    EXPECT_EQ(send(buffer), (Octets{1, 0x81}));
    EXPECT_EQ(buffer, (Octets{1, 0x81}));
}

TEST_F(ServiceCentre, IsRewrittenAgainWhenSentAgain) {
    Octets buffer = address(11, 8);
    send(buffer);
    // The seven octets are taken for digits now.
    Octets shorter = with_first(address(11, 8), 5);
    shorter.resize(6);
    EXPECT_EQ(send(buffer), shorter);
    EXPECT_EQ(buffer, with_first(address(11, 8), 5));
}

TEST_F(ServiceCentre, IsSentTheSameWayAgainWhenTheCallerRestoresItsDigits) {
    Octets buffer = address(11, 8);
    const Octets first = send(buffer);
    buffer[0] = 11;
    EXPECT_EQ(send(buffer), first);
    EXPECT_EQ(buffer[0], 7);
}

TEST_F(ServiceCentre, IsRewrittenWhateverTheServiceAnswers) {
    for (const Answer &answer : {failure(error_name::kAccessDenied), failure(error_name::kFailed),
                                 reply("(iiii)", "(5, 0, 0, 0)")}) {
        peer().on("org.kelvo.ims.Sms.SendSms", answer);
        Octets buffer = address(11, 8);
        send(buffer);
        fence();
        EXPECT_EQ(buffer, with_first(address(11, 8), 7));
    }
}

TEST_F(ServiceCentre, IsLeftAloneByARequestThatIsNotMade) {
    Octets buffer = address(11, 8);
    const ims_sms_send_info_s info{nullptr, 0, buffer.data(), 9};
    EXPECT_EQ(ims_sms_send_sms(nullptr, &info, nullptr, nullptr), IMS_ERROR_INVALID_PARAMETER);
    for (const Gate gate : {Gate::kOff, Gate::kFailing}) {
        set_gate(gate);
        EXPECT_NE(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    }
    EXPECT_EQ(buffer, address(11, 8));
    EXPECT_TRUE(requests().empty());
}

TEST_F(ServiceCentre, ANullOneIsSentAsAnEmptyText) {
    const ims_sms_send_info_s info{nullptr, 0, nullptr, 9};
    EXPECT_EQ(ims_sms_send_sms(handle_, &info, nullptr, nullptr), IMS_ERROR_NONE);
    expect_sent(requests().back(), "(isisi)", "(42, '', 0, '', 9)");
}

} // namespace
} // namespace test
