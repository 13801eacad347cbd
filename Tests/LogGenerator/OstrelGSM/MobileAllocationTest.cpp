// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/MobileAllocation.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inDictionary<MobileAllocation>;

TEST(MobileAllocation, ShowsSequenceNumberAndChannels) {
    const Data full = record(0x51F8, R"(
        3F          # hopping sequence number: 63
        03          # three channels
        01 00       # 1
        FF 03       # 1023
        00 80       # 32768, unsigned
    )");
    ASSERT_EQ(full.size(), 21u);
    expectPrefixes(make, full, 15, "MobileAllocation", [](std::size_t length) {
        return length < 17   ? "{HSN '63', ARFCNs []}"
               : length < 19 ? "{HSN '63', ARFCNs ['1']}"
               : length < 21 ? "{HSN '63', ARFCNs ['1', '1023']}"
                             : "{HSN '63', ARFCNs ['1', '1023', '32768']}";
    });
    SectionHarness section = make();
    section.update(full);
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(prefixOf(full, 20));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x51F8: 2 of 3 entries"));
    section.update(withByte(full, 14, 255));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x51F8: 3 of 255 entries"));
}

TEST(MobileAllocation, NoChannelsEmptyTheList) {
    SectionHarness section = make();
    section.update(record(0x51F8, "01 01 05 00"));
    section.update(record(0x51F8, "02 00 05 00"));
    EXPECT_EQ(section.node(), "{HSN '2', ARFCNs []}");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(MobileAllocation, LeavesTheListThatWasShownUnchanged) {
    SectionHarness section = make();
    section.update(record(0x51F8, "01 01 05 00"));
    const Value earlier = (*section.value().asDictionary())["ARFCNs"];
    section.update(record(0x51F8, "01 01 06 00"));
    EXPECT_EQ(shown(earlier), "['5']");
    EXPECT_EQ(section.node(), "{HSN '1', ARFCNs ['6']}");
}

} // namespace

} // namespace velmora
