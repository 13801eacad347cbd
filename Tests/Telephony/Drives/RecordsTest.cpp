// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMCellRecords.h"
#include "Telephony/Drives/GSM/RegistrationRecords.h"
#include "Telephony/Drives/GSM/UMTSRecords.h"
#include "Telephony/Drives/ServiceRecords.h"

#include "LogMessages/RecordTime.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <functional>
#include <string>

namespace velmora {
namespace {

using namespace records;

const GSMCell gsmA{62, 37, 10101, {{1, 1}, 4101, 1}};
const GSMCell gsmB{540, 5, 258, {{1, 1}, 4101, 1}};
const UMTSCell umtsA{10588, 300, 0x041012D, {{1, 1}, 4101, 1}};

struct Layout {
    const char* name;
    RecordBuilder made;
    Data wanted;
};

class RecordLayout : public ::testing::TestWithParam<Layout> {};

TEST_P(RecordLayout, isAsDocumented) {
    EXPECT_EQ(GetParam().made.message(zeroHour()), GetParam().wanted);
}

INSTANTIATE_TEST_SUITE_P(
    Registration, RecordLayout,
    ::testing::Values(
        Layout{"gmm",
               gmmState(GMMState::Registered, GMMSubState::AttemptingToUpdate, UpdateStatus::NotUpdated),
               record(0x7130, "03 // GMM_REGISTERED\n 09 // attempting to update\n 01 // not updated")},
        Layout{"mm", mmState(MMState::Idle, MMSubState::NormalService, UpdateStatus::Updated),
               record(0x7131, "13 // MM_IDLE\n 08 // normal service\n 00 // updated")},
        Layout{"registration", registrationState(RegistrationState::AutomaticSearch),
               record(0x7132, "05 // automatic search\n 00 // PLMN selection automatic\n 00")},
        Layout{"network", servingNetwork(1, ServiceType::CSAndPS, {{260, 10}, 4101, 7}),
               record(0x7135, "01       // operating mode\n"
                              "03       // CS and PS\n"
                              "62 F0 01 // MCC 260, MNC 10 with its filler\n"
                              "10 05    // LAC 4101, big-endian\n"
                              "07       // RAC\n"
                              "00 00 00 00 00 00 00 00 00 00 00")},
        Layout{"oneEquivalent", equivalentNetworks({{310, 260}}),
               record(0x7150, "00 00 00\n"
                              "01                // count\n"
                              "03 02 01 06 00 00 // MCC and MNC digits in turn")},
        Layout{"twoEquivalents", equivalentNetworks({{1, 2}, {123, 456}}),
               record(0x7150, "00 00 00\n"
                              "02             // count\n"
                              "00 00 00       // first half of 001-002\n"
                              "00 01 02       // its second half, and the first of the next\n"
                              "05 03 06       // second MNC, third MCC, third MNC digit")},
        Layout{"noEquivalents", equivalentNetworks({}), record(0x7150, "00 00 00\n00 // count")}),
    [](const auto& each) { return std::string(each.param.name); });

INSTANTIATE_TEST_SUITE_P(
    GSM, RecordLayout,
    ::testing::Values(
        Layout{"serving", gsmServingCell(gsmA),
               record(0x5134,
                      "3E 00 // ARFCN 62\n 25 00 // BSIC 37\n 75 27 // cell 10101\n 00 00 00 00 00 00 00")},
        Layout{"measurements", gsmMeasurements({&gsmA, -85}, 30, true, {{&gsmB, -108}}),
               record(0x5137, "00 00\n"
                              "55          // 85: -85 dBm\n"
                              "14 00 00 00 // C1: -85 + 105\n"
                              "1E 00 00 00 // C2\n"
                              "00 00\n"
                              "01          // hysteresis\n"
                              "00\n"
                              "01          // neighbours\n"
                              "1C 02       // ARFCN 540\n"
                              "6C          // -108 dBm\n"
                              "FD FF FF FF // C1: -108 + 105\n"
                              "00 00 00 00 00 00 00")},
        Layout{"dedicated", dedicatedChannel(512), record(0x5076, "00 02 // ARFCN\n 00 00")},
        Layout{"bsics", bsicList({{&gsmA, -85}, {&gsmB, -90}}),
               record(0x51FF, "00\n 02 // count\n 3E 00 25 00 // 62: BSIC 37\n 1C 02 05 00 // 540: BSIC 5")},
        Layout{"si13", si13Position(1), record(0x51F4, "00\n 01 // extended BCCH")},
        Layout{"options", gprsCellOptions(1, 7, 2),
               record(0x51F5, "01 // PFC\n 07 // threshold\n 02 // NC2\n 00 00")},
        Layout{"timers", gprsTimers(4, 2, true),
               record(0x51F6, "00 00\n 04 // T3192\n 02 // DRX timer\n 01 // 11 bits\n 00 00 00 00 00 00")},
        Layout{"pbcch", pbcchPresence(true),
               record(0x51FB, "01 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00")},
        Layout{"packetSI", packetSystemInformation(1, 2, 3, 4, true),
               record(0x51FD,
                      "01 // PSI status\n 02 // LR\n 03 // HR\n 04 // extended order\n"
                      "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00\n 01 // SI status, offset 33\n 00")},
        Layout{"rr", rrState(RRState::DataTransfer, 2, 1, true),
               record(0x512C, "09 // data transfer\n 02 // sub state\n 01 // status\n 01 // data")},
        Layout{"dtx", discontinuousTransmission(true), record(0x5072, "00 00 00 00 00 00 01")},
        Layout{"hopping", mobileAllocation(9, {62, 540}),
               record(0x51F8, "09 // HSN\n 02 // count\n 3E 00 1C 02")}),
    [](const auto& each) { return std::string(each.param.name); });

INSTANTIATE_TEST_SUITE_P(
    UMTS, RecordLayout,
    ::testing::Values(Layout{"rankedGSM", rankedGSMCells({{&gsmB, -80}}),
                             record(0x4005, "00    // no UMTS cells\n"
                                            "01    // GSM cells\n"
                                            "1C 02 // ARFCN 540\n"
                                            "05 00 // BSIC\n"
                                            "B0    // -80 dBm\n"
                                            "B0 FF // ranked by it")},
                      Layout{"rankedUMTS", rankedUMTSCells({{&umtsA, -101, -7.5}}),
                             record(0x4005, "01    // UMTS cells\n"
                                            "00    // no GSM cells\n"
                                            "5C 29 // UARFCN 10588\n"
                                            "2C 01 // scrambling code 300\n"
                                            "B0    // -101 + 21\n"
                                            "9B FF // rank RSCP -101\n"
                                            "F1    // -7.5 dB in halves\n"
                                            "9B FF // ranking value")},
                      Layout{"transmit", transmitPowers({0.0, -30.0}),
                             record(0x4031, "00\n 02 // count\n 00\n"
                                            "00 00 00 00 BC 00 00 00 00 00 00 00 00 00 // 188: 0 dBm\n"
                                            "00 00 00 00 90 FF 00 00 00 00 00 00 00 00 // -112: -30 dBm")},
                      Layout{"bler", blockErrorRates(100, {{5, 1000, 17}}),
                             record(0x4116, "01 // count\n 64 00 // window\n 05 // channel\n E8 03 00 00 // "
                                            "CRCs\n 11 00 00 00 // errors")},
                      Layout{"rrc", rrcState(RRCState::URAPCH), record(0x4125, "05")},
                      Layout{"serving", umtsServingCell(umtsA, 1),
                             record(0x4127, "A6 25 00 00 // uplink 9638\n"
                                            "5C 29 00 00 // downlink 10588\n"
                                            "2D 01 41 00 // cell\n"
                                            "01 00       // URA\n"
                                            "00 00")},
                      Layout{"ciphering", ciphering(true), record(0x4157, "01 00 00 00 00 00")},
                      Layout{"searcher", searchedCells(-75.0, {{{&umtsA, -85, 0.0}, 1}}),
                             record(0x417A,
                                    "36 FF // (-75 + 106) * 10 - 512 = -202\n"
                                    "01    // cells\n"
                                    "00 00 00 00 00 00 00 2C 21 00 00 00 00 00 00 // code 300, set type 1\n"
                                    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00\n"
                                    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00\n"
                                    "00 00 08 00 // 2^19: 0 dB\n"
                                    "00 00 04 00\n"
                                    "00 00 02 00")},
                      Layout{"harq", harqStatistics(0x2C8, {{3, 7168, 10, 2}}, {}),
                             record(0x4221, "01          // version\n"
                                            "C8          // sub-frames, low bits\n"
                                            "02          // their high bits; single carrier\n"
                                            "01          // primary processes\n"
                                            "00          // secondary processes\n"
                                            "03          // process\n"
                                            "00 1C 00 00 // bits\n"
                                            "0A 00       // new transmissions\n"
                                            "02 00       // block errors")}),
    [](const auto& each) { return std::string(each.param.name); });

TEST(RecordLayoutTest, secondaryProcessesFollowBlocksOf162Bytes) {
    const Data message =
        harqStatistics(0, {{0, 1, 1, 0}, {1, 1, 1, 0}}, {{4, 0x01020304, 7, 8}}).message(zeroHour());
    // 18 + 162 * 2 = 342, nine bytes each.
    ASSERT_EQ(message.size(), 351U);
    EXPECT_EQ(message.bytes()[15], 0x08) << "dual carrier in bits 2 and 3";
    EXPECT_EQ(message.bytes()[17], 1);
    EXPECT_EQ(message.from(342), hex("04 04 03 02 01 07 00 08 00"));
}

TEST(RecordBuilderTest, stampsTheHeader) {
    const Time moment = zeroHour() + std::chrono::hours(24 * 365 * 46);
    const std::uint64_t timestamp = recordTimestamp(moment);
    const Data message = RecordBuilder(0x1234, 15).u16(13, 0xABCD).message(moment);
    ASSERT_EQ(message.size(), 15U);
    EXPECT_EQ(Data::copyOf(message.bytes().first(5)),
              hex("01 // type\n 0E 00 // 14 bytes follow\n 34 12 // code"));
    for (std::size_t i = 0; i < 8; ++i)
        EXPECT_EQ(message.bytes()[5 + i], timestamp >> (8 * i) & 0xFF) << i;
    EXPECT_EQ(message.from(13), hex("CD AB"));
}

TEST(RecordBuilderTest, growsAndIsCut) {
    RecordBuilder builder(1, 13);
    EXPECT_EQ(builder.u32(20, 1).size(), 24U);
    EXPECT_EQ(builder.cutTo(15).size(), 15U);
    EXPECT_EQ(builder.cutTo(100).size(), 15U);
    EXPECT_EQ(builder.cutTo(3).size(), 13U) << "the header stays";
}

TEST(RecordBuilderTest, aRecordTooLongForItsLengthFieldShowsTheLargest) {
    const Data message = RecordBuilder(1, 0x10010).message(zeroHour());
    EXPECT_EQ(message.size(), 0x10010U);
    EXPECT_EQ(Data::copyOf(message.bytes().subspan(1, 2)), hex("FF FF"));
}

TEST(ServiceRecordsTest, bothFormsCarryTheSameArray) {
    const std::vector<DictionaryRef> cells = {gsmCellInformation({&gsmA, -85}, true),
                                              umtsCellInformation({&umtsA, -95, -9.5}, false)};
    const ArrayRef wanted = makeArray();
    wanted->append(std::make_shared<Dictionary>(
        Dictionary{{"kVoxCellMonitorCellRadioAccessTechnology", "kVoxCellMonitorRadioAccessTechnologyGSM"},
                   {"kVoxCellMonitorCellType", "kVoxCellMonitorCellTypeServing"},
                   {"kVoxCellMonitorMCC", 1},
                   {"kVoxCellMonitorMNC", 1},
                   {"kVoxCellMonitorLAC", 4101},
                   {"kVoxCellMonitorCellId", 10101},
                   {"kVoxCellMonitorARFCN", 62},
                   {"kVoxCellMonitorRSSI", -42}, // in steps of two decibels
                   {"kVoxCellMonitorBandInfo", 900}}));
    wanted->append(std::make_shared<Dictionary>(
        Dictionary{{"kVoxCellMonitorCellRadioAccessTechnology", "kVoxCellMonitorRadioAccessTechnologyUMTS"},
                   {"kVoxCellMonitorCellType", "kVoxCellMonitorCellTypeNeighbor"},
                   {"kVoxCellMonitorMCC", 1},
                   {"kVoxCellMonitorMNC", 1},
                   {"kVoxCellMonitorLAC", 4101},
                   {"kVoxCellMonitorCellId", 0x041012D},
                   {"kVoxCellMonitorUARFCN", 10588},
                   {"kVoxCellMonitorSCN", 300},
                   {"kVoxCellMonitorRSCP", -95},
                   {"kVoxCellMonitorECN0", -9},
                   {"kVoxCellMonitorBandInfo", 1}}));
    for (const bool binary : {false, true}) {
        const Data message = cellInformation(cells, binary).message(zeroHour());
        EXPECT_EQ(message.bytes()[0], 0xFF);
        EXPECT_EQ(Data::copyOf(message.bytes().subspan(3, 2)), hex("01 00"));
        const std::string start(message.bytes().begin() + 13, message.bytes().begin() + 19);
        EXPECT_EQ(start, binary ? "bplist" : "<?xml ");
        const auto payload = readPropertyList(message.from(13).bytes());
        ASSERT_TRUE(payload);
        EXPECT_EQ(*payload, Value(wanted));
    }
}

} // namespace
} // namespace velmora
