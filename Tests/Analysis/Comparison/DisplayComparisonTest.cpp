// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/DisplayComparison.h"

#include <gmock/gmock.h>

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr std::string_view cellKeys[] = {"Channel", "Cell"};
/// A display with a level, a state, and a list of cells with their channel, cell and level.
class DisplayComparisonTest : public testing::Test {
protected:
    struct Cell {
        double channel;
        double cell;
        double level;
    };

    DisplayComparisonTest() {
        rows.setKeys(cellKeys);
        for (const char* const name : {"Channel", "Cell", "Level"})
            static_cast<void>(catalogue.leafAt(rows.child(name), {}));
        static_cast<void>(catalogue.leafAt(catalogue.root().child("After"), {}));
    }

    [[nodiscard]] const CatalogueField& leaf(CatalogueNode& node) { return catalogue.leafAt(node, {}); }

    static Observation numberOf(const CatalogueField& leaf, double number) {
        Observation observation;
        observation.leaf = &leaf;
        observation.kind = ObservedKind::Number;
        observation.number = number;
        return observation;
    }
    void reportLevel(ObservedDisplay& display, double number) {
        const Observation observations[] = {numberOf(leaf(catalogue.root().child("Level")), number)};
        display.update({1, {}, {}, {}, observations, {}, {}});
    }
    void reportState(ObservedDisplay& display, std::int64_t raw, std::string_view text) {
        Observation observation;
        observation.leaf = &leaf(catalogue.root().child("State"));
        observation.kind = ObservedKind::Enumeration;
        observation.raw = raw;
        observation.given = text;
        display.update({1, {}, {}, {}, {&observation, 1}, {}, {}});
    }
    void reportCells(ObservedDisplay& display, const std::vector<Cell>& cells) {
        std::vector<std::uint32_t> numbers(cells.size());
        std::vector<std::string> keys;
        for (std::size_t i = 0; i < cells.size(); ++i) {
            numbers[i] = static_cast<std::uint32_t>(i);
            keys.push_back(std::to_string(static_cast<int>(cells[i].channel)) + "/" +
                           std::to_string(static_cast<int>(cells[i].cell)));
        }
        std::vector<Observation> observations;
        for (std::size_t i = 0; i < cells.size(); ++i)
            for (const auto& [name, number] : {std::pair("Channel", cells[i].channel),
                                               {"Cell", cells[i].cell},
                                               {"Level", cells[i].level}}) {
                observations.push_back(numberOf(leaf(rows.child(name)), number));
                observations.back().rows = {&numbers[i], 1};
                observations.back().rowKey = keys[i];
            }
        const ObservedList lists[] = {{&list, static_cast<std::uint32_t>(cells.size())}};
        display.update({1, {}, {}, {}, observations, lists, {}});
    }

    /// Each difference as "changed /Level: -80 > -90 (-10)", with the row after the path.
    [[nodiscard]] std::vector<std::string> differences() const {
        std::vector<std::string> lines;
        const auto text = [](const std::optional<ShownValue>& value) {
            return !value                                ? std::string("-")
                   : value->kind == ObservedKind::Number ? testing::PrintToString(value->number)
                                                         : value->text;
        };
        for (const DisplayDifference& each : compareDisplays(a.values(), b.values())) {
            std::string line = std::string(nameOf(each.change())) + " " + each.any().leaf->path;
            line += each.any().row.empty() ? "" : " " + each.any().row;
            line += ": " + text(each.before) + " > " + text(each.after);
            if (const auto number = each.difference())
                line += " (" + testing::PrintToString(*number) + ")";
            lines.push_back(line);
        }
        return lines;
    }

    Catalogue catalogue{"Test"};
    CatalogueNode& level = catalogue.root().child("Level");
    CatalogueNode& list = catalogue.root().child("Cells");
    CatalogueNode& rows = list.rows();
    ObservedDisplay a;
    ObservedDisplay b;
};

TEST_F(DisplayComparisonTest, EqualDisplaysHaveNoDifferences) {
    for (ObservedDisplay* const display : {&a, &b}) {
        reportLevel(*display, -80);
        reportCells(*display, {{33, 5, -80}});
    }
    EXPECT_THAT(differences(), IsEmpty());
}

TEST_F(DisplayComparisonTest, ValuesAreAddedGoneAndChanged) {
    reportLevel(a, -80);
    reportLevel(b, -90);
    reportState(b, 3, "connected");
    EXPECT_THAT(differences(), ElementsAre("changed /Level: -80 > -90 (-10)", "added /State: - > connected"));
    std::swap(a, b);
    EXPECT_THAT(differences(), ElementsAre("changed /Level: -90 > -80 (10)", "gone /State: connected > -"));
}

TEST_F(DisplayComparisonTest, AnEnumerationIsTheSameByItsRawNumber) {
    reportState(a, 3, "connected");
    reportState(b, 4, "connected");
    EXPECT_THAT(differences(), ElementsAre("changed /State: connected > connected"));
}

TEST_F(DisplayComparisonTest, RowsAreTheSameWhereverTheyAre) {
    reportCells(a, {{33, 5, -80}, {40, 1, -85}});
    reportCells(b, {{40, 1, -85}, {33, 5, -80}});
    EXPECT_THAT(differences(), IsEmpty());
}

TEST_F(DisplayComparisonTest, RowsAreListedOneByOneAndThoseThatAreGoneLast) {
    reportCells(a, {{10, 1, -70}, {33, 5, -80}});
    reportCells(b, {{33, 5, -82}, {33, 6, -90}});
    // Channels and cells name something: their difference would say nothing.
    EXPECT_THAT(differences(),
                ElementsAre("changed /Cells/*/Level 33/5: -80 > -82 (-2)",
                            "added /Cells/*/Channel 33/6: - > 33", "added /Cells/*/Cell 33/6: - > 6",
                            "added /Cells/*/Level 33/6: - > -90", "gone /Cells/*/Channel 10/1: 10 > -",
                            "gone /Cells/*/Cell 10/1: 1 > -", "gone /Cells/*/Level 10/1: -70 > -"));
}

TEST_F(DisplayComparisonTest, RowsOfOneIdentityAreNumbered) {
    reportCells(a, {{33, 0, -80}, {33, 0, -85}});
    reportCells(b, {{33, 0, -80}, {33, 0, -86}});
    EXPECT_THAT(differences(), ElementsAre("changed /Cells/*/Level 33/0 #2: -85 > -86 (-1)"));
}

TEST_F(DisplayComparisonTest, AListIsReplacedAsAWhole) {
    reportCells(a, {{33, 5, -80}, {40, 1, -85}});
    reportCells(b, {{33, 5, -80}, {40, 1, -85}});
    reportCells(b, {});
    reportCells(a, {});
    EXPECT_THAT(differences(), IsEmpty());
    EXPECT_THAT(a.values(), IsEmpty());
}

TEST_F(DisplayComparisonTest, WhatAMessageWithdrawsIsGone) {
    reportLevel(a, -80);
    reportLevel(b, -80);
    const CatalogueField* const removed[] = {&leaf(level)};
    b.update({1, {}, {}, {}, {}, {}, removed});
    EXPECT_THAT(differences(), ElementsAre("gone /Level: -80 > -"));
}

} // namespace
} // namespace velmora
