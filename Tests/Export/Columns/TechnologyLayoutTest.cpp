// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/TableLayout.h"

#include "Tests/LogGenerator/Observations/DecodedTechnology.h"

#include <gtest/gtest.h>

#include <map>
#include <regex>
#include <set>
#include <tuple>

namespace velmora {
namespace {

class TechnologyLayoutTest : public testing::TestWithParam<DecodedTechnology> {
protected:
    TechnologyUnderTest _technology{GetParam()};
    const Catalogue& _catalogue = _technology.decoder().catalogue();
    TechnologyLayout _layout{_catalogue};
};

TEST_P(TechnologyLayoutTest, hasAColumnForEachFieldWithAValue) {
    ASSERT_FALSE(_catalogue.fields().empty());
    ASSERT_EQ(_layout.leaves.size(), _catalogue.fields().size());
    for (const CatalogueField& leaf : _catalogue.fields())
        EXPECT_EQ(_layout.leaves[leaf.index].table == LeafColumn::none, leaf.kind == ObservedKind::Absent)
            << leaf.path;
}

TEST_P(TechnologyLayoutTest, hasEachColumnOnce) {
    std::set<std::string> tables;
    for (const TableLayout& table : _layout.tables) {
        EXPECT_TRUE(tables.insert(table.name).second) << table.name;
        std::set<std::string> columns;
        for (const TableColumn& column : table.columns)
            EXPECT_TRUE(columns.insert(column.schema.name).second)
                << table.name << ": " << column.schema.name;
    }
    // These have tables of their own.
    for (const char* const reserved : {"messages", "files", "events", "positions", "other_fields"})
        EXPECT_FALSE(tables.contains(reserved)) << reserved;
}

TEST_P(TechnologyLayoutTest, hasNamesInLowerCase) {
    const std::regex valid("[a-z0-9]+(_[a-z0-9]+)*");
    for (const TableLayout& table : _layout.tables) {
        EXPECT_TRUE(std::regex_match(table.name, valid)) << table.name;
        for (const TableColumn& column : table.columns)
            EXPECT_TRUE(std::regex_match(column.schema.name, valid)) << column.schema.name;
    }
}

TEST_P(TechnologyLayoutTest, hasTheRawNumberAfterAnEnumerationsText) {
    for (const CatalogueField& leaf : _catalogue.fields()) {
        if (leaf.kind != ObservedKind::Enumeration)
            continue;
        const LeafColumn place = _layout.leaves[leaf.index];
        const std::vector<TableColumn>& columns = _layout.tables[place.table].columns;
        const std::string& text = columns[place.column].schema.name;
        ASSERT_TRUE(text.ends_with("_text")) << text;
        ASSERT_LT(place.column + 1, columns.size());
        EXPECT_EQ(columns[place.column + 1].schema.name, text.substr(0, text.size() - 4) + "raw");
        EXPECT_EQ(columns[place.column + 1].schema.type, StoredType::Integer);
    }
}

TEST_P(TechnologyLayoutTest, saysOfEachColumnWhereTheDisplayShowsIt) {
    for (const CatalogueField& leaf : _catalogue.fields()) {
        const LeafColumn place = _layout.leaves[leaf.index];
        if (place.table == LeafColumn::none)
            continue;
        const TableLayout& table = _layout.tables[place.table];
        const std::pair<std::string, std::string> wanted = {
            "velmora.path." + table.columns[place.column].schema.name, leaf.path};
        EXPECT_NE(std::find(table.properties.begin(), table.properties.end(), wanted), table.properties.end())
            << leaf.path;
    }
}

INSTANTIATE_TEST_SUITE_P(AllTechnologies, TechnologyLayoutTest, testing::ValuesIn(decodedTechnologies),
                         [](const auto& tested) { return std::string(tested.param.scenario); });

TEST(TechnologyLayouts, giveANameOneTypeAndUnit) {
    using Kind = std::tuple<StoredType, ValueMeaning, std::string>;
    std::map<std::string, Kind> kinds;
    for (const DecodedTechnology& each : decodedTechnologies) {
        TechnologyUnderTest technology(each);
        for (const TableLayout& table : TechnologyLayout(technology.decoder().catalogue()).tables) {
            const std::map<std::string, std::string> properties(table.properties.begin(),
                                                                table.properties.end());
            for (const TableColumn& column : table.columns) {
                const auto unit = properties.find("velmora.unit." + column.schema.name);
                const Kind kind = {column.schema.type, column.schema.meaning,
                                   unit == properties.end() ? "" : unit->second};
                EXPECT_EQ(kinds.try_emplace(column.schema.name, kind).first->second, kind)
                    << column.schema.name;
            }
        }
    }
    EXPECT_EQ(kinds.at("measured_rsrp_dbm"), Kind(StoredType::Number, ValueMeaning::Plain, "dBm"));
    EXPECT_EQ(kinds.at("mm_state_raw"), Kind(StoredType::Integer, ValueMeaning::Plain, ""));
}

TEST(TableLayout, namesTheRowsOfLists) {
    const auto names = [](std::size_t depth) {
        std::vector<std::string> all;
        const TableLayout layout = listTable("t", "T", depth);
        for (std::size_t i = CommonColumns::count; i < layout.columns.size(); ++i)
            all.push_back(layout.columns[i].schema.name);
        return all;
    };
    EXPECT_EQ(names(1), (std::vector<std::string>{"row", "row_key"}));
    EXPECT_EQ(names(2), (std::vector<std::string>{"outer_row", "row", "row_key"}));
}

} // namespace
} // namespace velmora
