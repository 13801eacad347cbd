// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/ClassIndex.h"

#include "LogGenerator/Extra/PDPContextList.h"
#include "LogGenerator/Extra/SimInfo.h"
#include "LogGenerator/OstrelGSM/Registration/ProcessCS.h"
#include "Tests/LogGenerator/ClassIndexTesting.h"
#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsNull;
using testing::Pointee;
using testing::UnorderedElementsAre;

class SmallIndex final : public ClassIndex {
public:
    Held<SimInfo> sim{*this};
    Held<PDPContextList> contexts{*this};
    Held<ProcessCS> circuits{*this};
};

TEST(ClassIndexTest, FindsSectionsByNameAndCode) {
    const SmallIndex index;
    EXPECT_EQ(index.getClass("SIM Info"), index.sim.get());
    EXPECT_EQ(index.getClass("Sim Info"), nullptr);
    // 0xFF0000 is looked up under "16711680".
    EXPECT_TRUE(index.codeDictionary.contains("16711680"));
    EXPECT_THAT(index.getSubscribers(0xFF0000), Pointee(ElementsAre(index.sim.get())));
    EXPECT_THAT(index.getSubscribers(0x7131), Pointee(ElementsAre(index.circuits.get())));
    EXPECT_THAT(index.getSubscribers(0x1234), IsNull());
    EXPECT_THAT(index.getSubscribers(0xFFFFFFFF), IsNull());
}

class SingleIndex final : public ClassIndex {
public:
    Held<SimInfo> sim{*this};
};

TEST(ClassIndexTest, OtherCodesHaveNoSubscribersEvenInAFullTable) {
    const ClassIndex none;
    EXPECT_THAT(none.getSubscribers(0), IsNull());
    EXPECT_THAT(none.getSubscribers(0xFF0000), IsNull());
    const SingleIndex one;
    EXPECT_THAT(one.getSubscribers(0xFF0000), Pointee(ElementsAre(one.sim.get())));
    for (std::uint32_t code = 0; code < 16; ++code)
        EXPECT_THAT(one.getSubscribers(code), IsNull());
}

TEST(ClassIndexTest, CodesAddedLaterAreRouted) {
    SingleIndex index;
    EXPECT_THAT(index.getSubscribers(0x1234), IsNull());
    index.codeDictionary["4660"].push_back(index.sim.get());
    EXPECT_THAT(index.getSubscribers(0x1234), Pointee(ElementsAre(index.sim.get())));
    EXPECT_THAT(index.getSubscribers(0xFF0000), Pointee(ElementsAre(index.sim.get())));
}

TEST(ClassIndexTest, ListsEveryCodeAsADecimalString) {
    EXPECT_THAT(SmallIndex().getAllLogCodes(),
                UnorderedElementsAre("16711680", "16711682", "28977", "28978"));
}

TEST(ClassIndexTest, StatusSaysWhatTheClassDictionaryIs) {
    const SmallIndex index;
    const CapturedLog log;
    index.status();
    EXPECT_THAT(log.lines(), ElementsAre(CapturedLog::Line{LogPriority::Warning, "Dictionary = 1"},
                                         CapturedLog::Line{LogPriority::Warning, "String = 0"}));
}

TEST(ClassIndexTest, DestructionPrintsItsLineOnTheConsole) {
    EXPECT_EQ(printedBy([] { const SmallIndex index; }), "Deallocing ClassIndex\n");
}

} // namespace
} // namespace velmora
