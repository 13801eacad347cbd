// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/ObservationFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

constexpr Field first{"First", u8At(0), integer("%d")};
constexpr Field second{"Second", u8At(1), integer("%d dB")};
constexpr Field rows[] = {{"Channel", u8At(0), integer("%d")}, {"Cell", u8At(1), integer("%d")}};
constexpr Layout rowLayout = layout(2, rows);
constexpr Content rowContents[] = {rows};
constexpr std::string_view rowKeys[] = {"Channel", "Cell"};
constexpr List cells{.label = "Cells", .contents = rowContents, .keys = rowKeys};
constexpr List ownCells{.contents = rowContents};

constexpr Field value{"", u8At(0), integer("%d dB")};
constexpr Content valueContents[] = {value};
constexpr List ratios{"Ratios", List::Entries::Values, "", valueContents};
constexpr List pilots{"Pilots", List::Entries::Numbered, "(none)", valueContents};
constexpr Content channelContents[] = {first, ratios};
constexpr std::string_view channelKeys[] = {"First"};
constexpr List channels{.label = "Channels", .contents = channelContents, .keys = channelKeys};

class ObserverTest : public ObservationFixture {
protected:
    [[nodiscard]] std::vector<std::string> lists() const {
        std::vector<std::string> texts;
        for (const ObservedList& list : observer.message(Time(), std::nullopt, std::nullopt).lists)
            texts.push_back(list.list->path() + " " + std::to_string(list.rows));
        return texts;
    }
};

TEST_F(ObserverTest, ATableIsObservedInItsOrder) {
    const Content contents[] = {rowLayout};
    begin(contents);
    const Data bytes = hex("07 09");
    observer.fields(Record(bytes), rowLayout);
    EXPECT_THAT(shown(), ElementsAre("/Section/Channel [] 7", "/Section/Cell [] 9"));
    EXPECT_EQ(observations()[1].source->code, code);
    EXPECT_EQ(observations()[1].source->field, &rows[1]);
}

TEST_F(ObserverTest, WhatTheMapDoesNotHaveIsNotObserved) {
    const Content contents[] = {first};
    begin(contents);
    observer.number(second, 1);
    EXPECT_THAT(shown(), IsEmpty());
    observer.number(first, 1);
    EXPECT_EQ(observations().size(), 1u);
    // In a list it is another field.
    observer.beginList(ownCells);
    observer.beginRow();
    observer.number(first, 2);
    observer.endRow();
    observer.endList();
    EXPECT_EQ(observations().size(), 1u);
    EXPECT_THAT(lists(), IsEmpty());
}

TEST_F(ObserverTest, ARowHasItsIndexAndItsKey) {
    const Content contents[] = {cells};
    begin(contents);
    const Data entries = hex("3E 05  11 07");
    observer.rows(cells, CountedList(Record(entries), 0, 2, 2), rowLayout);
    EXPECT_THAT(shown(), ElementsAre("/Section/Cells/0/Channel [62/5] 62", "/Section/Cells/0/Cell [62/5] 5",
                                     "/Section/Cells/1/Channel [17/7] 17", "/Section/Cells/1/Cell [17/7] 7"));
    EXPECT_THAT(lists(), ElementsAre("/Section/Cells 2"));
    EXPECT_EQ(observations()[3].leaf->path, "/Section/Cells/*/Cell");
    EXPECT_THAT(observations()[3].rows, ElementsAre(1u));
}

TEST_F(ObserverTest, AKeyHasThePartsThatTheRowHas) {
    const Content contents[] = {cells};
    begin(contents);
    observer.beginList(cells);
    observer.beginRow();
    observer.number(rows[0], 62);
    observer.endRow();
    observer.beginRow();
    observer.number(rows[1], 5);
    observer.endRow();
    observer.endList();
    EXPECT_THAT(shown(), ElementsAre("/Section/Cells/0/Channel [62] 62", "/Section/Cells/1/Cell [5] 5"));
}

TEST_F(ObserverTest, WithoutKeysOnlyTheIndexIdentifiesARow) {
    const Content contents[] = {ownCells};
    begin(contents);
    const Data entries = hex("3E 05");
    observer.rows(ownCells, CountedList(Record(entries), 0, 2, 1), rowLayout);
    EXPECT_THAT(shown(), ElementsAre("/Section/0/Channel [] 62", "/Section/0/Cell [] 5"));
    EXPECT_THAT(lists(), ElementsAre("/Section 1"));
}

TEST_F(ObserverTest, ValuesOfAListInARowHaveBothIndexes) {
    const Content contents[] = {channels};
    begin(contents);
    observer.beginList(channels);
    for (const int channel : {4, 6}) {
        observer.beginRow();
        observer.number(first, channel);
        observer.beginList(ratios);
        observer.number(value, channel * 10);
        observer.number(value, channel * 10 + 1);
        observer.endList();
        observer.endRow();
    }
    observer.endList();
    EXPECT_THAT(shown(),
                ElementsAre("/Section/Channels/0/First [4] 4", "/Section/Channels/0/Ratios/0 [4] 40 dB",
                            "/Section/Channels/0/Ratios/1 [4] 41 dB", "/Section/Channels/1/First [6] 6",
                            "/Section/Channels/1/Ratios/0 [6] 60 dB",
                            "/Section/Channels/1/Ratios/1 [6] 61 dB"));
    EXPECT_THAT(observations()[5].rows, ElementsAre(1u, 1u));
    EXPECT_THAT(lists(), ElementsAre("/Section/Channels/*/Ratios 2", "/Section/Channels/*/Ratios 2",
                                     "/Section/Channels 2"));
}

TEST_F(ObserverTest, AnEntryOfANumberedListHasItsNumber) {
    const Content contents[] = {pilots};
    begin(contents);
    observer.beginList(pilots);
    observer.entryNumber(0, 420);
    observer.number(value, 5);
    observer.entryNumber(2, 63);
    observer.number(value, 6);
    observer.endList();
    EXPECT_THAT(shown(), ElementsAre("/Section/Pilots/420 [420] 5 dB", "/Section/Pilots/63 [63] 6 dB"));
    EXPECT_THAT(lists(), ElementsAre("/Section/Pilots 2"));
}

TEST_F(ObserverTest, AnEmptyListShowsItsText) {
    const Content contents[] = {pilots, cells};
    begin(contents);
    observer.beginList(pilots);
    observer.endList();
    observer.beginList(cells);
    observer.endList();
    EXPECT_THAT(lists(), ElementsAre("/Section/Pilots 0", "/Section/Cells 0"));
    EXPECT_EQ(pathOf(only()), "/Section/Pilots");
    EXPECT_EQ(textOf(only()), "(none)");
    EXPECT_EQ(only().kind, ObservedKind::Absent);
}

TEST_F(ObserverTest, AfterAListNoRowIsLeft) {
    const Content contents[] = {cells, second};
    begin(contents);
    observer.beginList(cells);
    observer.beginRow();
    observer.number(rows[0], 1);
    observer.endRow();
    observer.endList();
    observer.number(second, 3);
    EXPECT_EQ(shown().back(), "/Section/Second [] 3 dB");
    EXPECT_TRUE(observations().back().rows.empty());
}

TEST_F(ObserverTest, ACodeThatIsSubscribedTwiceIsObservedOnce) {
    const Content contents[] = {first};
    begin(contents);
    FieldMap other(catalogue, "Other");
    EXPECT_FALSE(observer.beginSection(map, code));
    EXPECT_TRUE(observer.beginSection(map, code + 1));
    EXPECT_TRUE(observer.beginSection(other, code));
    observer.beginMessage();
    EXPECT_TRUE(observer.beginSection(map, code));
}

TEST_F(ObserverTest, ALabelThatIsRemovedIsReported) {
    const Content contents[] = {first, second};
    begin(contents);
    observer.removed("Second");
    observer.removed("Third");
    EXPECT_THAT(observer.message(Time(), std::nullopt, std::nullopt).removed,
                ElementsAre(&leaf("/Section/Second")));
    EXPECT_THAT(observations(), IsEmpty());
}

class WholeAccountTest : public ObserverTest {
protected:
    WholeAccountTest() { describe(contents); }

    /// What a message with these fields and a list of that many rows reports as removed.
    std::vector<std::string> account(const std::vector<const Field*>& fields, int listed) {
        observer.beginMessage();
        EXPECT_TRUE(observer.beginSection(map, code));
        observer.beginWhole();
        for (const Field* const field : fields)
            observer.number(*field, 1);
        observer.beginList(cells);
        for (int i = 0; i < listed; ++i) {
            observer.beginRow();
            observer.number(rows[0], 1);
            observer.endRow();
        }
        observer.endList();
        observer.endWhole();
        return removed();
    }

    const Content contents[3] = {first, second, cells};
};

TEST_F(WholeAccountTest, WhatItDoesNotNameIsGoneOnce) {
    // There may be values from before the first message.
    EXPECT_THAT(account({&first}, 2), ElementsAre("/Section/Second"));
    EXPECT_THAT(account({&first, &second}, 0), IsEmpty()); // the rows are the list's
    EXPECT_THAT(account({}, 1), UnorderedElementsAre("/Section/First", "/Section/Second"));
    EXPECT_THAT(account({}, 1), IsEmpty());
    EXPECT_THAT(account({&second}, 1), IsEmpty());
    EXPECT_THAT(account({&first}, 1), ElementsAre("/Section/Second"));
}

TEST_F(WholeAccountTest, AfterAnInterruptionAnythingMayHaveBeenShown) {
    account({&first, &second}, 0);
    account({}, 0);
    EXPECT_THAT(account({}, 0), IsEmpty());
    observer.assumeAllShown();
    EXPECT_THAT(account({}, 0), UnorderedElementsAre("/Section/First", "/Section/Second"));
}

TEST_F(ObserverTest, AMessageForgetsTheOneBefore) {
    const Content contents[] = {cells, first};
    begin(contents);
    observer.beginList(cells);
    observer.beginRow();
    observer.number(rows[0], 1);
    observer.endRow();
    observer.endList();
    observer.removed("First");
    observer.beginMessage();
    const ObservedMessage message = observer.message(Time(std::chrono::seconds(3)), 0x1234, 99);
    EXPECT_EQ(message.arrival, Time(std::chrono::seconds(3)));
    EXPECT_TRUE(message.observations.empty());
    EXPECT_TRUE(message.lists.empty());
    EXPECT_TRUE(message.removed.empty());
    EXPECT_EQ(message.code, 0x1234u);
    EXPECT_EQ(message.timestamp, 99u);
}

TEST_F(ObserverTest, AFieldThatIsShownTwiceIsObservedAtBothPlaces) {
    CatalogueWriter writer(catalogue, map, [this](std::string_view label) {
        return std::vector<Catalogue::Node*>{&catalogue.root().child("Overview").child(label),
                                             &catalogue.root().child("System").child(label)};
    });
    writer.setCode(code);
    writer.field(first);
    ASSERT_TRUE(observer.beginSection(map, code));
    observer.number(first, 8);
    EXPECT_THAT(shown(), ElementsAre("/Overview/First [] 8", "/System/First [] 8"));
    EXPECT_EQ(leaf("/Overview/First").sameAs, "");
    EXPECT_EQ(leaf("/System/First").sameAs, "/Overview/First");
}

} // namespace
} // namespace velmora
