// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/ObservationFixture.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr EnumText stateRows[] = {{0, "Idle"}};
constexpr EnumTexts states(stateRows, "Unknown");

constexpr Field level{"RSSI",
                      u8At(15),
                      unless(0, "none", integer("%d dBm")),
                      {.role = Role::ServingLevel, .scale = negated, .clause = "3GPP TS 45.008 8.1"}};
constexpr Field serviceLevel{"RSSI", computed, integer("%d dBm"), {.absent = ""}};
constexpr Field area{
    "LAC", u16At(3), integer("%d"), {.role = Role::ServingArea, .identity = Identity::Location}};
constexpr Field state{"State", u8At(0), text(states)};
constexpr Field whyNot{"RSSI", u8At(0), text(states), {.isAbsence = true, .absent = "not now"}};

class CatalogueTest : public ObservationFixture {
protected:
    [[nodiscard]] std::vector<std::string> paths() const {
        std::vector<std::string> all;
        for (const CatalogueField& field : catalogue.fields())
            all.push_back(field.path);
        return all;
    }
};

TEST_F(CatalogueTest, ALeafIsWhatItsTableSays) {
    const Content contents[] = {level, area, state};
    describe(contents);
    ASSERT_THAT(paths(), ElementsAre("/Section/RSSI", "/Section/LAC", "/Section/State"));
    const CatalogueField& leaf = catalogue.fields()[0];
    EXPECT_EQ(leaf.index, 0u);
    EXPECT_EQ(leaf.section, "Section");
    EXPECT_EQ(leaf.kind, ObservedKind::Number);
    EXPECT_EQ(leaf.unit, Unit::DBm);
    EXPECT_EQ(leaf.role, Role::ServingLevel);
    EXPECT_EQ(leaf.clause, "3GPP TS 45.008 8.1");
    EXPECT_THAT(leaf.absentTexts, ElementsAre("none"));
    EXPECT_THAT(leaf.keys, IsEmpty());
    EXPECT_FALSE(leaf.isReadFromText);
    ASSERT_EQ(leaf.sources.size(), 1u);
    EXPECT_EQ(leaf.sources[0].code, code);
    EXPECT_EQ(leaf.sources[0].field, &level);
    EXPECT_EQ(leaf.sources[0].list, nullptr);
    EXPECT_EQ(catalogue.fields()[1].index, 1u);
    EXPECT_EQ(catalogue.fields()[1].identity, Identity::Location);
    EXPECT_EQ(catalogue.fields()[1].unit, Unit::None);
    EXPECT_EQ(catalogue.fields()[2].kind, ObservedKind::Enumeration);
}

TEST_F(CatalogueTest, APlaceMayCountFromASubPacket) {
    CatalogueWriter writer(catalogue, map, [this](std::string_view label) {
        return std::vector<Catalogue::Node*>{&catalogue.root().child(label)};
    });
    writer.setCode(0x119C);
    writer.subPacket(2);
    writer.field(level);
    writer.subPacket(0);
    writer.field(area);
    writer.subPacket(3);
    writer.setCode(0x119D); // another record
    writer.field(state);
    EXPECT_EQ(leaf("/RSSI").sources[0].subPacket, 2u);
    EXPECT_EQ(leaf("/LAC").sources[0].subPacket, 0u);
    EXPECT_EQ(leaf("/State").sources[0].subPacket, 0u);
}

TEST_F(CatalogueTest, TwoRecordsOfALabelAreOneLeafOfTwoSources) {
    const Content measured[] = {level};
    const Content service[] = {serviceLevel};
    describe(measured);
    describe(service, 0xFF0001);
    ASSERT_THAT(paths(), ElementsAre("/Section/RSSI"));
    const CatalogueField& leaf = catalogue.fields()[0];
    ASSERT_EQ(leaf.sources.size(), 2u);
    EXPECT_EQ(leaf.sources[1].code, 0xFF0001u);
    EXPECT_EQ(leaf.role, Role::ServingLevel);
    EXPECT_THAT(leaf.absentTexts, ElementsAre("none", ""));
}

TEST_F(CatalogueTest, AnAbsenceAddsItsTextsOnly) {
    const Content contents[] = {whyNot, level};
    describe(contents);
    const CatalogueField& leaf = catalogue.fields()[0];
    EXPECT_EQ(leaf.kind, ObservedKind::Number);
    EXPECT_EQ(leaf.unit, Unit::DBm);
    EXPECT_THAT(leaf.absentTexts, ElementsAre("not now", "none"));
}

constexpr Field cellFields[] = {{"ARFCN", u16At(0), integer("%d")}, {"BSIC", u16At(2), integer("%d")}};
constexpr Content cellContents[] = {cellFields};
constexpr std::string_view cellKeys[] = {"ARFCN"};
constexpr List cells{.label = "Cells", .whenEmpty = "(none)", .contents = cellContents, .keys = cellKeys};
constexpr List outer{.contents = cellContents};

TEST_F(CatalogueTest, ARowIsAStar) {
    const Content contents[] = {cells};
    describe(contents);
    EXPECT_THAT(paths(), ElementsAre("/Section/Cells", "/Section/Cells/*/ARFCN", "/Section/Cells/*/BSIC"));
    EXPECT_EQ(leaf("/Section/Cells").kind, ObservedKind::Absent);
    EXPECT_THAT(leaf("/Section/Cells").absentTexts, ElementsAre("(none)"));
    EXPECT_THAT(leaf("/Section/Cells/*/BSIC").keys, ElementsAre("ARFCN"));
    EXPECT_EQ(leaf("/Section/Cells/*/BSIC").sources[0].list, &cells);
}

// The record that has the same list under another code makes no further place of it.
TEST_F(CatalogueTest, AListOfTwoRecordsIsReplacedOnce) {
    const Content contents[] = {cells};
    describe(contents);
    describe(contents, 0x4005);
    EXPECT_EQ(map.findList(nullptr, cells).size(), 1u);
    EXPECT_THAT(leaf("/Section/Cells").absentTexts, ElementsAre("(none)"));
    ASSERT_TRUE(observer.beginSection(map, 0x4005));
    observer.beginList(cells);
    observer.beginRow();
    observer.number(cellFields[0], 5);
    observer.endRow();
    observer.endList();
    EXPECT_EQ(observer.message(Time(), std::nullopt, std::nullopt).lists.size(), 1u);
    // Its value comes from the record of that code, once.
    ASSERT_EQ(observations().size(), 1u);
    EXPECT_EQ(only().source->code, 0x4005u);
}

TEST_F(CatalogueTest, APathIsThatOfItsNode) {
    EXPECT_EQ(catalogue.root().path(), "/");
    Catalogue::Node& row = catalogue.root().child("A").child("B C").rows();
    EXPECT_EQ(row.path(), "/A/B C/*");
    EXPECT_EQ(&catalogue.root().child("A"), catalogue.root().find("A"));
    EXPECT_EQ(catalogue.root().find("B"), nullptr);
    EXPECT_EQ(row.leaf(), nullptr);
    EXPECT_FALSE(row.isOpen());
}

struct PhysicalCase {
    const char* name;
    Field field;
    ObservedKind kind;
    Unit unit;
    double scale;
};

class PhysicalTest : public testing::TestWithParam<PhysicalCase> {};

TEST_P(PhysicalTest, FollowsFromFormatAndMeaning) {
    EXPECT_EQ(kindOf(GetParam().field), GetParam().kind);
    EXPECT_EQ(unitOf(GetParam().field), GetParam().unit);
    EXPECT_DOUBLE_EQ(physicalScale(GetParam().field), GetParam().scale);
}

const PhysicalCase physical[] = {
    {"Number", {"", computed, integer("%d")}, ObservedKind::Number, Unit::None, 1},
    {"Level", {"", computed, integer("%d dBm")}, ObservedKind::Number, Unit::DBm, 1},
    {"Negated", {"", computed, integer("%d dBm"), {.scale = negated}}, ObservedKind::Number, Unit::DBm, -1},
    {"AnotherUnit",
     {"", computed, integer("%d dB"), {.unit = Unit::DBm}},
     ObservedKind::Number,
     Unit::DBm,
     1},
    {"Rate", {"", computed, real("%.2f kbps")}, ObservedKind::Number, Unit::KilobitPerSecond, 1.024},
    {"Share", {"", computed, real("%.02f%%")}, ObservedKind::Number, Unit::Percent, 1},
    {"OldShare", {"", computed, real("%.02f%% (old)")}, ObservedKind::Number, Unit::Percent, 1},
    {"Hexadecimal", {"", computed, hexadecimal()}, ObservedKind::Number, Unit::None, 1},
    {"Enumeration", {"", computed, text(states)}, ObservedKind::Enumeration, Unit::None, 1},
    {"Flag", {"", computed, flag("y", "n")}, ObservedKind::Flag, Unit::None, 1},
    {"Text", {"", computed, plainText()}, ObservedKind::Text, Unit::None, 1},
    {"Digits", {"", computed, integer("%d"), {.digits = 2}}, ObservedKind::Text, Unit::None, 1},
    {"Absence", {"", computed, integer("%d"), {.isAbsence = true}}, ObservedKind::Absent, Unit::None, 1},
};
INSTANTIATE_TEST_SUITE_P(Fields, PhysicalTest, testing::ValuesIn(physical),
                         [](const auto& tested) { return tested.param.name; });

} // namespace
} // namespace velmora
