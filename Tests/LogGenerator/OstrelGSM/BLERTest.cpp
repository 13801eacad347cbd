// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/BLER.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inDictionary<BLER>;

constexpr const char* firstRow =
    "{Transport Channel ID '32', CRC Received '100000', CRC Received in Error '1500'}";
constexpr const char* secondRow =
    "{Transport Channel ID '255', CRC Received '-1', CRC Received in Error '-2147483648'}";

TEST(BLER, ShowsWindowAndChannels) {
    const Data full = record(0x4116, R"(
        02              # two channels
        64 80           # window: 32868, unsigned
        20              # channel: 32
        A0 86 01 00     # received: 100000
        DC 05 00 00     # in error: 1500
        FF              # channel: 255
        FF FF FF FF     # received: -1, signed
        00 00 00 80     # in error: -2147483648
    )");
    ASSERT_EQ(full.size(), 34u);
    expectPrefixes(make, full, 16, "BLER", [](std::size_t length) {
        std::string rows;
        if (length >= 25)
            rows += firstRow;
        if (length >= 34)
            rows += std::string(", ") + secondRow;
        return "{Window Size '32868', Transport Channels [" + rows + "]}";
    });
    SectionHarness section = make();
    section.update(full);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "BLER"}}));
    section.update(prefixOf(full, 33));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x4116: 1 of 2 entries"));
    section.update(withByte(full, 13, 255));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x4116: 2 of 255 entries"));
}

TEST(BLER, NoChannelsEmptyTheList) {
    SectionHarness section = make();
    section.update(record(0x4116, "01 05 00   01 02 00 00 00 03 00 00 00"));
    const Value earlier = (*section.value().asDictionary())["Transport Channels"];
    section.update(record(0x4116, "00 06 00"));
    EXPECT_EQ(section.node(), "{Window Size '6', Transport Channels []}");
    EXPECT_THAT(section.errors(), IsEmpty());
    EXPECT_EQ(shown(earlier), "[{Transport Channel ID '1', CRC Received '2', CRC Received in Error '3'}]");
}

} // namespace

} // namespace velmora
