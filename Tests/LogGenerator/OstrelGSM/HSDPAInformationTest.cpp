// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/HSDPAInformation.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inDictionary<HSDPAInformation>;

constexpr std::string_view statusText = "Version '2', Sub Frames '200', Carrier Info 'Single Carrier'";
constexpr std::string_view processBytes = R"(
    07              # process
    FE FF FF FF     # received bits: 4294967294, unsigned
    FF FF           # new transmissions: 65535
    00 80           # block errors: 32768
)";
constexpr std::string_view processText =
    "{Process ID '7', No Rx Bits '4294967294', New Tx '65535', Block Errors '32768'}";
constexpr std::string_view otherBytes = "03 10 27 00 00 05 00 01 00";
constexpr std::string_view otherText = "{Process ID '3', No Rx Bits '10000', New Tx '5', Block Errors '1'}";

Data status(std::string_view counts) {
    return record(0x4221, "02 C8 00 " + std::string(counts));
}

std::string node(std::string_view lists) {
    return "{" + std::string(statusText) + std::string(lists) + "}";
}

TEST(HSDPAInformation, ShowsTheStatus) {
    struct Case {
        const char* name;
        const char* bytes;
        const char* expected;
    };
    const Case cases[] = {
        {"nothing set", "00 00 00 00 00", "{Version '0', Sub Frames '0', Carrier Info 'Single Carrier'}"},
        {"eight low bits", "FF FF 00 00 00",
         "{Version '255', Sub Frames '255', Carrier Info 'Single Carrier'}"},
        {"two high bits", "00 00 03 00 00", "{Version '0', Sub Frames '768', Carrier Info 'Single Carrier'}"},
        {"two antennas", "00 01 05 00 00", "{Version '0', Sub Frames '257', Carrier Info 'MIMO'}"},
        {"two carriers", "00 00 08 00 00", "{Version '0', Sub Frames '0', Carrier Info 'Dual Carrier'}"},
        {"all ten bits", "00 FF FF 00 00", "{Version '0', Sub Frames '1023', Carrier Info 'Reserved'}"},
        {"bits above the carrier are not read", "00 00 F0 00 00",
         "{Version '0', Sub Frames '0', Carrier Info 'Single Carrier'}"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(record(0x4221, c.bytes));
        EXPECT_EQ(section.node(), c.expected);
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "HSDPA Info"}}));
    }
}

TEST(HSDPAInformation, ShowsThePrimaryProcesses) {
    const Data full = joined(status("02 00"), hex(processBytes), hex(otherBytes));
    ASSERT_EQ(full.size(), 36u);
    const std::string one = node(", Primary HARQ Process [" + std::string(processText) + "]");
    const std::string two =
        node(", Primary HARQ Process [" + std::string(processText) + ", " + std::string(otherText) + "]");
    expectPrefixes(make, full, 18, "HSDPA Info", [&](std::size_t length) {
        return length < 27 ? node(", Primary HARQ Process []") : length < 36 ? one : two;
    });
    SectionHarness section = make();
    section.update(prefixOf(full, 35));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "HSDPA Info"},
                                         {LogPriority::Error, "Record 0x4221: 1 of 2 entries"}}));
}

TEST(HSDPAInformation, SecondaryProcessesAre162BytesAfterEachPrimaryOne) {
    std::vector<std::uint8_t> gap(162 - 9, 0xEE);
    const Data full = joined(status("01 01"), hex(processBytes), Data(std::move(gap)), hex(otherBytes));
    ASSERT_EQ(full.size(), 189u);
    const std::string primary = ", Primary HARQ Process [" + std::string(processText) + "]";
    SectionHarness section = make();
    section.update(full);
    EXPECT_EQ(section.node(), node(primary + ", Secondary HARQ Process [" + std::string(otherText) + "]"));
    EXPECT_THAT(section.errors(), IsEmpty());

    expectPrefixes(make, full, 18, "HSDPA Info", [&](std::size_t length) {
        return node((length < 27 ? ", Primary HARQ Process []" : primary) +
                    (length < 189 ? ", Secondary HARQ Process []"
                                  : ", Secondary HARQ Process [" + std::string(otherText) + "]"));
    });
    section.update(prefixOf(full, 188));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x4221: 0 of 1 entries"));
    section.update(prefixOf(full, 26)); // each list says for itself what it lacks
    EXPECT_THAT(section.errors(),
                ElementsAre("Record 0x4221: 0 of 1 entries", "Record 0x4221: 0 of 1 entries"));
    section.update(withByte(withByte(full, 16, 255), 17, 255)); // secondary ones would begin at 41328
    EXPECT_THAT(section.errors(),
                ElementsAre("Record 0x4221: 19 of 255 entries", "Record 0x4221: 0 of 255 entries"));
}

TEST(HSDPAInformation, SecondaryProcessesWithTwoPrimaryOnes) {
    const Data full =
        joined(status("02 02"), hex(otherBytes), hex(otherBytes),
               Data(std::vector<std::uint8_t>(2 * 162 - 18)), hex(processBytes), hex(otherBytes));
    ASSERT_EQ(full.size(), 360u); // 18 + 324 + 18
    SectionHarness section = make();
    section.update(full);
    EXPECT_EQ(shown((*section.value().asDictionary())["Secondary HARQ Process"]),
              "[" + std::string(processText) + ", " + std::string(otherText) + "]");
}

TEST(HSDPAInformation, SecondaryProcessesAloneFollowTheStatus) {
    SectionHarness section = make();
    section.update(joined(status("00 01"), hex(processBytes)));
    EXPECT_EQ(section.node(), node(", Secondary HARQ Process [" + std::string(processText) + "]"));
}

TEST(HSDPAInformation, AListWithoutProcessesStaysAsItWas) {
    SectionHarness section = make();
    section.update(joined(status("01 00"), hex(processBytes)));
    section.update(joined(status("00 01"), hex(otherBytes)));
    const std::string both = node(", Primary HARQ Process [" + std::string(processText) +
                                  "], Secondary HARQ Process [" + std::string(otherText) + "]");
    EXPECT_EQ(section.node(), both);
    section.update(status("00 00"));
    EXPECT_EQ(section.node(), both);
}

TEST(HSDPAInformation, LeavesTheListThatWasShownUnchanged) {
    SectionHarness section = make();
    section.update(joined(status("01 00"), hex(processBytes)));
    const Value earlier = (*section.value().asDictionary())["Primary HARQ Process"];
    section.update(joined(status("01 00"), hex(otherBytes)));
    EXPECT_EQ(shown(earlier), "[" + std::string(processText) + "]");
}

TEST(HSDPAInformation, IgnoresAForeignCodeWithoutAWord) {
    SectionHarness section = make();
    section.update(joined(status("01 00"), hex(processBytes)), 0x4116);
    EXPECT_EQ(section.node(), "{}");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "HSDPA Info"}}));
}

} // namespace

} // namespace velmora
