// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/pdu.hpp"

#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <vector>

namespace {

using namespace tpdu;
using tpdu_test::hex;

using Decoder = std::function<std::optional<Error>(OctetView)>;

template <typename T>
std::optional<Error> error_of(const Result<T> &result) {
    return result ? std::nullopt : std::optional(result.error());
}

const Decoder kSubmit = [](OctetView o) { return error_of(decode_submit(o)); };
const Decoder kDeliver = [](OctetView o) { return error_of(decode_deliver(o)); };
const Decoder kStatusReport = [](OctetView o) { return error_of(decode_status_report(o)); };
const Decoder kDeliverAck = [](OctetView o) {
    return error_of(decode_deliver_report(o, ReportKind::kAck));
};
const Decoder kDeliverError = [](OctetView o) {
    return error_of(decode_deliver_report(o, ReportKind::kError));
};
const Decoder kSubmitAck = [](OctetView o) {
    return error_of(decode_submit_report(o, ReportKind::kAck));
};
const Decoder kSubmitError = [](OctetView o) {
    return error_of(decode_submit_report(o, ReportKind::kError));
};
const Decoder kFromMobile = [](OctetView o) { return error_of(decode_from_mobile(o)); };
const Decoder kToMobile = [](OctetView o) { return error_of(decode_to_mobile(o)); };

struct DecodeErrorRow {
    Decoder decode;
    std::string octets;
    ErrorKind kind;
    std::string message;
};

std::string repeated_octet(std::string_view octet, std::size_t count) {
    std::string text;
    for (std::size_t i = 0; i < count; ++i)
        text += octet;
    return text;
}

const std::string kScts = "1340908051030A";
const std::string kSubmitHead = "01 00 01 81 F1 00";    // up to TP-PID, no header
const std::string kSubmitHeadUdh = "41 00 01 81 F1 00"; // the same with a header

const std::vector<DecodeErrorRow> kDecodeErrors = {
    // The type
    {kSubmit, "", ErrorKind::kTruncated, "TP-MTI is missing: the message ends before it"},
    {kSubmit, "00 00", ErrorKind::kMalformed, "TP-MTI is 0 but an SMS-SUBMIT has 1"},
    {kDeliver, "01 00", ErrorKind::kMalformed, "TP-MTI is 1 but an SMS-DELIVER has 0"},
    {kStatusReport, "04", ErrorKind::kMalformed, "TP-MTI is 0 but an SMS-STATUS-REPORT has 2"},
    {kDeliverAck, "02", ErrorKind::kMalformed, "TP-MTI is 2 but an SMS-DELIVER-REPORT has 0"},
    {kSubmitAck, "03", ErrorKind::kMalformed, "TP-MTI is 3 but an SMS-SUBMIT-REPORT has 1"},
    {kFromMobile, "", ErrorKind::kTruncated, "TP-MTI is missing: the message is empty"},
    {kToMobile, "", ErrorKind::kTruncated, "TP-MTI is missing: the message is empty"},
    {kFromMobile, "02 00", ErrorKind::kUnsupported,
     "TP-MTI is 2, an SMS-COMMAND, which is not supported"},
    {kFromMobile, "03 00", ErrorKind::kMalformed, "TP-MTI is 3, a reserved value"},
    // SUBMIT, field by field
    {kSubmit, "01", ErrorKind::kTruncated, "TP-MR is missing: the message ends before it"},
    {kSubmit, "01 00", ErrorKind::kTruncated, "TP-DA is missing: the message ends before it"},
    {kSubmit, "01 00 03 81 21", ErrorKind::kTruncated,
     "TP-DA says 3 semi-octets but only 1 octet follows"},
    {kSubmit, "01 00 16 81" + repeated_octet("11", 11), ErrorKind::kTooLong,
     "TP-DA says 22 semi-octets but holds 20 at most"},
    {kSubmit, "01 00 01 81 F1", ErrorKind::kTruncated,
     "TP-PID is missing: the message ends before it"},
    {kSubmit, kSubmitHead, ErrorKind::kTruncated, "TP-DCS is missing: the message ends before it"},
    {kSubmit, "11 00 01 81 F1 00 00", ErrorKind::kTruncated,
     "TP-VP is missing: the message ends before it"},
    {kSubmit, "19 00 01 81 F1 00 00 1340", ErrorKind::kTruncated,
     "TP-VP needs 7 octets but only 2 octets follow"},
    {kSubmit, "09 00 01 81 F1 00 00 00", ErrorKind::kTruncated,
     "TP-VP needs 7 octets but only 1 octet follows"},
    {kSubmit, kSubmitHead + "00", ErrorKind::kTruncated,
     "TP-UDL is missing: the message ends before it"},
    // TP-UDL against what is there
    {kSubmit, kSubmitHead + "00 28" + repeated_octet("41", 12), ErrorKind::kTruncated,
     "TP-UDL says 40 septets but only 12 octets follow"},
    {kSubmit, kSubmitHead + "00 02 41", ErrorKind::kTruncated,
     "TP-UDL says 2 septets but only 1 octet follows"},
    {kSubmit, kSubmitHead + "04 01", ErrorKind::kTruncated,
     "TP-UDL says 1 octet but only 0 octets follow"},
    {kSubmit, kSubmitHead + "00 A1" + repeated_octet("41", 141), ErrorKind::kTooLong,
     "TP-UDL says 161 septets but an SMS-SUBMIT carries 160 at most"},
    {kSubmit, kSubmitHead + "08 8E" + repeated_octet("41", 142), ErrorKind::kTooLong,
     "TP-UDL says 142 octets but an SMS-SUBMIT carries 140 at most"},
    // The classic slip of counting octets where septets count: 9 septets take 8 octets only.
    {kSubmit, kSubmitHead + "00 09 E8329BFD4697D9EC37", ErrorKind::kTrailing,
     "TP-UD ends before the message does: 1 octet left over"},
    {kSubmit, kSubmitHead + "04 01 AABBCC", ErrorKind::kTrailing,
     "TP-UD ends before the message does: 2 octets left over"},
    // The header
    {kSubmit, kSubmitHeadUdh + "04 00", ErrorKind::kMalformed,
     "TP-UDH is announced by TP-UDHI but TP-UD is empty"},
    {kSubmit, kSubmitHeadUdh + "04 03 05 0003", ErrorKind::kTruncated,
     "TP-UDH says 5 octets but only 2 octets follow in TP-UD"},
    {kSubmit, kSubmitHeadUdh + "04 04 03 0003 07", ErrorKind::kTruncated,
     "TP-UDH has the element 0x00 of 3 octets but only 1 octet follows in the header"},
    {kSubmit, kSubmitHeadUdh + "04 05 01 00 AABBCC", ErrorKind::kTruncated,
     "TP-UDH ends inside an information element: one octet left"},
    {kSubmit, kSubmitHeadUdh + "00 01 00", ErrorKind::kMalformed,
     "TP-UDL says 1 septet but the header alone takes 2"},
    {kSubmit, kSubmitHeadUdh + "00 06 05 00 03 070302", ErrorKind::kMalformed,
     "TP-UDL says 6 septets but the header alone takes 7"},
    // DELIVER
    {kDeliver, "04 02 81 21 00 00 13", ErrorKind::kTruncated,
     "TP-SCTS needs 7 octets but only 1 octet follows"},
    {kDeliver, "04 02 01 21", ErrorKind::kMalformed,
     "TP-OA has the type of address 0x01, whose top bit is not set"},
    {kDeliver, "04 02 81 21 00 00" + kScts + "A1" + repeated_octet("41", 141), ErrorKind::kTooLong,
     "TP-UDL says 161 septets but an SMS-DELIVER carries 160 at most"},
    {kDeliver, "04 02 81 21 00 00" + kScts + "00 00", ErrorKind::kTrailing,
     "TP-UD ends before the message does: 1 octet left over"},
    // STATUS-REPORT
    {kStatusReport, "06 2A 02 91 F1", ErrorKind::kMalformed,
     "TP-RA has the filler 0xF in place of digit 2 of 2"},
    {kStatusReport, "06 2A 01 91 F1" + kScts, ErrorKind::kTruncated,
     "TP-DT needs 7 octets but only 0 octets follow"},
    {kStatusReport, "06 2A 01 91 F1" + kScts + kScts, ErrorKind::kTruncated,
     "TP-ST is missing: the message ends before it"},
    {kStatusReport, "06 2A 01 91 F1" + kScts + kScts + "00 07 00", ErrorKind::kTruncated,
     "TP-DCS is missing: the message ends before it"},
    {kStatusReport, "06 2A 01 91 F1" + kScts + kScts + "00 00 00", ErrorKind::kTrailing,
     "TP-PI ends before the message does: 1 octet left over"},
    {kStatusReport, "06 2A 01 91 F1" + kScts + kScts + "00 06 04 84" + repeated_octet("41", 132),
     ErrorKind::kTooLong, "TP-UDL says 132 octets but an SMS-STATUS-REPORT carries 131 at most"},
    // Reports
    {kDeliverAck, "00", ErrorKind::kTruncated, "TP-PI is missing: the message ends before it"},
    {kDeliverAck, "00 81", ErrorKind::kTruncated, "TP-PI is missing: the message ends before it"},
    {kDeliverAck, "00 01", ErrorKind::kTruncated, "TP-PID is missing: the message ends before it"},
    {kDeliverAck, "00 01 00 00", ErrorKind::kTrailing,
     "TP-PID ends before the message does: 1 octet left over"},
    {kDeliverAck, "00 02 00 00", ErrorKind::kTrailing,
     "TP-DCS ends before the message does: 1 octet left over"},
    {kDeliverAck, "00 06 04 A0" + repeated_octet("41", 160), ErrorKind::kTooLong,
     "TP-UDL says 160 octets but an SMS-DELIVER-REPORT of success carries 159 at most"},
    {kDeliverError, "00", ErrorKind::kTruncated, "TP-FCS is missing: the message ends before it"},
    {kDeliverError, "00 D3", ErrorKind::kTruncated, "TP-PI is missing: the message ends before it"},
    {kDeliverError, "00 D3 06 04 9F" + repeated_octet("41", 159), ErrorKind::kTooLong,
     "TP-UDL says 159 octets but an SMS-DELIVER-REPORT of failure carries 158 at most"},
    {kSubmitAck, "01 00 1340", ErrorKind::kTruncated,
     "TP-SCTS needs 7 octets but only 2 octets follow"},
    {kSubmitAck, "01 04" + kScts + "AE" + repeated_octet("41", 153), ErrorKind::kTooLong,
     "TP-UDL says 174 septets but an SMS-SUBMIT-REPORT of success carries 173 at most"},
    {kSubmitError, "01 C4", ErrorKind::kTruncated, "TP-PI is missing: the message ends before it"},
    {kSubmitError, "01 C4 04" + kScts + "AD" + repeated_octet("41", 152), ErrorKind::kTooLong,
     "TP-UDL says 173 septets but an SMS-SUBMIT-REPORT of failure carries 172 at most"},
    // Through the general decoders the error is that of the message meant
    {kFromMobile, "01", ErrorKind::kTruncated, "TP-MR is missing: the message ends before it"},
    {kToMobile, "02", ErrorKind::kTruncated, "TP-MR is missing: the message ends before it"},
    {kToMobile, "01 C4 00", ErrorKind::kTruncated,
     "TP-SCTS needs 7 octets but only 0 octets follow"},
};

TEST(DecodeErrors, NameTheFieldAndTheProblem) {
    for (const DecodeErrorRow &row : kDecodeErrors) {
        const auto error = row.decode(hex(row.octets));
        ASSERT_TRUE(error) << row.octets << " was accepted; expected: " << row.message;
        EXPECT_EQ(error->message, row.message);
        EXPECT_EQ(error->kind, row.kind) << row.message;
        EXPECT_EQ(error->field, row.message.substr(0, row.message.find(' ')));
    }
}

} // namespace
