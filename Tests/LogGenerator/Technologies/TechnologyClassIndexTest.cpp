// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/ClassIndexTesting.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::UnorderedElementsAreArray;

class TechnologyClassIndexTest : public testing::TestWithParam<Technology> {
protected:
    static std::vector<std::string> namesOf(const std::vector<Base*>* sections) {
        std::vector<std::string> names;
        if (sections)
            for (const Base* section : *sections)
                names.emplace_back(section->getSectionName());
        return names;
    }

    const Technology& technology = GetParam();
};

TEST_P(TechnologyClassIndexTest, HoldsEachSectionUnderItsName) {
    const auto index = technology.makeIndex();
    EXPECT_EQ(index->classDict.size(), technology.sections.size());
    for (const ExpectedSection& section : technology.sections)
        EXPECT_EQ(index->getClass(section.name), section.field(*index)) << section.name;
    EXPECT_EQ(index->getClass(technology.noSection), nullptr);
}

TEST_P(TechnologyClassIndexTest, SubscribersAreInOrderOfCreation) {
    const auto index = technology.makeIndex();
    std::vector<std::string> codes;
    for (const std::uint32_t code : technology.codes()) {
        codes.push_back(std::to_string(code));
        std::vector<std::string> names;
        for (const ExpectedSection& section : technology.subscribers(code))
            names.emplace_back(section.name);
        EXPECT_EQ(namesOf(index->getSubscribers(code)), names) << std::hex << code;
    }
    EXPECT_THAT(index->getAllLogCodes(), UnorderedElementsAreArray(codes));
}

TEST_P(TechnologyClassIndexTest, CreatesTheSectionsInOrder) {
    // On registration each section logs how many codes it wants, and nothing else.
    LogLines counts;
    for (const ExpectedSection& section : technology.sections)
        counts.push_back({LogPriority::Warning, "Array Count: " + std::to_string(section.codes.size())});
    const CapturedLog log;
    const auto index = technology.makeIndex();
    EXPECT_EQ(log.lines(), counts);
}

TEST_P(TechnologyClassIndexTest, PrintsOnTheConsoleThatItIsDestroyed) {
    EXPECT_EQ(printedBy([this] { technology.makeIndex(); }), technology.consoleAtEnd);
}

INSTANTIATE_TEST_SUITE_P(All, TechnologyClassIndexTest, testing::ValuesIn(technologies()), testName);

} // namespace
} // namespace velmora
