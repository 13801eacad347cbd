// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"
#include "Tests/LogGenerator/TemplateCheck.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

class Ostrel_GSMTemplate : public testing::Test {
protected:
    const std::vector<TemplateNode> nodes = shippedTemplate("Ostrel_GSM.plist");
    const Ostrel_GSMClassIndex index;
};

TEST_F(Ostrel_GSMTemplate, HoldsEverySectionOnceAndOfItsKind) {
    ASSERT_EQ(index.classDict.size(), 26u);
    expectEverySectionOnce(nodes, index,
                           {"Equivalent PLMN List", "Neighboring Cells", "Active Set", "Detected Set",
                            "Monitored Set", "Virtual Active Set", "GSM Set", "UMTS Set",
                            "PDP Context Info"});
}

TEST_F(Ostrel_GSMTemplate, HoldsNothingElseButTheGroupsAroundThem) {
    expectGroups(nodes, index, {"Registration", "GSM", "UMTS", "Reselection", "Packet Data"});
}

TEST_F(Ostrel_GSMTemplate, KeysArePathComponents) {
    expectPathComponents(nodes);
}

} // namespace

} // namespace velmora
