// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/ObservationFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

#include <chrono>
#include <limits>

namespace velmora {
namespace {

using testing::ElementsAre;

constexpr Field file{"File", computed, plainText()};
constexpr Field context{"", computed, plainText()};
constexpr Field contextFields[] = {{"Context ID", computed, plainText()}, {"APN", computed, plainText()}};
constexpr Content contextContents[] = {context, contextFields};
constexpr std::string_view contextKeys[] = {"Context ID"};
constexpr List contexts{"", List::Entries::Values, "", contextContents, contextKeys};

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

Value array(std::initializer_list<Value> elements) {
    return std::make_shared<Array>(elements);
}

class SuppliedTest : public ObservationFixture {
protected:
    void supply(const Value& value) {
        const Content contents[] = {file};
        begin(contents);
        observer.supplied(file, value);
    }
};

TEST_F(SuppliedTest, AStringIsAText) {
    supply("8901");
    EXPECT_EQ(only().kind, ObservedKind::Text);
    EXPECT_EQ(only().words, "8901");
    EXPECT_THAT(shown(), ElementsAre("/Section/File [] 8901"));
}

TEST_F(SuppliedTest, AnIntegerIsANumber) {
    supply(-12);
    EXPECT_EQ(only().kind, ObservedKind::Number);
    EXPECT_EQ(only().number, -12);
    EXPECT_EQ(textOf(only()), "-12");
}

TEST_F(SuppliedTest, ABooleanIsAFlag) {
    supply(true);
    EXPECT_EQ(only().kind, ObservedKind::Flag);
    EXPECT_EQ(only().raw, 1);
    EXPECT_EQ(textOf(only()), "true");
}

TEST_F(SuppliedTest, ARealIsANumber) {
    supply(2.5);
    EXPECT_EQ(only().kind, ObservedKind::Number);
    EXPECT_EQ(only().number, 2.5);
    EXPECT_EQ(textOf(only()), "2.500000");
}

TEST_F(SuppliedTest, ARealThatIsNotFiniteIsAbsent) {
    supply(std::numeric_limits<double>::infinity());
    EXPECT_EQ(only().kind, ObservedKind::Absent);
    EXPECT_EQ(textOf(only()), "inf");
}

TEST_F(SuppliedTest, ADateIsAText) {
    using namespace std::chrono;
    supply(Date(sys_days{year{2026} / January / 5} + 8h));
    EXPECT_EQ(only().kind, ObservedKind::Text);
    EXPECT_EQ(only().words, "2026-01-05 08:00:00");
}

TEST_F(SuppliedTest, DataIsBytes) {
    const Data bytes = hex("89 01");
    supply(bytes);
    EXPECT_EQ(only().kind, ObservedKind::Binary);
    EXPECT_THAT(only().bytes, ElementsAre(0x89, 0x01));
}

TEST_F(SuppliedTest, ATreeIsObservedLeafByLeaf) {
    supply(dictionary({{"LAI", "00F110"}, {"Networks", array({"00101", dictionary({{"MNC", "02"}})})}}));
    EXPECT_THAT(shown(), ElementsAre("/Section/File/LAI [] 00F110", "/Section/File/Networks/0 [] 00101",
                                     "/Section/File/Networks/1/MNC [] 02"));
    EXPECT_EQ(observations()[2].leaf->path, "/Section/File/Networks/*/MNC");
    EXPECT_EQ(observations()[2].leaf->section, "Section");
    const ObservedMessage message = observer.message(Time(), std::nullopt, std::nullopt);
    ASSERT_EQ(message.lists.size(), 1u);
    EXPECT_EQ(message.lists[0].list->path(), "/Section/File/Networks");
    EXPECT_EQ(message.lists[0].rows, 2u);
}

TEST_F(SuppliedTest, WhatATreeLacksIsRemoved) {
    supply(dictionary({{"LAI", "00F110"}, {"TMSI", "01020304"}}));
    EXPECT_THAT(removed(), ElementsAre("/Section/File"));
    observer.beginMessage();
    ASSERT_TRUE(observer.beginSection(map, code));
    observer.supplied(file, dictionary({{"TMSI", "05060708"}}));
    EXPECT_THAT(removed(), ElementsAre("/Section/File", "/Section/File/LAI"));
    observer.beginMessage();
    ASSERT_TRUE(observer.beginSection(map, code));
    observer.supplied(file, "text");
    EXPECT_THAT(removed(), ElementsAre("/Section/File/LAI", "/Section/File/TMSI"));
}

TEST_F(SuppliedTest, ANewLeafEntersTheCatalogueOnce) {
    supply(dictionary({{"New", "1"}}));
    const std::size_t leaves = catalogue.fields().size();
    observer.beginMessage();
    ASSERT_TRUE(observer.beginSection(map, code));
    observer.supplied(file, dictionary({{"New", "2"}}));
    EXPECT_EQ(catalogue.fields().size(), leaves);
    EXPECT_THAT(shown(), ElementsAre("/Section/File/New [] 2"));
}

TEST_F(SuppliedTest, RowsOfAListHaveTheirIndexAndKey) {
    const Content contents[] = {contexts};
    begin(contents);
    observer.beginList(contexts);
    observer.supplied(context, dictionary({{"APN", "a.example"}, {"Context ID", "5"}}));
    observer.supplied(context, dictionary({{"Context ID", "6"}, {"Other", "x"}}));
    observer.supplied(context, "plain");
    observer.endList();
    EXPECT_THAT(shown(),
                ElementsAre("/Section/0/APN [5] a.example", "/Section/0/Context ID [5] 5",
                            "/Section/1/Context ID [6] 6", "/Section/1/Other [6] x", "/Section/2 [] plain"));
}

class TreeTest : public ObservationFixture {
protected:
    void show(const Value& value) { observer.display(catalogue, value); }
};

TEST_F(TreeTest, NumbersAreReadFromTextsWhereThereIsNothingElse) {
    catalogue.setReadsNumbersFromTexts();
    show(dictionary({{"RxLev", "-71 dBm"}, {"BSIC", "07"}, {"Name", "Cell 5"}}));
    ASSERT_EQ(observations().size(), 3u);
    EXPECT_EQ(observations()[0].kind, ObservedKind::Number);
    EXPECT_EQ(observations()[0].number, -71);
    EXPECT_EQ(leaf("/RxLev").unit, Unit::DBm);
    EXPECT_TRUE(leaf("/RxLev").isReadFromText);
    EXPECT_EQ(observations()[1].kind, ObservedKind::Text);
    EXPECT_EQ(observations()[1].words, "07");
    EXPECT_FALSE(leaf("/BSIC").isReadFromText);
    EXPECT_EQ(observations()[2].words, "Cell 5");
}

// Otherwise a chart of the leaf would jump by what the unit changed.
TEST_F(TreeTest, ANumberInAnotherUnitIsAbsent) {
    catalogue.setReadsNumbersFromTexts();
    show(dictionary({{"RxLev", "-71 dBm"}}));
    observer.beginMessage();
    show(dictionary({{"RxLev", "-71 dB"}}));
    EXPECT_EQ(only().kind, ObservedKind::Absent);
    EXPECT_EQ(textOf(only()), "-71 dB");
    observer.beginMessage();
    show(dictionary({{"RxLev", "none"}}));
    EXPECT_EQ(only().kind, ObservedKind::Absent);
    EXPECT_EQ(textOf(only()), "none");
}

// A recording that names other labels in each message must not fill the memory.
TEST_F(TreeTest, LeavesAreNamedUpToALimit) {
    constexpr std::size_t labelsOfMessage = 10'000;
    for (std::size_t i = 0; i < Catalogue::mostNodes + labelsOfMessage;) {
        const DictionaryRef labels = makeDictionary();
        for (std::size_t end = i + labelsOfMessage; i < end; ++i)
            labels->set("Label " + std::to_string(i), "1");
        observer.beginMessage();
        show(labels);
    }
    EXPECT_TRUE(observations().empty());
    EXPECT_LE(catalogue.fields().size(), Catalogue::mostNodes);
    observer.beginMessage();
    show(dictionary({{"Label 7", "1"}}));
    EXPECT_EQ(only().leaf->path, "/Label 7");
}

// Their number must not square the time.
TEST_F(TreeTest, ADisplayMayHaveVeryManyLabels) {
    const DictionaryRef many = makeDictionary();
    constexpr int count = 100'000;
    for (int i = 0; i < count; ++i)
        many->set("Label " + std::to_string(i), "1");
    show(many);
    EXPECT_EQ(observations().size(), static_cast<std::size_t>(count));
    EXPECT_EQ(observations().back().leaf->path, "/Label 99999");
}

TEST_F(TreeTest, OnlyAKeyThatIsAStarNamesRows) {
    show(dictionary({{"*b", array({dictionary({{"c*", "1"}})})}}));
    EXPECT_THAT(shown(), ElementsAre("/*b/0/c* [] 1"));
}

TEST_F(TreeTest, WhatTheNextDisplayLacksIsRemoved) {
    show(dictionary({{"State", "Call"}, {"Channel", dictionary({{"ARFCN", "62"}, {"HSN", "1"}})}}));
    EXPECT_THAT(removed(), ElementsAre());
    observer.beginMessage();
    show(dictionary({{"State", "Idle"}, {"Channel", "None"}}));
    EXPECT_THAT(removed(), ElementsAre("/Channel/ARFCN", "/Channel/HSN"));
    observer.beginMessage();
    show(dictionary({{"State", "Idle"}, {"Channel", "None"}}));
    EXPECT_THAT(removed(), ElementsAre());
}

TEST_F(TreeTest, ElsewhereTextsStayTexts) {
    show(dictionary({{"RxLev", "-71 dBm"}}));
    EXPECT_EQ(only().kind, ObservedKind::Text);
    EXPECT_EQ(leaf("/RxLev").kind, ObservedKind::Text);
}

} // namespace
} // namespace velmora
