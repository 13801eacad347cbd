// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/DLFVersionReport.h"

#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::Each;

class OwnVersionReportTest : public testing::Test {
protected:
    OwnVersionReportTest() { resources.version = "0.1.0"; }

    [[nodiscard]] std::vector<std::uint8_t> report() const {
        std::vector<std::uint8_t> buffer(dlfVersionReportSize);
        std::size_t written = 0;
        EXPECT_EQ(addOwnVersionReport(buffer, written, clock), 0);
        EXPECT_EQ(written, 161u);
        return buffer;
    }

    FakeClock clock;
    FakeResources resources;
};

TEST_F(OwnVersionReportTest, NamesTheProgramAndTheTime) {
    clock.setZone({-5h - 30min, false});
    const Data expected =
        joined(hex("A1 00                   // record length: 161\n"
                   "FD 1F                   // log code\n"
                   "00 00 00 00 00 00 00 00 // time stamp\n"
                   "01 00                   // first report number\n"
                   "01 00                   // second report number\n"
                   "56 65 6C 6D 6F 72 00    // version: \"Velmora 0.1.0\" cut to six characters\n"
                   "45 58 45 43 55 54 41 42 4C 45 5F 4E 41 4D 45 // \"EXECUTABLE_NAME\"\n"),
               Data(std::vector<std::uint8_t>(25)), // the rest of 40
               hex("53 65 70 20 31 31 20 32 30 31 39 20 31 38 3A 35 34 // \"Sep 11 2019 18:54\": seventeen "
                   "characters\n"
                   "00\n"
                   "D0 8D FA 6A // 2026-11-16 05:00:00: 20,773 days and 5 hours are 1,794,805,200 seconds\n"
                   "B6 FE       // -330 minutes\n"
                   "00 00       // no daylight-saving time\n"),
               Data(std::vector<std::uint8_t>(72)));
    ASSERT_EQ(expected.size(), 161u);
    EXPECT_THAT(report(), testing::ElementsAreArray(expected.bytes()));
}

TEST_F(OwnVersionReportTest, UnknownVersionIsNamedAsSuch) {
    resources.version = std::nullopt;
    const std::vector<std::uint8_t> bytes = report();
    EXPECT_EQ(std::string(bytes.begin() + 16, bytes.begin() + 23), std::string("(none)\0", 7));
}

TEST_F(OwnVersionReportTest, ZoneAndDaylightSavingAreTheMoments) {
    clock.setZone({2h, true});
    const std::vector<std::uint8_t> bytes = report();
    EXPECT_EQ(bytes[85], 120);
    EXPECT_EQ(bytes[86], 0);
    EXPECT_EQ(bytes[87], 1);
    EXPECT_EQ(bytes[88], 0);
}

TEST_F(OwnVersionReportTest, ZoneMinutesAreCutTowardZero) {
    clock.setZone({-90s, false});
    EXPECT_EQ(report()[85], 0xFF); // -1, not -2
    EXPECT_EQ(report()[86], 0xFF);
}

TEST(VersionReportTest, ShortBufferGetsNothing) {
    std::array<std::uint8_t, 160> buffer{};
    std::size_t written = 7;
    EXPECT_EQ(DLFAddVersionReport(buffer, written, 1, 1, "v", "e", "b", ~std::uint64_t{0}), 3);
    EXPECT_EQ(written, 0u);
    EXPECT_THAT(buffer, Each(0));
}

TEST(VersionReportTest, ALongerBufferIsUnchangedAfterTheReport) {
    std::array<std::uint8_t, 162> buffer{};
    buffer[160] = buffer[161] = 0xEE;
    std::size_t written = 0;
    EXPECT_EQ(DLFAddVersionReport(buffer, written, 0x0102, 0x0304, "v", "e", "b", 0), 0);
    EXPECT_EQ(written, 161u);
    EXPECT_EQ(buffer[12], 2);
    EXPECT_EQ(buffer[13], 1);
    EXPECT_EQ(buffer[14], 4);
    EXPECT_EQ(buffer[15], 3);
    EXPECT_EQ(buffer[160], 0);
    EXPECT_EQ(buffer[161], 0xEE);
}

} // namespace
} // namespace velmora
