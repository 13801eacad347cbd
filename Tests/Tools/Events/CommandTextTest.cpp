// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/CommandText.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

TEST(CommandTextTest, BlanksSeparateArguments) {
    EXPECT_THAT(*splitCommand("notify-send Velmora"), ElementsAre("notify-send", "Velmora"));
    EXPECT_THAT(*splitCommand("  a\t b  "), ElementsAre("a", "b"));
}

TEST(CommandTextTest, QuotesAndBackslashesKeepBlanks) {
    EXPECT_THAT(*splitCommand(R"('/opt/my tool' "two words" three\ words)"),
                ElementsAre("/opt/my tool", "two words", "three words"));
    EXPECT_THAT(*splitCommand(R"(a'b c'd)"), ElementsAre("ab cd"));
    EXPECT_THAT(*splitCommand(R"(a "\"" '\' "")"), ElementsAre("a", "\"", "\\", ""));
}

TEST(CommandTextTest, NothingIsExpanded) {
    EXPECT_THAT(*splitCommand("a $HOME *.txt ~ ; | > b && `c`"),
                ElementsAre("a", "$HOME", "*.txt", "~", ";", "|", ">", "b", "&&", "`c`"));
}

TEST(CommandTextTest, UnfinishedTextFails) {
    EXPECT_EQ(splitCommand("a 'b").reason(), "got a ' without its end, wanted another '");
    EXPECT_EQ(splitCommand("a \"b").reason(), "got a \" without its end, wanted another \"");
    EXPECT_EQ(splitCommand("a \\").reason(), "got nothing after the last backslash, wanted a character");
    for (const char* const text : {"", "  ", "''", "'' a"})
        EXPECT_EQ(splitCommand(text).reason(), "got no program, wanted one and its arguments") << text;
}

} // namespace
} // namespace velmora
