// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/FreshValues.h"

#include "Tests/Tools/ToolFixture.h"
#include "Tools/Text/JSONText.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <string>
#include <vector>

namespace velmora {
namespace {

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

/// Values are fresh for 3 s.
class FreshValuesTest : public testing::Test {
protected:
    CatalogueField& leaf(CatalogueNode& node) { return catalogue.leafAt(node, "Section"); }
    /// A message so many milliseconds after the first, with a value for each of the leaves.
    void report(std::int64_t milliseconds, std::initializer_list<const CatalogueField*> leaves) {
        std::vector<Observation> observations;
        for (const CatalogueField* const each : leaves)
            observations.emplace_back().leaf = each;
        ObservedMessage message{};
        message.arrival = at(milliseconds);
        message.observations = observations;
        values.observed(message);
    }
    [[nodiscard]] std::string shown(const Value& display, std::int64_t milliseconds) const {
        TextBuffer out;
        appendJson(out, values.of(display, catalogue, at(milliseconds)));
        return std::string(out.view());
    }

    Catalogue catalogue{"Test"};
    CatalogueNode& section = catalogue.root().child("Section");
    const CatalogueField& level = leaf(section.child("RSSI"));
    const CatalogueField& channel = leaf(section.child("ARFCN"));
    CatalogueNode& cell = catalogue.root().child("Cells").rows();
    const CatalogueField& cellChannel = leaf(cell.child("ARFCN"));
    const CatalogueField& cellLevel = leaf(cell.child("RSSI"));
    FreshValues values{std::chrono::seconds(3)};
};

TEST_F(FreshValuesTest, AValueVanishesOnceItIsOlder) {
    const Value display = dictionary({{"Section", dictionary({{"RSSI", "-71"}, {"ARFCN", "33"}})}});
    EXPECT_EQ(shown(display, 0), R"({"Section":{}})"); // none was reported
    report(0, {&level, &channel});
    report(2000, {&level});
    EXPECT_EQ(shown(display, 3000), R"({"Section":{"RSSI":"-71","ARFCN":"33"}})");
    EXPECT_EQ(shown(display, 3001), R"({"Section":{"RSSI":"-71"}})");
    EXPECT_EQ(shown(display, 5000), R"({"Section":{"RSSI":"-71"}})");
    EXPECT_EQ(shown(display, 5001), R"({"Section":{}})");
    report(6000, {&channel});
    EXPECT_EQ(shown(display, 6000), R"({"Section":{"ARFCN":"33"}})");
}

TEST_F(FreshValuesTest, AListLosesItsRows) {
    const ArrayRef rows = makeArray();
    rows->append(dictionary({{"ARFCN", "17"}, {"RSSI", "-70"}}));
    rows->append(dictionary({{"RSSI", "-80"}}));
    const Value display = dictionary({{"Cells", rows}});
    report(0, {&cellLevel, &cellChannel});
    report(1000, {&cellChannel});
    EXPECT_EQ(shown(display, 3000), R"({"Cells":[{"ARFCN":"17","RSSI":"-70"},{"RSSI":"-80"}]})");
    EXPECT_EQ(shown(display, 3001), R"({"Cells":[{"ARFCN":"17"}]})");
    EXPECT_EQ(shown(display, 4001), R"({"Cells":[]})");
}

TEST_F(FreshValuesTest, KeysOfASortedDictionaryAreRows) {
    const CatalogueField& pilot = leaf(catalogue.root().child("Pilots").rows());
    const Value display = dictionary({{"Pilots", dictionary({{"_sorted", "yes"}, {"1;40", "-8 dB"}})}});
    report(0, {&pilot});
    EXPECT_EQ(shown(display, 3000), R"({"Pilots":{"_sorted":"yes","1;40":"-8 dB"}})");
    EXPECT_EQ(shown(display, 3001), R"({"Pilots":{"_sorted":"yes"}})");
}

TEST_F(FreshValuesTest, NoDisplayStaysNone) {
    EXPECT_TRUE(values.of(Value(), catalogue, at(0)).isNone());
}

} // namespace
} // namespace velmora
