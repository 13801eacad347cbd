// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/FieldMap.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

constexpr Field fields[] = {
    {"A", u8At(0), integer("%d")}, {"B", u8At(1), integer("%d")}, {"C", u8At(2), integer("%d")}};
constexpr List list{};
constexpr List otherList{};

class FieldMapTest : public testing::Test {
protected:
    void add(const List* in, const Field& field, std::string_view name) {
        map.add(
            FieldMap::Entry{in, &field, &catalogue.root().child(name), nullptr, ObservedKind::Number, 1, 0});
    }
    [[nodiscard]] std::string names(const List* in, const Field& field) const {
        std::string all;
        for (const FieldMap::Entry& entry : map.find(in, field))
            all += entry.node->name();
        return all;
    }

    Catalogue catalogue{"Test"};
    FieldMap map{catalogue, "Section"};
};

TEST_F(FieldMapTest, FindsAFieldInItsListInWhateverOrder) {
    add(&list, fields[1], "b");
    add(nullptr, fields[2], "c");
    add(nullptr, fields[0], "a");
    add(&list, fields[0], "x");
    map.sort();
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(names(nullptr, fields[2]), "c");
        EXPECT_EQ(names(&list, fields[0]), "x");
        EXPECT_EQ(names(&list, fields[1]), "b");
        EXPECT_EQ(names(nullptr, fields[0]), "a");
        EXPECT_EQ(names(nullptr, fields[1]), "");
        EXPECT_EQ(names(&otherList, fields[0]), "");
    }
}

TEST_F(FieldMapTest, AFieldAtSeveralPlacesKeepsTheirOrder) {
    add(nullptr, fields[0], "2");
    add(nullptr, fields[1], "x");
    add(nullptr, fields[0], "1");
    add(nullptr, fields[0], "3");
    map.sort();
    EXPECT_EQ(names(nullptr, fields[0]), "213");
}

TEST_F(FieldMapTest, AnEmptyMapHasNothing) {
    EXPECT_EQ(names(nullptr, fields[0]), "");
    EXPECT_EQ(map.leafOf("A"), nullptr);
    EXPECT_TRUE(map.findList(nullptr, list).empty());
}

TEST_F(FieldMapTest, AListIsFoundByTheListAroundIt) {
    Catalogue::Node& own = catalogue.root().child("own");
    Catalogue::Node& nested = catalogue.root().child("nested");
    Catalogue::Node& other = catalogue.root().child("other");
    map.add(FieldMap::ListEntry{nullptr, &list, &own});
    map.add(FieldMap::ListEntry{&otherList, &list, &nested});
    map.add(FieldMap::ListEntry{nullptr, &otherList, &other});
    ASSERT_EQ(map.findList(nullptr, list).size(), 1u);
    EXPECT_EQ(map.findList(nullptr, list)[0].node, &own);
    ASSERT_EQ(map.findList(&otherList, list).size(), 1u);
    EXPECT_EQ(map.findList(&otherList, list)[0].node, &nested);
    EXPECT_EQ(map.findList(nullptr, otherList)[0].node, &other);
    EXPECT_TRUE(map.findList(&list, otherList).empty());
}

TEST_F(FieldMapTest, ALeafIsThatOfTheSectionsOwnLabel) {
    CatalogueField& leaf = catalogue.leafAt(catalogue.root().child("b"), "Section");
    static_cast<void>(catalogue.leafAt(catalogue.root().child("a"), "Section"));
    add(&list, fields[1], "a");
    add(nullptr, fields[1], "b");
    map.sort();
    EXPECT_EQ(map.leafOf("B"), &leaf);
    EXPECT_EQ(map.leafOf("A"), nullptr);
}

} // namespace
} // namespace velmora
