// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/KindNames.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

TEST(KindNamesTest, BuiltInKindsAreKnown) {
    const RuleSet rules{{}};
    EXPECT_THAT(kindNames(rules), testing::IsSupersetOf({"handover", "gap", "weak-coverage"}));
    EXPECT_FALSE(unknownKind({"handover", "gap"}, kindNames(rules)));
}

TEST(KindNamesTest, NearestKindsAreNamed) {
    EXPECT_EQ(unknownKind({"gap", "call-lst"}, {"handover", "gap", "call-end", "call-lost", "call-setup"}),
              "got call-lst, wanted a kind of event; the nearest are call-lost, call-end, call-setup");
}

} // namespace
} // namespace velmora
