// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEClassIndex.h"

#include "Tests/LogGenerator/ClassIndexTesting.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;

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

TEST(LTEClassIndex, SubscribersAreInOrderOfCreation) {
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
    const CapturedLog log;
    const LTEClassIndex index;
    expectCodeCounts(log, {3, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1});
}

TEST(LTEClassIndex, PrintsItsDestruction) {
    EXPECT_EQ(printedBy([] { const LTEClassIndex index; }),
              "Deallocing LTEClassIndex\nDeallocing ClassIndex\n");
}

} // namespace

} // namespace velmora
