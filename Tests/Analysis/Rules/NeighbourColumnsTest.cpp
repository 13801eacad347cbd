// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/NeighbourColumns.h"

#include <gmock/gmock.h>

#include <limits>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::IsNan;

std::vector<double> column(const NeighbourColumns& columns, Role role) {
    const std::span<const double> values = columns.of(role);
    return {values.begin(), values.end()};
}

std::vector<Neighbour> twoCells() {
    std::vector<Neighbour> cells(2);
    cells[0].channel = 6300;
    cells[0].physicalCell = 62;
    cells[0].level_dBm = -90.5;
    cells[1].quality_dB = -11;
    cells[1].isDetected = true;
    return cells;
}

TEST(NeighbourColumnsTest, HaveAValueForEachNeighbourInTheirOrder) {
    NeighbourColumns columns;
    columns.set(twoCells());
    EXPECT_EQ(columns.size(), 2U);
    EXPECT_THAT(column(columns, Role::NeighbourChannel), ElementsAre(6300, IsNan()));
    EXPECT_THAT(column(columns, Role::NeighbourPhysicalCell), ElementsAre(62, IsNan()));
    EXPECT_THAT(column(columns, Role::NeighbourLevel), ElementsAre(-90.5, IsNan()));
    EXPECT_THAT(column(columns, Role::NeighbourQuality), ElementsAre(IsNan(), -11));
    EXPECT_THAT(column(columns, Role::None), ElementsAre(0, 1)); // detected
}

TEST(NeighbourColumnsTest, ForgetEarlierNeighbours) {
    NeighbourColumns columns;
    columns.set(twoCells());
    columns.set(std::vector<Neighbour>(1));
    EXPECT_EQ(columns.size(), 1U);
    EXPECT_THAT(column(columns, Role::NeighbourLevel), ElementsAre(IsNan()));
    columns.clear();
    EXPECT_EQ(columns.size(), 0U);
    EXPECT_THAT(column(columns, Role::NeighbourLevel), IsEmpty());
}

TEST(NeighbourColumnsTest, TakeWhatIsNoFiniteNumberAsUnknown) {
    Neighbour cell;
    cell.level_dBm = std::numeric_limits<double>::infinity();
    EXPECT_THAT(NeighbourColumns::valueOf(cell, Role::NeighbourLevel), IsNan());
}

} // namespace
} // namespace velmora
