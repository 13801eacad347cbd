#include "LogGenerator/LTE/LTEClassIndex.h"

#include "Platform/Console.h"
#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>

#include <cstdio>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::ElementsAreArray;

std::vector<std::string> subscribers(const ClassIndex& index, std::uint32_t code) {
    std::vector<std::string> names;
    if (const std::vector<Base*>* sections = index.getSubscribers(code))
        for (const Base* section : *sections)
            names.emplace_back(section->getSectionName());
    return names;
}

TEST(LTEClassIndex, HoldsElevenSectionsUnderTheirNames) {
    const LTEClassIndex index;
    EXPECT_EQ(index.classDict.size(), 11u);
    EXPECT_EQ(index.getClass("Serving Cell Info"), index.objLTEServingCellInfo.get());
    EXPECT_EQ(index.getClass("Connected mode LTE Intra-frequency Measurement"),
              index.objConnectedModeMeasurementMisc.get());
    EXPECT_EQ(index.getClass("Measured Neighbor Cells"), index.objMeasuredNeighborCells.get());
    EXPECT_EQ(index.getClass("Detected Cells"), index.objDetectedCells.get());
    EXPECT_EQ(index.getClass("Serving Cell Measurements"), index.objServingCellMeasurement.get());
    EXPECT_EQ(index.getClass("Neighbor Measurements"), index.objNeighborMeasurementMisc.get());
    EXPECT_EQ(index.getClass("Neighbor Cells List"), index.objNeighborCellsList.get());
    EXPECT_EQ(index.getClass("Reselection Candidates"), index.objReselectionCandidatesMisc.get());
    EXPECT_EQ(index.getClass("Reselection Candidates List"), index.objReselectionCandidatesList.get());
    EXPECT_EQ(index.getClass("SIM Info"), index.objSimInfo.get());
    EXPECT_EQ(index.getClass("PDP Context Info"), index.objPDPContextList.get());
    EXPECT_EQ(index.getClass("LTE Serving Cell Info"), nullptr);
}

TEST(LTEClassIndex, SubscribersStandInTheOrderOfCreation) {
    const LTEClassIndex index;
    EXPECT_THAT(subscribers(index, 0xB0C1), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xB0C2), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xB179), ElementsAre("Connected mode LTE Intra-frequency Measurement",
                                                        "Measured Neighbor Cells", "Detected Cells"));
    EXPECT_THAT(subscribers(index, 0xB17F), ElementsAre("Serving Cell Measurements"));
    EXPECT_THAT(subscribers(index, 0xB180), ElementsAre("Neighbor Measurements", "Neighbor Cells List"));
    EXPECT_THAT(subscribers(index, 0xB186),
                ElementsAre("Reselection Candidates", "Reselection Candidates List"));
    EXPECT_THAT(subscribers(index, 0xFF0000), ElementsAre("SIM Info"));
    EXPECT_THAT(subscribers(index, 0xFF0001), ElementsAre("Serving Cell Info"));
    EXPECT_THAT(subscribers(index, 0xFF0002), ElementsAre("PDP Context Info"));
    EXPECT_EQ(index.getAllLogCodes().size(), 9u);
}

TEST(LTEClassIndex, CreatesTheSectionsInOrder) {
    // Each section announces on registration how many codes it wants.
    CapturedLog log;
    const LTEClassIndex index;
    std::vector<std::string> expected;
    for (const int count : {3, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1})
        expected.push_back("Array Count: " + std::to_string(count));
    EXPECT_THAT(log.textsAt(LogPriority::Warning), ElementsAreArray(expected));
    EXPECT_EQ(log.lines().size(), 11u);
}

TEST(LTEClassIndex, SaysOnTheConsoleThatItGoes) {
    std::FILE* printed = std::tmpfile();
    ASSERT_NE(printed, nullptr);
    std::FILE* earlier = redirectConsole(printed);
    { const LTEClassIndex index; }
    redirectConsole(earlier);
    std::rewind(printed);
    char text[200] = {};
    const std::size_t length = std::fread(text, 1, sizeof text, printed);
    std::fclose(printed);
    EXPECT_EQ(std::string(text, length), "Deallocing LTEClassIndex\nDeallocing ClassIndex\n");
}

} // namespace

} // namespace velmora
