// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Paths/NodeSelection.h"

#include "Tools/Text/JSONText.h"
#include "Tools/Text/TreeText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

Value list(std::initializer_list<Value> elements) {
    return std::make_shared<Array>(elements);
}

Value display() {
    return dictionary({
        {"Band", "GSM 900"},
        {"Cells", list({dictionary({{"ARFCN", "17"}, {"RSSI", "-70 dBm"}}),
                        dictionary({{"ARFCN", "18"}, {"RSSI", "-80 dBm"}})})},
        {"Pilots", dictionary({{"2;40", "-9 dB"}, {"1;40", "-8 dB"}, {"_sorted", "yes"}, {"1;2;3", "odd"}})},
        {"SPN/PNN", dictionary({{"Name", "Home"}})},
        {"SPN", dictionary({{"PNN", dictionary({{"Other", "Away"}})}})},
        {"3;120", "not sorted"},
        {"Empty", dictionary({})},
        {"", "no name"},
    });
}

std::string json(const Value& value) {
    TextBuffer out;
    appendJson(out, value);
    return std::string(out.view());
}

TEST(NodeSelectionTest, PathsLeadWhereTheTreesPathsLead) {
    // Every path of the display tree, against the tree.
    const Value shown = display();
    PathDictionary nodes;
    static_cast<void>(VelmoraModelNode::makeTreeFromObject(shown, nodes));
    ASSERT_EQ(nodes.size(), 19U);
    for (const auto& [path, node] : nodes) {
        const Value* found = NodeSelection::find(shown, path);
        ASSERT_NE(found, nullptr) << path;
        if (node->value())
            EXPECT_EQ(*found, Value(*node->value())) << path;
        else
            EXPECT_EQ(node->childNodes()->empty(), json(*found) == "{}") << path;
    }
}

TEST(NodeSelectionTest, OneValueIsFound) {
    struct Case {
        const char* path;
        const char* found; ///< as JSON; null for none
    };
    const Case cases[] = {
        {"/Band", "\"GSM 900\""},
        {"/Cells/1/RSSI", "\"-80 dBm\""},
        {"/Cells/0", R"({"ARFCN":"17","RSSI":"-70 dBm"})"},
        {"/Pilots/40", "\"-9 dB\""}, // of two the later in key order
        {"/Pilots/1;2;3", "\"odd\""},
        {"/SPN/PNN/Name", "\"Home\""}, // a slash in a name
        {"/SPN/PNN/Other", "\"Away\""},
        {"/3;120", "\"not sorted\""},
        {"//", "\"no name\""},
        {"/Empty", "{}"},
        {"/Pilots/_sorted", nullptr},
        {"/Cells/2", nullptr},
        {"/Cells/00", nullptr},
        {"/Cells/-1", nullptr},
        {"/Cells/", nullptr},
        {"/Cells/0x", nullptr},
        {"/Cells/99999999999999999999", nullptr},
        {"/Band/GSM", nullptr},
        {"/Ban", nullptr},
        {"/Bands", nullptr},
        {"/band", nullptr},
        {"/Empty/", nullptr},
    };
    const Value shown = display();
    for (const Case& row : cases) {
        const Value* found = NodeSelection::find(shown, row.path);
        if (row.found) {
            ASSERT_NE(found, nullptr) << row.path;
            EXPECT_EQ(json(*found), row.found) << row.path;
        } else {
            EXPECT_EQ(found, nullptr) << row.path;
        }
    }
    EXPECT_EQ(NodeSelection::find(Value(), "/"), nullptr);
}

TEST(NodeSelectionTest, RestrictedDisplayKeepsWhatLeadsToTheNodes) {
    struct Case {
        std::vector<std::string> paths;
        const char* json;
        const char* text;
    };
    const Case cases[] = {
        {{"/Band"}, R"({"Band":"GSM 900"})", "Band  GSM 900\n"},
        {{"/Cells/1/ARFCN", "/Band"},
         R"({"Band":"GSM 900","Cells":[null,{"ARFCN":"18"}]})",
         "Band  GSM 900\nCells\n  1\n    ARFCN  18\n"},
        {{"/Pilots/40"},
         R"({"Pilots":{"2;40":"-9 dB","1;40":"-8 dB","_sorted":"yes"}})",
         "Pilots\n  40  -8 dB\n  40  -9 dB\n"},
        {{"/SPN/PNN"},
         R"({"SPN/PNN":{"Name":"Home"},"SPN":{"PNN":{"Other":"Away"}}})",
         "SPN/PNN\n  Name  Home\nSPN\n  PNN\n    Other  Away\n"},
        {{"/Cells", "/Cells/0/ARFCN"},
         R"({"Cells":[{"ARFCN":"17","RSSI":"-70 dBm"},{"ARFCN":"18","RSSI":"-80 dBm"}]})",
         "Cells\n  0\n    ARFCN  17\n    RSSI   -70 dBm\n  1\n    ARFCN  18\n    RSSI   -80 dBm\n"},
        {{"/Empty"}, R"({"Empty":{}})", "Empty\n"},
        {{"/Cells/*/ARFCN"},
         R"({"Cells":[{"ARFCN":"17"},{"ARFCN":"18"}]})",
         "Cells\n  0\n    ARFCN  17\n  1\n    ARFCN  18\n"},
        {{"/*/40"},
         R"({"Pilots":{"2;40":"-9 dB","1;40":"-8 dB","_sorted":"yes"}})",
         "Pilots\n  40  -8 dB\n  40  -9 dB\n"},
        {{"/*/Name", "/*/*/Other"},
         R"({"SPN/PNN":{"Name":"Home"},"SPN":{"PNN":{"Other":"Away"}}})",
         "SPN/PNN\n  Name  Home\nSPN\n  PNN\n    Other  Away\n"},
        {{"level=/Cells/1/RSSI"},
         R"({"Cells":[null,{"RSSI":"-80 dBm"}]})",
         "Cells\n  1\n    RSSI  -80 dBm\n"},
        {{"/Nothing", "/Band/GSM", "/Cells/7", "/*/*/BSIC", "/Band/*"}, "null", ""},
    };
    const Value shown = display();
    PathDictionary nodes;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(shown, nodes);
    for (const Case& row : cases) {
        const NodeSelection selection(row.paths);
        EXPECT_EQ(json(selection.restricted(shown)), row.json);
        const NodeRef part = selection.restricted(root);
        EXPECT_EQ(part ? treeText(*part) : "", row.text);
    }
}

TEST(NodeSelectionTest, NamesAreThoseOfTheirPathsOrThePaths) {
    const NodeSelection selection({"/Band", "level=/Cells/*/RSSI", "a=b=/Cells", "/Odd=/Band", "ratio=/*"});
    EXPECT_THAT(selection.paths(), ElementsAre("/Band", "/Cells/*/RSSI", "/Cells", "/Odd=/Band", "/*"));
    EXPECT_THAT(selection.names(), ElementsAre("/Band", "level", "a=b", "/Odd=/Band", "ratio"));
    for (const char* text : {"", "Band", "=/Band", "name=Band"})
        EXPECT_FALSE(NodeSelection::isPath(text)) << text;
}

TEST(NodeSelectionTest, AStarIsANameOfItsOwn) {
    for (const char* path : {"/*", "/*/ARFCN", "/Cells/*", "/Cells/*/ARFCN"})
        EXPECT_TRUE(NodeSelection::hasWildcard(path)) << path;
    for (const char* path : {"/", "/Cells", "/Cells/5*", "/*5/ARFCN", "/Cells/**"})
        EXPECT_FALSE(NodeSelection::hasWildcard(path)) << path;
}

TEST(NodeSelectionTest, AllValuesOfAStarAreFoundInTheDisplaysOrder) {
    const Value shown = display();
    const auto all = [&shown](const char* path) {
        std::vector<const Value*> found;
        NodeSelection::findAll(shown, path, found);
        std::vector<std::string> texts;
        for (const Value* const value : found)
            texts.push_back(json(*value));
        return texts;
    };
    EXPECT_THAT(all("/Cells/*/RSSI"), ElementsAre("\"-70 dBm\"", "\"-80 dBm\""));
    EXPECT_THAT(all("/*/1/ARFCN"), ElementsAre("\"18\""));
    EXPECT_THAT(all("/Pilots/*"), ElementsAre("\"-9 dB\"", "\"-8 dB\"", "\"odd\""));
    EXPECT_THAT(all("/*/Name"), ElementsAre("\"Home\""));
    EXPECT_THAT(all("/Band/*"), ElementsAre());
    EXPECT_THAT(all("/*/*/BSIC"), ElementsAre());
}

TEST(NodeSelectionTest, APartOfADisplayIsRestrictedByItsPlace) {
    Catalogue catalogue("Test");
    const CatalogueNode& cells = catalogue.root().child("Group").child("Cells");
    const Value part = list({dictionary({{"ARFCN", "17"}}), dictionary({{"ARFCN", "18"}, {"RSSI", "-80"}})});
    const auto restricted = [&](const char* path) {
        return json(NodeSelection({path}).restrictedAt(cells, part));
    };
    EXPECT_EQ(restricted("/Group/Cells/1/ARFCN"), R"([null,{"ARFCN":"18"}])");
    EXPECT_EQ(restricted("/*/*/*/RSSI"), R"([null,{"RSSI":"-80"}])");
    for (const char* path : {"/", "/Group", "/Group/Cells", "/*"})
        EXPECT_EQ(restricted(path), json(part)) << path;
    for (const char* path : {"/Other", "/Group/Cell", "/Group/Cells/2"})
        EXPECT_EQ(restricted(path), "null") << path;
}

TEST(NodeSelectionTest, RootAndNoPathsAreEverything) {
    const Value shown = display();
    for (const NodeSelection& selection : {NodeSelection(), NodeSelection({"/Band", "/"})}) {
        EXPECT_EQ(selection.restricted(shown), shown);
        EXPECT_TRUE(selection.restricted(Value()).isNone());
    }
}

} // namespace
} // namespace velmora
