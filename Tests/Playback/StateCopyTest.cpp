// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/StateCopy.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(StateCopyTest, IsIndependentOfTheState) {
    Dictionary state;
    const DictionaryRef display = makeDictionary();
    display->set("Band", "GSM 900");
    state.set("Display", display);
    Dictionary copy = StateCopy(state).take();
    display->set("Band", "GSM 1800");
    EXPECT_EQ(*(*copy["Display"].asDictionary())["Band"].asString(), "GSM 900");
    copy["Display"].asDictionary()->set("Band", "UMTS");
    EXPECT_EQ(*(*display)["Band"].asString(), "GSM 1800");
}

TEST(StateCopyTest, KeepsWhatIsShared) {
    Dictionary state;
    const DictionaryRef display = makeDictionary();
    const ArrayRef targets = makeArray();
    targets->append(display);
    state.set("Display", display);
    state.set("Lookup", targets);
    const Dictionary copy = StateCopy(state).take();
    EXPECT_NE(copy["Display"].asDictionary(), display.get());
    EXPECT_EQ(copy["Display"].asDictionary(), (*copy["Lookup"].asArray())[0].asDictionary());
}

TEST(StateCopyTest, SharesTheTemplateAndWhatIsFrozen) {
    Dictionary state;
    state.set("Template", makeDictionary());
    state.set("DisplayState", Value(makeArray()).copy());
    const Dictionary copy = StateCopy(state).take();
    EXPECT_EQ(copy["Template"].asDictionary(), state["Template"].asDictionary());
    EXPECT_EQ(copy["DisplayState"].asArray(), state["DisplayState"].asArray());
}

TEST(StateCopyTest, KeepsTheOrderOfKeys) {
    Dictionary state;
    for (const char* key : {"c", "a", "b"})
        state.set(key, 1);
    std::string order;
    const Dictionary copy = StateCopy(state).take();
    for (const auto& [key, value] : copy)
        order += key;
    EXPECT_EQ(order, "cab");
}

TEST(StateCopyTest, MeasuresWhatItAllocates) {
    Dictionary state;
    state.set("Display", std::string(1000, 'x'));
    const std::size_t text = StateCopy(state).size();
    EXPECT_GE(text, 1000U);
    EXPECT_LT(text, 1200U);
    Dictionary shared;
    shared.set("Template", std::string(1000, 'x'));
    EXPECT_EQ(StateCopy(shared).size(), 0U);
}

} // namespace
} // namespace velmora
