// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"

#include <memory>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;

Bytes bytesOf(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

/// Messages and sentences in the order in which they come.
std::vector<std::string> contentOf(const PcapngFile& file) {
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(file.data(), 5)));
    EXPECT_TRUE(reader) << reader.reason();
    std::vector<std::string> content;
    (*reader)->setSentences([&](const PositionSentence& sentence) {
        content.push_back(std::to_string(sentence.number) + " at " +
                          std::to_string(sentence.time.time_since_epoch().count()) +
                          " ns: " + std::string(sentence.text));
    });
    while (const auto message = (*reader)->next())
        content.push_back("message " + std::to_string(message->number));
    EXPECT_EQ((*reader)->lossTotals().losses, 0U);
    return content;
}

PcapngFile withPositions(bool bigEndian = false, std::string_view name = "NMEA",
                         std::uint16_t linkType = 148) {
    PcapngFile file(bigEndian);
    file.section().messageInterface("Ostrel_GSM");
    file.interface(linkType,
                   joined(file.option(2, bytesOf(name)), file.option(9, hex("09").bytes())).bytes());
    return file;
}

TEST(PcapngSentences, comeBetweenTheMessages) {
    for (const bool bigEndian : {false, true}) {
        PcapngFile file = withPositions(bigEndian);
        file.message(5, bytesOf("$GPGGA*56"), 1);
        file.message(7, hex("AABB").bytes(), 0);
        file.message(9, bytesOf("$GPRMC*4B\r\n"), 1);
        EXPECT_THAT(contentOf(file),
                    ElementsAre("1 at 5 ns: $GPGGA*56", "message 2", "3 at 9 ns: $GPRMC*4B\r\n"));
    }
}

TEST(PcapngSentences, areOfTheInterfaceOfThatNameAndLinkType) {
    for (const auto& [name, linkType] :
         {std::pair("other", 148), std::pair("NMEA", 149), std::pair("", 148)}) {
        PcapngFile file = withPositions(false, name, static_cast<std::uint16_t>(linkType));
        file.message(5, bytesOf("$GPGGA*56"), 1);
        file.message(7, hex("AABB").bytes(), 0);
        EXPECT_THAT(contentOf(file), ElementsAre("message 2"));
    }
}

TEST(PcapngSentences, areNoneWhereThePacketIsDamaged) {
    PcapngFile file = withPositions();
    // Nine bytes captured, four there.
    file.block(6, hex("01000000 00000000 05000000 09000000 09000000 24475047").bytes());
    file.block(6, hex("01000000").bytes());
    file.message(7, hex("AABB").bytes(), 0);
    const auto reader = readOut(file.data());
    EXPECT_THAT(reader.messages, ElementsAre(testing::StartsWith("3 at ")));
    EXPECT_TRUE(reader.losses.empty() || reader.losses.size() == 1);
    EXPECT_EQ(reader.passedOver.packets, 0U);
}

} // namespace
} // namespace velmora
