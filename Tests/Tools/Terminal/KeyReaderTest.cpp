// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/KeyReader.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

std::vector<Key> keysOf(const std::vector<KeyPress>& presses) {
    std::vector<Key> keys;
    for (const KeyPress& press : presses)
        keys.push_back(press.key);
    return keys;
}

TEST(KeyReaderTest, EachKeyHasItsSequences) {
    KeyReader reader;
    EXPECT_THAT(keysOf(reader.take("\x1b[A\x1b[B\x1bOA\x1bOB")),
                ElementsAre(Key::Up, Key::Down, Key::Up, Key::Down));
    EXPECT_THAT(keysOf(reader.take("\x1b[C\x1b[D\x1bOC\x1bOD")),
                ElementsAre(Key::Right, Key::Left, Key::Right, Key::Left));
    EXPECT_THAT(keysOf(reader.take("\x1b[5~\x1b[6~\x02\x06")),
                ElementsAre(Key::PageUp, Key::PageDown, Key::PageUp, Key::PageDown));
    EXPECT_THAT(keysOf(reader.take("\x1b[H\x1bOH\x1b[1~\x1b[7~")),
                ElementsAre(Key::Home, Key::Home, Key::Home, Key::Home));
    EXPECT_THAT(keysOf(reader.take("\x1b[F\x1bOF\x1b[4~\x1b[8~")),
                ElementsAre(Key::End, Key::End, Key::End, Key::End));
    EXPECT_THAT(keysOf(reader.take("\t\x1b[Z\r\n\x7f\b")),
                ElementsAre(Key::Tab, Key::BackTab, Key::Enter, Key::Enter, Key::Backspace, Key::Backspace));
    EXPECT_THAT(keysOf(reader.take("\x03\x1a\x0c\x15")),
                ElementsAre(Key::Interrupt, Key::Suspend, Key::Redraw, Key::EraseLine));
}

TEST(KeyReaderTest, CharactersAreTheirText) {
    KeyReader reader;
    EXPECT_THAT(reader.take("aö€"), ElementsAre(KeyPress{Key::Character, "a"}, KeyPress{Key::Character, "ö"},
                                                KeyPress{Key::Character, "€"}));
    EXPECT_THAT(reader.take("\xf0\x9f"), ElementsAre());
    EXPECT_TRUE(reader.isWaiting());
    EXPECT_THAT(reader.take("\x93\xb1"), ElementsAre(KeyPress{Key::Character, "\xf0\x9f\x93\xb1"}));
    EXPECT_FALSE(reader.isWaiting());
}

TEST(KeyReaderTest, LettersScrollWhereNoTextIsTyped) {
    KeyReader reader;
    std::vector<Key> keys;
    for (const KeyPress& press : reader.take("kj bgGq"))
        keys.push_back(scrollKey(press));
    EXPECT_THAT(keys, ElementsAre(Key::Up, Key::Down, Key::PageDown, Key::PageUp, Key::Home, Key::End,
                                  Key::Character));
}

TEST(KeyReaderTest, SequencesMayBeSplit) {
    KeyReader reader;
    EXPECT_THAT(reader.take("\x1b"), ElementsAre());
    EXPECT_THAT(reader.take("["), ElementsAre());
    EXPECT_THAT(reader.take("6"), ElementsAre());
    EXPECT_THAT(keysOf(reader.take("~\x1b[B")), ElementsAre(Key::PageDown, Key::Down));
}

TEST(KeyReaderTest, EscapeIsAKeyOnceNothingFollows) {
    KeyReader reader;
    EXPECT_THAT(reader.take("\x1b"), ElementsAre());
    EXPECT_TRUE(reader.isWaiting());
    EXPECT_THAT(keysOf(reader.finish()), ElementsAre(Key::Escape));
    EXPECT_FALSE(reader.isWaiting());
    EXPECT_THAT(reader.take("\x1b["), ElementsAre());
    EXPECT_THAT(reader.finish(), ElementsAre()); // the beginning of no key
    EXPECT_THAT(reader.take("k"), ElementsAre(KeyPress{Key::Character, "k"}));
    EXPECT_THAT(reader.take("\x1b"
                            "k"),
                ElementsAre(KeyPress{Key::Escape}, KeyPress{Key::Character, "k"}));
}

TEST(KeyReaderTest, OtherSequencesAndBytesAreSkippedCompletely) {
    KeyReader reader;
    // Ctrl-Up ends in A, F5 in ~, and neither is a key here.
    EXPECT_THAT(keysOf(reader.take("\x1b[1;5A\x1b[15~\x1b[B")), ElementsAre(Key::Down));
    EXPECT_THAT(reader.take("\x1b[999999999999999999999999j"), ElementsAre());
    EXPECT_THAT(reader.take("\x01\xff\xc0\x1f"), ElementsAre());
}

} // namespace
} // namespace velmora
