// SPDX-License-Identifier: Apache-2.0
#include "tests/tpdu/support.hpp"

#include "tpdu/data_coding.hpp"

#include <gtest/gtest.h>

#include <vector>

namespace {

using tpdu::Alphabet;
using tpdu::CodingGroup;
using tpdu::DataCoding;
using tpdu::MessageClass;
using tpdu::MessageWaiting;
using tpdu::WaitingKind;
using tpdu_test::must;

struct CodingRow {
    std::uint8_t octet;
    DataCoding coding;
};

constexpr auto kNoClass = std::nullopt;
constexpr auto kNoWaiting = std::nullopt;

const std::vector<CodingRow> kCodingRows = {
    {0x00, {CodingGroup::kGeneral, Alphabet::kGsm7, false, kNoClass, kNoWaiting}},
    {0x04, {CodingGroup::kGeneral, Alphabet::kEightBit, false, kNoClass, kNoWaiting}},
    {0x08, {CodingGroup::kGeneral, Alphabet::kUcs2, false, kNoClass, kNoWaiting}},
    {0x10, {CodingGroup::kGeneral, Alphabet::kGsm7, false, MessageClass::kFlash, kNoWaiting}},
    {0x15,
     {CodingGroup::kGeneral, Alphabet::kEightBit, false, MessageClass::kMobileSpecific,
      kNoWaiting}},
    {0x1A, {CodingGroup::kGeneral, Alphabet::kUcs2, false, MessageClass::kSimSpecific, kNoWaiting}},
    {0x20, {CodingGroup::kGeneral, Alphabet::kGsm7, true, kNoClass, kNoWaiting}},
    {0x3B,
     {CodingGroup::kGeneral, Alphabet::kUcs2, true, MessageClass::kTerminalEquipment, kNoWaiting}},
    {0x40, {CodingGroup::kAutomaticDeletion, Alphabet::kGsm7, false, kNoClass, kNoWaiting}},
    {0x58,
     {CodingGroup::kAutomaticDeletion, Alphabet::kUcs2, false, MessageClass::kFlash, kNoWaiting}},
    {0x64, {CodingGroup::kAutomaticDeletion, Alphabet::kEightBit, true, kNoClass, kNoWaiting}},
    {0xC0,
     {CodingGroup::kWaitingDiscard, Alphabet::kGsm7, false, kNoClass,
      MessageWaiting{false, WaitingKind::kVoicemail}}},
    {0xC9,
     {CodingGroup::kWaitingDiscard, Alphabet::kGsm7, false, kNoClass,
      MessageWaiting{true, WaitingKind::kFax}}},
    {0xDA,
     {CodingGroup::kWaitingStore, Alphabet::kGsm7, false, kNoClass,
      MessageWaiting{true, WaitingKind::kEmail}}},
    {0xE3,
     {CodingGroup::kWaitingStoreUcs2, Alphabet::kUcs2, false, kNoClass,
      MessageWaiting{false, WaitingKind::kOther}}},
    {0xF0, {CodingGroup::kDataOrClass, Alphabet::kGsm7, false, MessageClass::kFlash, kNoWaiting}},
    {0xF6,
     {CodingGroup::kDataOrClass, Alphabet::kEightBit, false, MessageClass::kSimSpecific,
      kNoWaiting}},
};

TEST(DataCoding, EachGroupBothWays) {
    for (const CodingRow &row : kCodingRows) {
        EXPECT_EQ(tpdu::decode_data_coding(row.octet), row.coding) << std::hex << int{row.octet};
        EXPECT_EQ(must(tpdu::encode_data_coding(row.coding)), row.octet);
    }
}

TEST(DataCoding, ReservedCodingsReadAsPlainDefaultAlphabet) {
    const DataCoding reserved{CodingGroup::kReserved, Alphabet::kGsm7, false, kNoClass, kNoWaiting};
    for (unsigned octet = 0x80; octet <= 0xBF; ++octet)
        EXPECT_EQ(tpdu::decode_data_coding(static_cast<std::uint8_t>(octet)), reserved);
    // The reserved alphabet of the general groups, compressed or not, with or without a class.
    for (const std::uint8_t octet : {0x0C, 0x1F, 0x2C, 0x3D, 0x4C, 0x7F})
        EXPECT_EQ(tpdu::decode_data_coding(octet), reserved);
}

TEST(DataCoding, ReservedSingleBitsAreIgnored) {
    EXPECT_EQ(tpdu::decode_data_coding(0x03), tpdu::decode_data_coding(0x00));
    EXPECT_EQ(tpdu::decode_data_coding(0xCD), tpdu::decode_data_coding(0xC9));
    EXPECT_EQ(tpdu::decode_data_coding(0xFE), tpdu::decode_data_coding(0xF6));
}

TEST(DataCoding, EveryOctetRoundTripsUnlessReserved) {
    for (unsigned value = 0; value <= 0xFF; ++value) {
        const DataCoding coding = tpdu::decode_data_coding(static_cast<std::uint8_t>(value));
        const auto octet = tpdu::encode_data_coding(coding);
        ASSERT_EQ(octet.ok(), coding.group != CodingGroup::kReserved) << std::hex << value;
        if (octet) {
            EXPECT_EQ(tpdu::decode_data_coding(*octet), coding) << std::hex << value;
        }
    }
}

TEST(DataCoding, RefusesWhatTheGroupCannotExpress) {
    const MessageWaiting waiting{true, WaitingKind::kFax};
    const std::vector<DataCoding> misfits = {
        {CodingGroup::kGeneral, Alphabet::kGsm7, false, kNoClass, waiting},
        {CodingGroup::kAutomaticDeletion, Alphabet::kGsm7, false, kNoClass, waiting},
        {CodingGroup::kWaitingDiscard, Alphabet::kGsm7, false, kNoClass, kNoWaiting},
        {CodingGroup::kWaitingStore, Alphabet::kUcs2, false, kNoClass, waiting},
        {CodingGroup::kWaitingStoreUcs2, Alphabet::kGsm7, false, kNoClass, waiting},
        {CodingGroup::kWaitingDiscard, Alphabet::kGsm7, true, kNoClass, waiting},
        {CodingGroup::kWaitingDiscard, Alphabet::kGsm7, false, MessageClass::kFlash, waiting},
        {CodingGroup::kDataOrClass, Alphabet::kGsm7, false, kNoClass, kNoWaiting},
        {CodingGroup::kDataOrClass, Alphabet::kUcs2, false, MessageClass::kFlash, kNoWaiting},
        {CodingGroup::kDataOrClass, Alphabet::kGsm7, true, MessageClass::kFlash, kNoWaiting},
        {CodingGroup::kDataOrClass, Alphabet::kGsm7, false, MessageClass::kFlash, waiting},
        {CodingGroup::kReserved, Alphabet::kGsm7, false, kNoClass, kNoWaiting},
    };
    for (std::size_t i = 0; i < misfits.size(); ++i) {
        const auto octet = tpdu::encode_data_coding(misfits[i]);
        ASSERT_FALSE(octet) << i;
        EXPECT_EQ(octet.error().kind, tpdu::ErrorKind::kOutOfRange);
        EXPECT_EQ(octet.error().field, "TP-DCS");
        EXPECT_EQ(octet.error().message.rfind("TP-DCS ", 0), 0U);
    }
}

TEST(DataCoding, ForAnAlphabetAndAClass) {
    EXPECT_EQ(tpdu::data_coding_for(Alphabet::kGsm7), 0x00);
    EXPECT_EQ(tpdu::data_coding_for(Alphabet::kEightBit), 0x04);
    EXPECT_EQ(tpdu::data_coding_for(Alphabet::kUcs2), 0x08);
    EXPECT_EQ(tpdu::data_coding_for(Alphabet::kUcs2, MessageClass::kFlash), 0x18);
    EXPECT_EQ(tpdu::data_coding_for(Alphabet::kGsm7, MessageClass::kTerminalEquipment), 0x13);
}

} // namespace
