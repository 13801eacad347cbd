// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/SectionText.h"

#include "LogGenerator/Base.h"
#include "Tools/Decode/Lines/JSONFieldWriter.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

// The JSON of a section's node is that of the node, whatever happened to the section since it was last asked
// for.

namespace velmora {
namespace {

constexpr Field cellFields[] = {{"Cell", u8At(0), integer("%d")}, {"Level", u8At(1), integer("%d dBm")}};
constexpr Layout cellLayout = layout(2, cellFields);
constexpr Field stateFields[] = {{"State", u8At(0), integer("%d")}};
constexpr Layout stateLayout = layout(1, stateFields);
constexpr View exampleViews[] = {{1, cellLayout}, {2, stateLayout}};

class Example final : public Base {
public:
    [[nodiscard]] std::string_view getSectionName() const override { return "Serving \"Cell\""; }
    [[nodiscard]] std::span<const View> views() const override { return exampleViews; }
};

class SectionTextTest : public testing::Test {
protected:
    SectionTextTest() { section.updateSectionRef(node); }

    void update(std::uint32_t code, std::vector<std::uint8_t> bytes) {
        section.updateWithData(Data(std::move(bytes)), code);
    }
    std::string shown() {
        TextBuffer out;
        _text.append(out);
        return std::string(out.view());
    }
    static std::string named(const std::string& json) { return R"("Serving \"Cell\"":)" + json; }

    Example section;
    Value node = makeDictionary();

private:
    JSONTexts _texts;
    JSONFieldWriter _writer;
    SectionText _text{section, _texts, _writer};
};

TEST_F(SectionTextTest, FollowsTheRecordsOfAllViews) {
    EXPECT_EQ(shown(), named("{}"));
    update(2, {5});
    EXPECT_EQ(shown(), named(R"({"State":"5"})"));
    update(1, {7, 80});
    EXPECT_EQ(shown(), named(R"({"State":"5","Cell":"7","Level":"80 dBm"})"));
    update(2, {61});
    EXPECT_EQ(shown(), named(R"({"State":"61","Cell":"7","Level":"80 dBm"})"));
    EXPECT_EQ(shown(), named(R"({"State":"61","Cell":"7","Level":"80 dBm"})"));
}

TEST_F(SectionTextTest, ARecordThatIsDroppedChangesNothing) {
    update(1, {7, 80});
    EXPECT_EQ(shown(), named(R"({"Cell":"7","Level":"80 dBm"})"));
    update(1, {8});
    update(3, {8, 8});
    EXPECT_EQ(shown(), named(R"({"Cell":"7","Level":"80 dBm"})"));
}

TEST_F(SectionTextTest, RecordsThatWereNotShownAreThereAfterwards) {
    update(1, {7, 80});
    EXPECT_EQ(shown(), named(R"({"Cell":"7","Level":"80 dBm"})"));
    update(2, {5});
    update(1, {9, 81});
    EXPECT_EQ(shown(), named(R"({"Cell":"9","Level":"81 dBm","State":"5"})"));
    update(2, {6});
    EXPECT_EQ(shown(), named(R"({"Cell":"9","Level":"81 dBm","State":"6"})"));
}

TEST_F(SectionTextTest, AnotherNodeIsShownInstead) {
    update(1, {7, 80});
    EXPECT_EQ(shown(), named(R"({"Cell":"7","Level":"80 dBm"})"));
    const Value other = makeDictionary();
    section.updateSectionRef(other);
    EXPECT_EQ(shown(), named("{}"));
    update(2, {5});
    EXPECT_EQ(shown(), named(R"({"State":"5"})"));
}

TEST_F(SectionTextTest, ANodeThatHoldsOthersIsReadEachTime) {
    const DictionaryRef inner = makeDictionary();
    const DictionaryRef outer = makeDictionary();
    outer->set("Inner", inner);
    section.updateSectionRef(outer);
    update(2, {5});
    EXPECT_EQ(shown(), named(R"({"Inner":{},"State":"5"})"));
    inner->set("Changed", "elsewhere"); // by the section that it belongs to
    update(2, {6});
    EXPECT_EQ(shown(), named(R"({"Inner":{"Changed":"elsewhere"},"State":"6"})"));
}

} // namespace
} // namespace velmora
