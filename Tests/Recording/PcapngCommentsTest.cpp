// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

std::vector<std::string> commentsOf(const PcapngFile& file) {
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data(), 3)));
    EXPECT_TRUE(reader) << reader.reason();
    while ((*reader)->next()) {
    }
    EXPECT_EQ((*reader)->lossTotals().losses, 0U);
    EXPECT_EQ((*reader)->comments().count(), (*reader)->comments().first().size());
    std::vector<std::string> texts;
    for (const Comment& comment : (*reader)->comments().first())
        texts.push_back(std::to_string(static_cast<int>(comment.about)) + " " +
                        std::to_string(comment.number) + " at " + std::to_string(comment.offset) + ": " +
                        comment.text);
    return texts;
}

constexpr int aboutSection = static_cast<int>(Comment::About::Section);
constexpr int aboutInterface = static_cast<int>(Comment::About::Interface);
constexpr int aboutMessage = static_cast<int>(Comment::About::Message);

std::string at(int about, const std::string& rest) {
    return std::to_string(about) + " " + rest;
}

TEST(PcapngComments, areThoseOfSectionsInterfacesAndPackets) {
    for (const bool bigEndian : {false, true}) {
        PcapngFile file(bigEndian);
        const auto comment = [&file](std::string_view text) {
            return file.option(1, Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()));
        };
        const Data zero = file.number(0, 4);
        const Data one = file.number(1, 4);
        file.section();                                                         // 28 bytes
        file.interface(147, joined(comment("first"), comment("more")).bytes()); // 16 + 12 + 8 + 4 = 40
        // Time stamp 1, a message of one byte, padded, then its options.
        file.block(6, joined(zero, zero, one, one, one, hex("AA 00 00 00"), file.option(4, hex("07").bytes()),
                             comment("on a packet"))
                          .bytes());
        file.section();
        EXPECT_EQ(commentsOf(file), (std::vector<std::string>{at(aboutInterface, "1 at 28: first"),
                                                              at(aboutInterface, "1 at 28: more"),
                                                              at(aboutMessage, "1 at 68: on a packet")}));
    }
}

TEST(PcapngComments, ofASectionHaveItsNumber) {
    PcapngFile file;
    file.section().raw(hex(R"(0A0D0D0A 28000000 4D3C2B1A 0100 0000 FFFFFFFFFFFFFFFF
                              0100 0200 6869 0000
                              0000 0000
                              28000000)")
                           .bytes());
    EXPECT_EQ(commentsOf(file), (std::vector<std::string>{at(aboutSection, "2 at 28: hi")}));
}

TEST(PcapngComments, endWhereOptionsAreDamaged) {
    PcapngFile file;
    file.head();
    const Data zero = file.number(0, 4);
    const Data none = file.number(0, 4);
    // A comment, and one that is said to be longer than the block.
    file.block(6,
               joined(zero, zero, zero, none, none, hex("0100 0100 61 000000  0100 FF00 62 000000")).bytes());
    EXPECT_EQ(commentsOf(file), (std::vector<std::string>{at(aboutMessage, "1 at 76: a")}));
}

TEST(PcapngComments, areKeptUpToABoundAndCounted) {
    Comments comments;
    for (std::size_t i = 0; i < Comments::maximumKept + 5; ++i)
        comments.add({Comment::About::Message, i, 0, std::string(Comments::maximumLength + 1, 'x')});
    EXPECT_EQ(comments.count(), Comments::maximumKept + 5);
    ASSERT_EQ(comments.first().size(), Comments::maximumKept);
    EXPECT_EQ(comments.first().back().number, Comments::maximumKept - 1);
    EXPECT_EQ(comments.first().back().text.size(), Comments::maximumLength);
}

TEST(PcapngComments, canBeTakenBeyondThatBound) {
    Comments comments;
    for (std::size_t i = 0; i < Comments::maximumKept; ++i)
        comments.add({Comment::About::Message, i, 0, "early"});
    EXPECT_EQ(comments.takeNew().size(), Comments::maximumKept);
    EXPECT_TRUE(comments.takeNew().empty());
    comments.add({Comment::About::Message, 7, 0, std::string(Comments::maximumLength + 1, 'x')});
    const std::vector<Comment> late = comments.takeNew();
    ASSERT_EQ(late.size(), 1U);
    EXPECT_EQ(late[0].number, 7U);
    EXPECT_EQ(late[0].text.size(), Comments::maximumLength);
    for (std::size_t i = 0; i < 2 * Comments::maximumKept; ++i)
        comments.add({Comment::About::Message, i, 0, ""});
    EXPECT_EQ(comments.takeNew().size(), Comments::maximumKept);
}

} // namespace
} // namespace velmora
