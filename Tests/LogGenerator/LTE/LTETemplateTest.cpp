// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Tests/LogGenerator/TemplateCheck.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

class LTETemplate : public testing::Test {
protected:
    const std::vector<TemplateNode> nodes = shippedTemplate("LTE.plist");
    const LTEClassIndex index;
};

TEST_F(LTETemplate, HoldsEverySectionOnceAndOfItsKind) {
    ASSERT_EQ(index.classDict.size(), 11u);
    expectEverySectionOnce(nodes, index,
                           {"Measured Neighbor Cells", "Detected Cells", "Neighbor Cells List",
                            "Reselection Candidates List", "PDP Context Info"});
}

TEST_F(LTETemplate, HoldsNothingElseButTheGroupsAroundThem) {
    expectGroups(nodes, index,
                 {"Serving Cell", "Idle Mode Neighbors", "Reselection", "Connected Mode", "Packet Data"});
}

TEST_F(LTETemplate, KeysArePathComponents) {
    expectPathComponents(nodes);
}

} // namespace

} // namespace velmora
