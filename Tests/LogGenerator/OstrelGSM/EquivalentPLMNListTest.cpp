// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/EquivalentPLMNList.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inArray<EquivalentPLMNList>;

TEST(EquivalentPLMNList, ShowsOneNetwork) {
    const Data one = record(0x7150, R"(
        00 00 00            # not read
        01                  # one entry
        03 02 01 06 00 00   # 310, 260
    )");
    SectionHarness section = make();
    section.update(one);
    EXPECT_EQ(section.node(), "[{Mobile Country Code '310', Mobile Network Code '260'}]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(EquivalentPLMNList, EntriesOverlap) {
    // Three bytes apart and six bytes long: the second begins in the middle of the first.
    SectionHarness section = make();
    section.update(record(0x7150, "00 00 00 02   02 03 06 01 02 00   02 07 00"));
    // First: 2 3 6 1 2 0, so MCC 2.6.2 and MNC 3.1.0. Second: 1 2 0 2 7 0, so MCC 1.0.7 and MNC 2.2.0.
    EXPECT_EQ(section.node(), "[{Mobile Country Code '262', Mobile Network Code '310'}, "
                              "{Mobile Country Code '107', Mobile Network Code '220'}]");
}

TEST(EquivalentPLMNList, TakesBytesAsTheyAreForDigits) {
    SectionHarness section = make();
    section.update(record(0x7150, "00 00 00 01   FF 00 FF 00 FF 0F"));
    // 255 * 111 = 28305.
    EXPECT_EQ(section.node(), "[{Mobile Country Code '28305', Mobile Network Code '15'}]");
}

TEST(EquivalentPLMNList, NoEntriesEmptyTheList) {
    SectionHarness section = make();
    section.update(record(0x7150, "00 00 00 00   03 02 01 06 00 00"));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(EquivalentPLMNList, EndsWithTheLastCompleteEntry) {
    const Data two = record(0x7150, "00 00 00 02   02 03 06 01 02 00   02 07 00");
    ASSERT_EQ(two.size(), 26u);
    expectPrefixes(make, two, 17, "Equivalent PLMN List", [](std::size_t length) -> std::string {
        if (length < 23)
            return "[]";
        if (length < 26)
            return "[{Mobile Country Code '262', Mobile Network Code '310'}]";
        return "[{Mobile Country Code '262', Mobile Network Code '310'}, "
               "{Mobile Country Code '107', Mobile Network Code '220'}]";
    });
    SectionHarness section = make();
    section.update(prefixOf(two, 25));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x7150: 1 of 2 entries"));
    section.update(withByte(two, 16, 255));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x7150: 2 of 255 entries"));
}

TEST(EquivalentPLMNList, KeepsTheArrayObject) {
    SectionHarness section = make();
    const Array* array = section.value().asArray();
    section.update(record(0x7150, "00 00 00 01   03 02 01 06 00 00"));
    EXPECT_EQ(section.value().asArray(), array);
}

} // namespace

} // namespace velmora
