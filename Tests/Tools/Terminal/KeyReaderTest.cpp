// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/KeyReader.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

TEST(KeyReaderTest, EachKeyHasItsSequences) {
    KeyReader reader;
    EXPECT_THAT(reader.take("kj q"), ElementsAre(Key::Up, Key::Down, Key::PageDown, Key::Quit));
    EXPECT_THAT(reader.take("\x1b[A\x1b[B\x1bOA\x1bOB"), ElementsAre(Key::Up, Key::Down, Key::Up, Key::Down));
    EXPECT_THAT(reader.take("\x1b[5~\x1b[6~"), ElementsAre(Key::PageUp, Key::PageDown));
    EXPECT_THAT(reader.take("\x1b[H\x1bOH\x1b[1~\x1b[7~"),
                ElementsAre(Key::Home, Key::Home, Key::Home, Key::Home));
    EXPECT_THAT(reader.take("\x1b[F\x1bOF\x1b[4~\x1b[8~"),
                ElementsAre(Key::End, Key::End, Key::End, Key::End));
    EXPECT_THAT(reader.take("\x03"), ElementsAre(Key::Quit));
}

TEST(KeyReaderTest, SequencesMayBeSplit) {
    KeyReader reader;
    EXPECT_THAT(reader.take("\x1b"), ElementsAre());
    EXPECT_THAT(reader.take("["), ElementsAre());
    EXPECT_THAT(reader.take("6"), ElementsAre());
    EXPECT_THAT(reader.take("~j"), ElementsAre(Key::PageDown, Key::Down));
}

TEST(KeyReaderTest, OtherKeySequencesAreSkippedCompletely) {
    KeyReader reader;
    EXPECT_THAT(reader.take("xyz\n"), ElementsAre());
    // Ctrl-Up ends in A, F5 in ~, and neither is a key here.
    EXPECT_THAT(reader.take("\x1b[1;5A\x1b[15~j"), ElementsAre(Key::Down));
    EXPECT_THAT(reader.take("\x1b[999999999999999999999999j"), ElementsAre());
    EXPECT_THAT(reader.take("\x1b"
                            "k"),
                ElementsAre(Key::Up)); // Escape, then k
}

} // namespace
} // namespace velmora
