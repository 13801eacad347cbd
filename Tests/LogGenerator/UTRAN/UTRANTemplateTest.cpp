// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Tests/LogGenerator/TemplateCheck.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

class UTRANTemplate : public testing::Test {
protected:
    const std::vector<TemplateNode> nodes = shippedTemplate("Ostrel_UTRAN.plist");
    const UTRANClassIndex index;
};

TEST_F(UTRANTemplate, HoldsEverySectionOnceAndOfItsKind) {
    ASSERT_EQ(index.classDict.size(), 8u);
    expectEverySectionOnce(
        nodes, index,
        {"Neighbor Cell List", "GSM Neighbor Cell List", "TRCH BLER", "CCTRCH SIR", "PDP Context Info"});
}

TEST_F(UTRANTemplate, HoldsNothingElseButTheGroupsAroundThem) {
    expectGroups(nodes, index, {"Serving Cell", "Neighbors", "Channel Quality"});
}

TEST_F(UTRANTemplate, KeysArePathComponents) {
    expectPathComponents(nodes);
}

} // namespace

} // namespace velmora
