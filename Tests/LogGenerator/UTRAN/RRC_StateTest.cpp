// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/RRC_State.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

const auto make = inDictionary<RRC_State>;

CapturedLog::Line warning(const std::string& text) {
    return {LogPriority::Warning, text};
}

TEST(RRC_State, ShowsTheModeOfVersion1) {
    const Data connected = record(0xD0E0, R"(
        01              # version
        03              # mode: Cell DCH
        FF              # longer than needed
    )");
    SectionHarness section = make();
    section.update(connected);
    EXPECT_EQ(section.node(), "{State 'Cell DCH'}");
    EXPECT_EQ(
        section.lines(),
        (LogLines{warning("RRC Info"), warning("Display Dict = {State = Cell DCH}, rrc mode = 3 Cell DCH")}));
    expectEnumeration(make, record(0xD0E0, "01 00"), 14, "State",
                      {{0, "Disconnected"},
                       {1, "Connecting"},
                       {2, "Cell Fach"},
                       {3, "Cell DCH"},
                       {4, "Cell PCH"},
                       {5, "Cell URA PCH"}},
                      "Unknown RRC Mode");
}

TEST(RRC_State, AnyOtherVersionIsMode255) {
    for (unsigned version = 0; version < 256; ++version) {
        SectionHarness section = make();
        section.update(withByte(record(0xD0E0, "00 03"), 13, static_cast<std::uint8_t>(version)));
        EXPECT_EQ(section.node(), version == 1 ? "{State 'Cell DCH'}" : "{State 'Unknown RRC Mode'}")
            << version;
    }
    SectionHarness section = make();
    section.update(record(0xD0E0, "02 03"));
    EXPECT_EQ(
        section.lines(),
        (LogLines{warning("RRC Info"),
                  warning("Display Dict = {State = Unknown RRC Mode}, rrc mode = 255 Unknown RRC Mode")}));
}

TEST(RRC_State, AShortRecordIsWarnedOfAndDecodedAllTheSame) {
    const Data connected = record(0xD0E0, "01 03");
    ASSERT_EQ(connected.size(), 15u);
    for (std::size_t length = 0; length < connected.size(); ++length) {
        SCOPED_TRACE("a record cut to " + std::to_string(length) + " bytes");
        SectionHarness section = make();
        section.update(connected); // what it shows before
        section.update(prefixOf(connected, length), 0xD0E0);
        // At 14 bytes the version is there and the mode is not.
        EXPECT_EQ(section.node(), "{State 'Unknown RRC Mode'}");
        EXPECT_EQ(section.lines(), (LogLines{warning("RRC Info"),
                                             warning("LogCode_0xD0E0 is length is " + std::to_string(length) +
                                                     " expected size 15"),
                                             warning("Display Dict = {State = Unknown RRC Mode}, "
                                                     "rrc mode = 255 Unknown RRC Mode")}));
    }
}

TEST(RRC_State, DescribesTheWholeNodeOnOneLine) {
    // A user's template may have more under the section's name.
    const Value node = std::make_shared<Dictionary>(Dictionary{
        {"Unit", "1"},
        {"State", "?"},
        {"Rows", std::make_shared<Array>(Array{"a", std::make_shared<Dictionary>(Dictionary{{"B", "c"}})})}});
    SectionHarness section(std::make_unique<RRC_State>(), node);
    section.update(record(0xD0E0, "01 00"));
    EXPECT_EQ(section.lines().back(),
              warning("Display Dict = {Unit = 1; State = Disconnected; Rows = (a, {B = c})}, "
                      "rrc mode = 0 Disconnected"));
}

TEST(RRC_State, WithoutANodeTheLinesAreWrittenAlone) {
    RRC_State section;
    CapturedLog log;
    section.updateWithData(record(0xD0E0, "01 02"), 0xD0E0);
    EXPECT_EQ(log.lines(),
              (LogLines{warning("RRC Info"), warning("Display Dict = (null), rrc mode = 2 Cell Fach")}));
}

} // namespace

} // namespace velmora
