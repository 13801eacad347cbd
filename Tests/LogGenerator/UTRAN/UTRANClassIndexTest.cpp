// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANClassIndex.h"

#include "Tests/LogGenerator/ClassIndexTesting.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;

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

TEST(UTRANClassIndex, SubscribersAreInOrderOfCreation) {
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
    const CapturedLog log;
    const UTRANClassIndex index;
    expectCodeCounts(log, {1, 2, 1, 1, 1, 1, 1, 1});
}

TEST(UTRANClassIndex, PrintsOnlyTheCommonLineOnDestruction) {
    EXPECT_EQ(printedBy([] { const UTRANClassIndex index; }), "Deallocing ClassIndex\n");
}

} // namespace

} // namespace velmora
