// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Events/EventKind.h"

#include "Analysis/Picture/CellIdentity.h"
#include "Analysis/Picture/Technologies/TechnologyTable.h"

#include <gtest/gtest.h>

#include <set>

namespace velmora {
namespace {

TEST(EventKinds, HaveNamesOfTheirOwn) {
    std::set<std::string_view> names;
    for (const EventKindRow& row : eventKinds()) {
        EXPECT_TRUE(names.insert(row.name).second) << row.name;
        EXPECT_EQ(eventKindNamed(row.name), &row);
        EXPECT_EQ(&rowOf(row.kind), &row);
        EXPECT_FALSE(row.meaning.empty());
    }
    EXPECT_EQ(names.size(), 33U);
    EXPECT_EQ(eventKindNamed("unknown"), nullptr);
}

TEST(EventKinds, HaveTheirSeverities) {
    EXPECT_EQ(rowOf(EventKind::Handover).severity, Severity::Info);
    EXPECT_EQ(rowOf(EventKind::PingPong).severity, Severity::Warning);
    EXPECT_EQ(rowOf(EventKind::CallLost).severity, Severity::Critical);
    EXPECT_TRUE(rowOf(EventKind::OutOfService).lasts);
    EXPECT_TRUE(rowOf(EventKind::WeakCoverage).isOfRule);
}

TEST(CellIdentity, TellsCellsByWhatIsKnownOfBoth) {
    const CellIdentity full{RadioTechnology::LTE, 1017, 1300, 17, 7101, "001-01"};
    CellIdentity other = full;
    other.area = 7102;
    other.network.clear();
    EXPECT_EQ(areSameCell(full, other), true);
    EXPECT_EQ(areSameCell(full, {RadioTechnology::LTE, {}, 1300, 17, {}, {}}), true);
    EXPECT_EQ(areSameCell(full, {{}, 1017, {}, {}, {}, {}}), true);
    EXPECT_EQ(areSameCell(full, {RadioTechnology::LTE, {}, 6300, 17, {}, {}}), false);
    EXPECT_EQ(areSameCell(full, {RadioTechnology::NR, 1017, 1300, 17, {}, {}}), false);
    EXPECT_EQ(areSameCell(full, {{}, 1018, {}, {}, {}, {}}), false);
    // Many cells have one channel.
    EXPECT_EQ(areSameCell(full, {RadioTechnology::LTE, {}, 1300, {}, {}, {}}), std::nullopt);
    EXPECT_EQ(areSameCell(full, {}), std::nullopt);
}

TEST(CellIdentity, HasTheNameThatPeopleUse) {
    EXPECT_EQ(nameOf(CellIdentity{RadioTechnology::LTE, 1017, 1300, 17, {}, {}}), "PCI 17 on EARFCN 1300");
    EXPECT_EQ(nameOf(CellIdentity{RadioTechnology::UMTS, 7, 10588, {}, {}, {}}), "cell 7 on UARFCN 10588");
    EXPECT_EQ(nameOf(CellIdentity{RadioTechnology::GSM, {}, 33, {}, {}, {}}), "ARFCN 33");
    EXPECT_EQ(nameOf(CellIdentity{RadioTechnology::EVDO, {}, {}, 168, {}, {}}), "PN 168");
    EXPECT_EQ(nameOf(CellIdentity{}), "");
}

TEST(TechnologyTable, IsThatOfTheDecoderOrEmpty) {
    for (const std::string_view name :
         {"IFX", "Modem", "Ostrel_CDMA", "Ostrel_GSM", "Ostrel_LTE", "Ostrel_UTRAN2"})
        EXPECT_EQ(technologyTable(name).name, name);
    EXPECT_TRUE(technologyTable("another").name.empty());
}

TEST(TechnologyTable, FindsLeavesAtAndBelowAPath) {
    EXPECT_TRUE(isAtOrBelow("/GSM/GSM RR Info/RR State", "/GSM"));
    EXPECT_TRUE(isAtOrBelow("/GSM", "/GSM"));
    EXPECT_TRUE(isAtOrBelow("/GSM", "/"));
    EXPECT_FALSE(isAtOrBelow("/GSM2/State", "/GSM"));
    EXPECT_FALSE(isAtOrBelow("/G", "/GSM"));
}

} // namespace
} // namespace velmora
