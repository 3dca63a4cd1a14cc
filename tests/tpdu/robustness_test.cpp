// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/tpdu.hpp"

#include <gtest/gtest.h>

#include <array>
#include <vector>

// Whatever comes in, every decoder answers with a record or an error that says something. Run under
// the address and undefined behaviour sanitizers, these tests also show that nothing is read past
// the end: each input is a heap block of exactly its size.

namespace {

using namespace tpdu;
using tpdu_test::hex;
using tpdu_test::must;
using tpdu_test::Random;

/// How often the decoders took an input, and how often a taken one could be encoded again.
struct Tally {
    std::size_t decoded = 0;
    std::size_t encoded = 0;
    std::size_t refused = 0;
};

Result<Octets> encode_any(const FromMobile &message) {
    return std::visit([](const auto &held) { return encode(held); }, message);
}
Result<Octets> encode_any(const ToMobile &message) {
    return std::visit([](const auto &held) { return encode(held); }, message);
}
template <typename T>
Result<Octets> encode_any(const T &message) {
    return encode(message);
}

void check_error(const Error &error, OctetView octets) {
    EXPECT_FALSE(error.field.empty()) << to_hex(octets);
    EXPECT_EQ(error.message.rfind(error.field + ' ', 0), 0U) << error.message;
}

/// A decoded record, once encoded, has to decode to itself.
template <typename Decode>
void check(OctetView octets, Decode decode, Tally &tally) {
    const auto decoded = decode(octets);
    if (!decoded) {
        ++tally.refused;
        check_error(decoded.error(), octets);
        return;
    }
    ++tally.decoded;
    const auto encoded = encode_any(*decoded);
    if (!encoded) {
        check_error(encoded.error(), octets);
        return;
    }
    ++tally.encoded;
    const auto again = decode(*encoded);
    ASSERT_TRUE(again) << to_hex(octets) << " -> " << to_hex(*encoded) << ": "
                       << again.error().message;
    ASSERT_EQ(*again, *decoded) << to_hex(octets) << " -> " << to_hex(*encoded);
}

void check_texts(OctetView octets) {
    for (const std::uint8_t data_coding : {0x00, 0x04, 0x08, 0x20, 0xE0}) {
        const auto text = decode_text(data_coding, octets);
        if (text) {
            // What comes out is well-formed.
            EXPECT_TRUE(utf16_units(*text)) << to_hex(octets);
        }
    }
    for (std::size_t fill = 0; fill < 7; ++fill) {
        const std::size_t bits = octets.size() * 8;
        const std::size_t whole = bits < fill ? 0 : (bits - fill) / 7;
        EXPECT_TRUE(unpack_septets(octets, whole, fill));
        EXPECT_FALSE(unpack_septets(octets, whole + 1, fill));
    }
}

void check_everything(const Octets &input, Tally &tally) {
    const Octets octets(input.begin(), input.end());
    check(octets, decode_submit, tally);
    check(octets, decode_deliver, tally);
    check(octets, decode_status_report, tally);
    for (const ReportKind kind : {ReportKind::kAck, ReportKind::kError}) {
        // Its encoded form may be of the other kind only if the cause was a reserved one, which
        // encoding refuses.
        check(
            octets, [kind](OctetView o) { return decode_deliver_report(o, kind); }, tally);
        check(
            octets, [kind](OctetView o) { return decode_submit_report(o, kind); }, tally);
    }
    check(octets, decode_from_mobile, tally);
    check(octets, decode_to_mobile, tally);
    const auto address = decode_address(octets);
    if (address) {
        EXPECT_TRUE(encode_address(*address)) << to_hex(octets);
    }
    const auto service_centre = decode_service_centre(octets);
    if (service_centre) {
        EXPECT_TRUE(encode_service_centre(*service_centre)) << to_hex(octets);
    }
    const auto time = decode_timestamp(octets);
    if (time) {
        EXPECT_EQ(encode_timestamp(*time).ok(), is_valid(*time));
    }
}

const std::vector<std::string> kValid = {
    "31 2A 08 91 51551010 00 00 A7 0A E8329BFD4697D9EC37",
    "01 00 01 81 F1 00 04 03 00FF80",
    "09 00 01 81 F1 00 08 43 214365 000000 04 D83DDE00",
    "19 00 05 81 2143F5 40 F6 1340908051030A 01 AB",
    "41 00 01 81 F1 00 00 06 02 70 00 101402",
    "41 00 01 81 F1 00 04 10 0E 7F020102 0003070302 7F00 E001FF AA",
    "04 0D D0 D772988E2ECB01 00 00 1340908051030A 0C C8F71D14969741F977FD07",
    "44 08 91 51550010 00 00 1340908051030A 09 05 00 03 07 03 02 8242",
    "06 2A 08 91 51551010 1340908051030A 1340908061030A 00",
    "66 01 02 81 21 1340908051030A 1340908061030A 46 07 41 04 05 02 70 00 CAFE",
    "00 00",
    "00 D3 00",
    "40 06 04 04 02 70 00 AB",
    "00 D5 07 7F 04 02 0102",
    "01 00 1340908051030A",
    "01 C4 00 1340908051030A",
    "41 C3 07 1340908051030A 00 08 07 04 70 02 0102 6F22",
};

TEST(Robustness, EveryPrefixOfEveryValidMessage) {
    Tally tally;
    for (const std::string &text : kValid) {
        const Octets whole = hex(text);
        for (std::size_t size = 0; size <= whole.size(); ++size) {
            const auto end = whole.begin() + static_cast<std::ptrdiff_t>(size);
            check_everything(Octets(whole.begin(), end), tally);
        }
    }
    EXPECT_GT(tally.encoded, kValid.size());
    EXPECT_GT(tally.refused, kValid.size());
}

TEST(Robustness, APrefixIsNeverTakenForTheWholeMessage) {
    // TP-UDL, the last field before the data, fixes where the message ends. (A status report may
    // end before its parameters, so its prefixes are left out here.)
    for (const std::string &text : kValid) {
        const Octets whole = hex(text);
        const unsigned type = whole[0] & 0x03U;
        for (std::size_t size = 0; size < whole.size(); ++size) {
            const OctetView prefix = OctetView(whole).first(size);
            if (type == 1) {
                EXPECT_FALSE(decode_submit(prefix)) << text;
            }
            if (type == 0) {
                EXPECT_FALSE(decode_deliver(prefix)) << text;
            }
        }
    }
}

TEST(Robustness, EveryOctetChanged) {
    Tally tally;
    for (const std::string &text : kValid) {
        const Octets whole = hex(text);
        for (std::size_t i = 0; i < whole.size(); ++i) {
            Octets changed = whole;
            for (unsigned bit = 0; bit < 8; ++bit) {
                changed[i] = static_cast<std::uint8_t>(whole[i] ^ 1U << bit);
                check_everything(changed, tally);
            }
            for (const std::uint8_t value : {0x00, 0x7F, 0x80, 0xFF}) {
                changed[i] = value;
                check_everything(changed, tally);
            }
        }
    }
    EXPECT_GT(tally.encoded, 1000U);
    EXPECT_GT(tally.refused, 1000U);
}

TEST(Robustness, OctetsInsertedRemovedAndMixed) {
    Random random(11);
    Tally tally;
    for (int i = 0; i < 3000; ++i) {
        Octets octets = hex(kValid[random.below(static_cast<std::uint32_t>(kValid.size()))]);
        for (std::uint32_t change = 1 + random.below(3); change > 0; --change) {
            const auto place = octets.begin() + static_cast<std::ptrdiff_t>(random.below(
                                                    static_cast<std::uint32_t>(octets.size())));
            if (random.coin())
                octets.insert(place, random.octet());
            else if (octets.size() > 1)
                octets.erase(place);
            else
                *place = random.octet();
        }
        check_everything(octets, tally);
    }
    EXPECT_GT(tally.decoded, 100U);
}

TEST(Robustness, RandomOctets) {
    Random random(12);
    Tally tally;
    for (int i = 0; i < 10000; ++i)
        check_everything(random.octets(random.below(200)), tally);
    EXPECT_GT(tally.refused, 10000U);
}

TEST(Robustness, RandomTexts) {
    Random random(13);
    for (int i = 0; i < 3000; ++i) {
        const Octets octets = random.octets(random.below(180));
        check_texts(octets);
        // Any bytes as text: an error or messages that give the same text back.
        const std::string text(octets.begin(), octets.end());
        const auto parts = segment(text);
        EXPECT_EQ(parts.ok(), utf16_units(text).has_value());
    }
}

} // namespace
