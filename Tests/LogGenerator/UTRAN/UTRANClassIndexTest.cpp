#include "LogGenerator/UTRAN/UTRANClassIndex.h"

#include "Platform/Console.h"
#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>

#include <cstdio>

namespace velmora {

namespace {

using testing::ElementsAre;

std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code) {
    std::vector<std::string> names;
    if (const std::vector<Base*>* sections = index.getSubscribers(code))
        for (const Base* section : *sections)
            names.emplace_back(section->getSectionName());
    return names;
}

TEST(UTRANClassIndex, HoldsEightSectionsUnderTheirNames) {
    const UTRANClassIndex index;
    EXPECT_EQ(index.classDict.size(), 8u);
    EXPECT_EQ(index.getClass("RRC Info"), index.rrc_state.get());
    EXPECT_EQ(index.getClass("Serving Cell Info"), index.servingCellInfo.get());
    EXPECT_EQ(index.getClass("Neighbor Cell List"), index.tdMeasurements.get());
    EXPECT_EQ(index.getClass("GSM Neighbor Cell List"), index.gsmMeasurements.get());
    EXPECT_EQ(index.getClass("TRCH BLER"), index.trchMeasurements.get());
    EXPECT_EQ(index.getClass("CCTRCH SIR"), index.cctrchMeasurements.get());
    EXPECT_EQ(index.getClass("PDP Context Info"), index.pdpList.get());
    EXPECT_EQ(index.getClass("SIM Info"), index.simInfo.get());
    EXPECT_EQ(index.getClass("RRC_State"), nullptr);
}

TEST(UTRANClassIndex, SubscribersStandInTheOrderOfCreation) {
    const UTRANClassIndex index;
    EXPECT_THAT(subscribers(index, 0xD0E0), ElementsAre("RRC Info"));
    EXPECT_THAT(subscribers(index, 0xD0E2), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xD00A), ElementsAre("Neighbor Cell List"));
    EXPECT_THAT(subscribers(index, 0xD00E), ElementsAre("GSM Neighbor Cell List"));
    EXPECT_THAT(subscribers(index, 0xD00C), ElementsAre("TRCH BLER", "CCTRCH SIR"));
    EXPECT_THAT(subscribers(index, 0xFF0000), ElementsAre("SIM Info"));
    EXPECT_THAT(subscribers(index, 0xFF0001), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xFF0002), ElementsAre("PDP Context Info"));
    EXPECT_EQ(index.getAllLogCodes().size(), 8u);
}

TEST(UTRANClassIndex, CreatesTheSectionsInOrder) {
    // Each section announces on registration how many codes it wants.
    CapturedLog log;
    const UTRANClassIndex index;
    EXPECT_THAT(log.textsAt(LogPriority::Warning),
                ElementsAre("Array Count: 1", "Array Count: 2", "Array Count: 1", "Array Count: 1",
                            "Array Count: 1", "Array Count: 1", "Array Count: 1", "Array Count: 1"));
    EXPECT_EQ(log.lines().size(), 8u);
}

TEST(UTRANClassIndex, PrintsTheCommonLineAloneWhenItGoes) {
    std::FILE* printed = std::tmpfile();
    ASSERT_NE(printed, nullptr);
    std::FILE* earlier = redirectConsole(printed);
    { const UTRANClassIndex index; }
    redirectConsole(earlier);
    std::rewind(printed);
    char text[200] = {};
    const std::size_t length = std::fread(text, 1, sizeof text, printed);
    std::fclose(printed);
    EXPECT_EQ(std::string(text, length), "Deallocing ClassIndex\n");
}

} // namespace

} // namespace velmora
