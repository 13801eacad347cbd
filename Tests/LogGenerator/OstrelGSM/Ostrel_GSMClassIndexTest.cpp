// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"

#include "Tests/LogGenerator/ClassIndexTesting.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;

TEST(Ostrel_GSMClassIndex, HoldsTwentySixSectionsUnderTheirNames) {
    const Ostrel_GSMClassIndex index;
    EXPECT_EQ(index.classDict.size(), 26u);
    EXPECT_EQ(index.getClass("Active Set"), index.objActiveSet.get());
    EXPECT_EQ(index.getClass("Coding Scheme"), index.objCodingScheme.get());
    EXPECT_EQ(index.getClass("GPRS Information"), index.objGPRSInformation.get());
    EXPECT_EQ(index.getClass("GSM Serving Cell"), index.objGSMServingCell.get());
    EXPECT_EQ(index.getClass("Mobile Allocation"), index.objMobileAllocation.get());
    EXPECT_EQ(index.getClass("Neighboring Cells"), index.objNeighboringCells.get());
    EXPECT_EQ(index.getClass("PDP Context Info"), index.objPDPContextList.get());
    EXPECT_EQ(index.getClass("Process PS"), index.objProcessPS.get());
    EXPECT_EQ(index.getClass("UMTS RR Measurement"), index.objUMTSRRMeasurement.get());
    EXPECT_EQ(index.getClass("Cell Change Counters"), index.objCellChangeCounter.get());
    EXPECT_EQ(index.getClass("Detected Set"), index.objDetectedSet.get());
    EXPECT_EQ(index.getClass("GSM Set"), index.objGSMSet.get());
    EXPECT_EQ(index.getClass("Non-Ranked GSM Set"), index.objNonRankedGSMSet.get());
    EXPECT_EQ(index.getClass("Process CO"), index.objProcessCO.get());
    EXPECT_EQ(index.getClass("Serving PLMN"), index.objServingPLMN.get());
    EXPECT_EQ(index.getClass("UMTS Set"), index.objUMTSSet.get());
    EXPECT_EQ(index.getClass("Equivalent PLMN List"), index.objEquivalentPLMNList.get());
    EXPECT_EQ(index.getClass("GSM RR Info"), index.objGSMRRInfo.get());
    EXPECT_EQ(index.getClass("Monitored Set"), index.objMonitoredSet.get());
    EXPECT_EQ(index.getClass("Non-Ranked UMTS Set"), index.objNonRankedUMTSSet.get());
    EXPECT_EQ(index.getClass("Process CS"), index.objProcessCS.get());
    EXPECT_EQ(index.getClass("UMTS RR Info"), index.objUMTSRRInfo.get());
    EXPECT_EQ(index.getClass("BLER"), index.objBLER.get());
    EXPECT_EQ(index.getClass("Virtual Active Set"), index.objVirtualActiveSet.get());
    EXPECT_EQ(index.getClass("SIM Info"), index.objSimInfo.get());
    EXPECT_EQ(index.getClass("HSDPA Info"), index.objHSDPAInformation.get());
    EXPECT_EQ(index.getClass("HSDPAInformation"), nullptr);
}

TEST(Ostrel_GSMClassIndex, SubscribersAreInOrderOfCreation) {
    const Ostrel_GSMClassIndex index;
    EXPECT_THAT(subscribers(index, 0x417A),
                ElementsAre("Active Set", "Detected Set", "Monitored Set", "Virtual Active Set"));
    EXPECT_THAT(subscribers(index, 0x4005), ElementsAre("GSM Set", "UMTS Set"));
    EXPECT_THAT(subscribers(index, 0x5137),
                ElementsAre("GPRS Information", "GSM Serving Cell", "Neighboring Cells", "GSM RR Info"));
    EXPECT_THAT(subscribers(index, 0x51F6), ElementsAre("GPRS Information", "GSM RR Info"));
    EXPECT_THAT(subscribers(index, 0x7131), ElementsAre("Process CO", "Process CS"));
    EXPECT_THAT(subscribers(index, 0x7132),
                ElementsAre("Process PS", "Process CO", "Serving PLMN", "Process CS"));
    EXPECT_THAT(subscribers(index, 0x7135), ElementsAre("GPRS Information", "Serving PLMN"));
    EXPECT_THAT(subscribers(index, 0xFF0001), ElementsAre("GSM Serving Cell", "Neighboring Cells",
                                                          "Serving PLMN", "UMTS Set", "UMTS RR Info"));
}

TEST(Ostrel_GSMClassIndex, SubscribersOfTheOtherCodes) {
    const Ostrel_GSMClassIndex index;
    EXPECT_THAT(subscribers(index, 0x4031), ElementsAre("UMTS RR Info"));
    EXPECT_THAT(subscribers(index, 0x4116), ElementsAre("BLER"));
    EXPECT_THAT(subscribers(index, 0x4125), ElementsAre("UMTS RR Info"));
    EXPECT_THAT(subscribers(index, 0x4127), ElementsAre("UMTS RR Info"));
    EXPECT_THAT(subscribers(index, 0x4157), ElementsAre("UMTS RR Info"));
    EXPECT_THAT(subscribers(index, 0x4221), ElementsAre("HSDPA Info"));
    EXPECT_THAT(subscribers(index, 0x5072), ElementsAre("GSM RR Info"));
    EXPECT_THAT(subscribers(index, 0x5076), ElementsAre("GSM Serving Cell"));
    EXPECT_THAT(subscribers(index, 0x512C), ElementsAre("GSM RR Info"));
    EXPECT_THAT(subscribers(index, 0x5134), ElementsAre("GSM Serving Cell"));
    EXPECT_THAT(subscribers(index, 0x51F4), ElementsAre("GPRS Information"));
    EXPECT_THAT(subscribers(index, 0x51F5), ElementsAre("GPRS Information"));
    EXPECT_THAT(subscribers(index, 0x51F8), ElementsAre("Mobile Allocation"));
    EXPECT_THAT(subscribers(index, 0x51FB), ElementsAre("GPRS Information"));
    EXPECT_THAT(subscribers(index, 0x51FD), ElementsAre("GPRS Information"));
    EXPECT_THAT(subscribers(index, 0x51FF), ElementsAre("Neighboring Cells"));
    EXPECT_THAT(subscribers(index, 0x7130), ElementsAre("Process PS"));
    EXPECT_THAT(subscribers(index, 0x7150), ElementsAre("Equivalent PLMN List"));
    EXPECT_THAT(subscribers(index, 0xFF0000), ElementsAre("SIM Info"));
    EXPECT_THAT(subscribers(index, 0xFF0002), ElementsAre("PDP Context Info"));
    EXPECT_EQ(index.getAllLogCodes().size(), 28u); // these and the eight shared ones
}

TEST(Ostrel_GSMClassIndex, CreatesTheSectionsInOrder) {
    const CapturedLog log;
    const Ostrel_GSMClassIndex index;
    expectCodeCounts(log, {1, 0, 7, 4, 1, 3, 1, 2, 0, 0, 1, 1, 0, 2, 3, 2, 1, 4, 1, 0, 2, 5, 1, 1, 1, 1});
}

TEST(Ostrel_GSMClassIndex, PrintsItsDestruction) {
    EXPECT_EQ(printedBy([] { const Ostrel_GSMClassIndex index; }),
              "Deallocing Ostrel_GSMClassIndex\nDeallocing ClassIndex\n");
}

} // namespace

} // namespace velmora
