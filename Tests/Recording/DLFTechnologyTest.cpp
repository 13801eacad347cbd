// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/DLFReader.h"

#include "Tests/Recording/LogFile.h"

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(DLFTechnology, looksAMebibyteAheadForTheTechnology) {
    const Data nobodys = bareRecord(0x0001, std::string(120'000, '0'), stampAfter(0)); // 60012 bytes
    const Data some = bareRecord(0x512C, "05000100", stampAfter(1));
    const auto technologyAfter = [&](std::size_t records) {
        Data file = versionReport();
        std::vector<std::uint8_t> bytes(file.bytes().begin(), file.bytes().end());
        for (std::size_t i = 0; i < records; ++i)
            bytes.insert(bytes.end(), nobodys.bytes().begin(), nobodys.bytes().end());
        return readAnyForm(joined(Data(std::move(bytes)), some)).technology;
    };
    // 17 of them are 1020221 bytes with their type bytes, 18 are above the 1048576.
    EXPECT_EQ(technologyAfter(17), "Ostrel_GSM");
    EXPECT_EQ(technologyAfter(18), "");
}

/// This many records, of these codes one after another.
Data recordsOf(std::initializer_list<std::uint16_t> codes, int rounds) {
    std::vector<std::uint8_t> bytes;
    std::uint64_t units = 0;
    for (int round = 0; round < rounds; ++round)
        for (const std::uint16_t code : codes) {
            const Data each = bareRecord(code, "0000", stampAfter(units++));
            bytes.insert(bytes.end(), each.bytes().begin(), each.bytes().end());
        }
    return Data(std::move(bytes));
}

TEST(DLFTechnology, recognisesTheTechnologyByItsLogCodes) {
    struct Log {
        const char* name;
        Data records;
        const char* technology;
    };
    const Log files[] = {
        {"each technology's own codes: GSM", recordsOf({0x512C}, 1), "Ostrel_GSM"},
        {"LTE", recordsOf({0xB0C1}, 1), "Ostrel_LTE"},
        {"UTRAN", recordsOf({0xD00A}, 1), "Ostrel_UTRAN2"},
        {"CDMA", recordsOf({0x1183}, 1), "Ostrel_CDMA"},
        {"a code of no technology", recordsOf({0x1375}, 5), ""},
        {"several technologies' codes alone", recordsOf({0x0001, 0x0002}, 5), ""},
        {"several technologies' codes, and one's own at the end",
         joined(recordsOf({0x0001}, 50), recordsOf({0xD0E0}, 1)), "Ostrel_UTRAN2"},
        {"most messages decide", recordsOf({0x512C, 0xB17F, 0xB180}, 2), "Ostrel_LTE"},
        {"as many of two", recordsOf({0x512C, 0xB17F}, 2), ""},
        {"within 1000 messages", joined(recordsOf({0x1375}, 999), recordsOf({0xB17F}, 1)), "Ostrel_LTE"},
        {"not after them", joined(recordsOf({0x1375}, 1000), recordsOf({0xB17F}, 1)), ""},
        {"three ahead is enough", joined(recordsOf({0x512C}, 3), recordsOf({0xB17F}, 100)), "Ostrel_GSM"},
    };
    for (const Log& each : files) {
        auto reader = DLFReader::open(ChunkedInput(std::make_unique<MemorySource>(each.records)));
        ASSERT_TRUE(reader) << each.name << ": " << reader.reason();
        EXPECT_EQ((*reader)->technology(), each.technology) << each.name;
        EXPECT_EQ((*reader)->form(), "DLF log");
        // The messages of the look-ahead are returned as well, in order.
        std::uint64_t number = 0;
        while (const auto message = (*reader)->next())
            EXPECT_EQ(message->number, ++number);
        EXPECT_EQ(number, each.records.size() / 14) << each.name;
        EXPECT_EQ((*reader)->technology(), each.technology) << each.name;
    }
}

} // namespace
} // namespace velmora
