// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/PathPattern.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;

using Rows = std::optional<PathPattern::Rows>;
constexpr std::nullopt_t none = std::nullopt;
constexpr std::nullopt_t any = std::nullopt;

Rows rows(std::initializer_list<std::optional<std::uint32_t>> numbers) {
    return PathPattern::Rows(numbers);
}

class PathPatternTest : public testing::Test {
protected:
    PathPatternTest() {
        add(section().child("RSSI"));
        add(section().child("Cells").rows().child("ARFCN"));
        add(catalogue.root().child("Channels").rows().child("Ratios").rows());
        add(catalogue.root().child("SPN/PNN").child("Name"));
        add(catalogue.root().child("SPN").child("PNN").child("Other"));
    }

    CatalogueNode& section() { return catalogue.root().child("Section"); }
    void add(CatalogueNode& node) { catalogue.leafAt(node, "Section"); }
    [[nodiscard]] const CatalogueField& leaf(const std::string& path) const {
        for (const CatalogueField& each : catalogue.fields())
            if (each.path == path)
                return each;
        throw std::logic_error("no such leaf");
    }

    Catalogue catalogue{"Test"};
};

TEST_F(PathPatternTest, SelectsWhatIsAtItsPlacesAndBelow) {
    struct Case {
        const char* path;
        const char* leaf;
        Rows rows;
    };
    const Case cases[] = {
        {"/", "/Section/RSSI", rows({})},
        {"/Section/RSSI", "/Section/RSSI", rows({})},
        {"/Section", "/Section/RSSI", rows({})},
        {"/*", "/Section/RSSI", rows({})},
        {"/*/RSSI", "/Section/RSSI", rows({})},
        {"/Section/*", "/Section/RSSI", rows({})},
        {"/*/*", "/Section/RSSI", rows({})},
        {"/Section/RSS", "/Section/RSSI", none},
        {"/Section/RSSIs", "/Section/RSSI", none},
        {"/Section/RSSI/x", "/Section/RSSI", none},
        {"/section/RSSI", "/Section/RSSI", none},
        {"/RSSI", "/Section/RSSI", none},
        {"/Section/", "/Section/RSSI", none},
        {"/", "/Section/Cells/*/ARFCN", rows({any})},
        {"/Section/Cells", "/Section/Cells/*/ARFCN", rows({any})},
        {"/Section/Cells/*/ARFCN", "/Section/Cells/*/ARFCN", rows({any})},
        {"/Section/Cells/3/ARFCN", "/Section/Cells/*/ARFCN", rows({3})},
        {"/Section/Cells/3", "/Section/Cells/*/ARFCN", rows({3})},
        {"/Section/*/0/ARFCN", "/Section/Cells/*/ARFCN", rows({0})},
        {"/Section/Cells/03", "/Section/Cells/*/ARFCN", none}, // rows are written without zeros in front
        {"/Section/Cells/x", "/Section/Cells/*/ARFCN", none},
        {"/Section/Cells/3x/ARFCN", "/Section/Cells/*/ARFCN", none},
        {"/Section/Cells/4294967296", "/Section/Cells/*/ARFCN", none}, // no row has such a number
        {"/Section/Cells/ARFCN", "/Section/Cells/*/ARFCN", none},
        {"/Channels/1/Ratios/2", "/Channels/*/Ratios/*", rows({1, 2})},
        {"/Channels/*/Ratios/2", "/Channels/*/Ratios/*", rows({any, 2})},
        {"/Channels/1", "/Channels/*/Ratios/*", rows({1, any})},
        {"/SPN/PNN/Name", "/SPN/PNN/Name", rows({})},
        {"/SPN/PNN", "/SPN/PNN/Name", rows({})},
        {"/*/Name", "/SPN/PNN/Name", rows({})}, // the slash is one of the name
        {"/SPN", "/SPN/PNN/Name", none},
        {"/SPN/PNN", "/SPN/PNN/Other", rows({})},
        {"/*/*/Other", "/SPN/PNN/Other", rows({})},
    };
    for (const Case& row : cases)
        EXPECT_EQ(PathPattern(row.path).select(leaf(row.leaf)), row.rows) << row.path << " of " << row.leaf;
}

TEST_F(PathPatternTest, RowsAreThoseOfTheObservation) {
    const std::uint32_t numbers[] = {1, 2};
    Observation observation;
    observation.rows = numbers;
    EXPECT_TRUE(isInRows(observation, {}));
    EXPECT_TRUE(isInRows(observation, {any, any}));
    EXPECT_TRUE(isInRows(observation, {1, any}));
    EXPECT_TRUE(isInRows(observation, {1, 2}));
    EXPECT_FALSE(isInRows(observation, {2, 2}));
    EXPECT_FALSE(isInRows(observation, {any, 1}));
    EXPECT_FALSE(isInRows(observation, {1, 2, 0}));
}

TEST_F(PathPatternTest, IsPossibleWhereADisplayCanHaveThePlace) {
    for (const char* path : {"/", "/Section", "/Section/Cells/7/ARFCN", "/Section/Cells/*", "/*/*/*",
                             "/Channels/1/Ratios/99", "/SPN/PNN/Name", "/SPN/PNN/Other"})
        EXPECT_TRUE(PathPattern(path).isPossible(catalogue)) << path;
    for (const char* path : {"/Nothing", "/Section/Cells/7/BSIC", "/Section/RSSI/*", "/SPN/PNN/Third",
                             "/*/Nothing", "/Channels/Ratios", "/Section/"})
        EXPECT_FALSE(PathPattern(path).isPossible(catalogue)) << path;
    section().child("Files").setOpen();
    EXPECT_TRUE(PathPattern("/Section/Files/9/Any").isPossible(catalogue));
    EXPECT_FALSE(PathPattern("/Section/Filed").isPossible(catalogue));
}

TEST_F(PathPatternTest, NearestPathsTakeTheFewestChangesOfALetter) {
    const Catalogue* const catalogues[] = {&catalogue};
    // One letter more, "/RSI" less, and "Cell" for "R" and "I".
    EXPECT_THAT(nearestPaths(catalogues, "/Section/RSI"),
                ElementsAre("/Section/RSSI", "/Section", "/Section/Cells"));
    // Two changes, three, and of three paths with nine the first.
    EXPECT_THAT(nearestPaths(catalogues, "/Chanels/0"), ElementsAre("/Channels/*", "/Channels", "/Section"));
    // Two nodes have this path.
    EXPECT_THAT(nearestPaths(catalogues, "/SPN/PNN/Nam"),
                ElementsAre("/SPN/PNN/Name", "/SPN/PNN", "/SPN/PNN/Other"));
    Catalogue other("Other");
    other.leafAt(other.root().child("x"), "");
    const Catalogue* const both[] = {&catalogue, &other};
    EXPECT_EQ(nearestPaths(both, "/y").front(), "/x");
}

TEST_F(PathPatternTest, WhatIsLeftBelowAPlace) {
    const CatalogueNode& cells = section().child("Cells");
    EXPECT_EQ(PathPattern::below("/Section/Cells/1/ARFCN", cells), "/1/ARFCN");
    EXPECT_EQ(PathPattern::below("/*/Cells/1", cells), "/1");
    for (const char* path : {"/", "/Section", "/Section/Cells", "/Section/*"})
        EXPECT_EQ(PathPattern::below(path, cells), "") << path;
    for (const char* path : {"/Section/RSSI", "/Channels", "/Section/Cell"})
        EXPECT_EQ(PathPattern::below(path, cells), none) << path;
    EXPECT_EQ(PathPattern::below("/Section", catalogue.root()), "/Section");
}

} // namespace
} // namespace velmora
