// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"

#include <algorithm>
#include <memory>
#include <random>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

/// Head (76 bytes), then messages of 40 bytes' blocks at 76, 116, 156, 196.
PcapngFile fourMessages(bool bigEndian = false) {
    PcapngFile file(bigEndian);
    file.head();
    for (const char* const message : {"A0A1A2A3A4", "B0B1B2B3B4", "C0C1C2C3C4", "D0D1D2D3D4"})
        file.message(1, hex(message).bytes());
    return file;
}

const std::vector<std::string> fourTexts{"1 at 76, 1 ns: A0A1A2A3A4", "2 at 116, 1 ns: B0B1B2B3B4",
                                         "3 at 156, 1 ns: C0C1C2C3C4", "4 at 196, 1 ns: D0D1D2D3D4"};
constexpr std::size_t fourSize = 236;

/// The four without the one at `lost`; those after it keep their numbers unless it was not counted.
std::vector<std::string> without(std::size_t lost) {
    std::vector<std::string> texts;
    for (std::size_t i = 0; i < fourTexts.size(); ++i) {
        if (i != lost)
            texts.push_back(std::to_string(i < lost ? i + 1 : i) + fourTexts[i].substr(1));
    }
    return texts;
}

TEST(RecordingDamage, truncationInTheLastTwoBlocksLosesOnlyTheTruncatedOne) {
    const Data whole = fourMessages().data();
    ASSERT_EQ(whole.size(), fourSize);
    for (std::size_t size = 156; size < fourSize; ++size) {
        const ReadOut out = readOut(Data::copyOf(whole.bytes().first(size)));
        const std::size_t messages = size < 196 ? 2 : 3;
        const std::size_t begin = size < 196 ? 156 : 196;
        EXPECT_EQ(out.messages, std::vector<std::string>(fourTexts.begin(),
                                                         fourTexts.begin() + static_cast<long>(messages)))
            << size;
        EXPECT_EQ(out.failure, "");
        const std::string left = std::to_string(size - begin);
        const std::string reason = size - begin < 12 ? "block header cut off after " + left + " of 12 bytes"
                                                     : "block cut off after " + left + " of 40 bytes";
        if (size == begin)
            EXPECT_THAT(out.losses, IsEmpty()) << size;
        else
            EXPECT_THAT(out.losses,
                        ElementsAre("at " + std::to_string(begin) + ", " + left + " bytes, record " +
                                    std::to_string(messages + 1) + ", tail: " + reason))
                << size;
    }
}

TEST(RecordingDamage, cutOffWithinItsHeadIsAnEmptyRecording) {
    const Data whole = fourMessages().data();
    for (std::size_t size = 12; size < 76; ++size) {
        const ReadOut out = readOut(Data::copyOf(whole.bytes().first(size)));
        EXPECT_EQ(out.failure, "") << size;
        EXPECT_THAT(out.messages, IsEmpty()) << size;
        EXPECT_EQ(out.losses.size(), size == 28 ? 0U : 1U) << size;
    }
}

struct DamageCase {
    const char* name;
    std::size_t offset; ///< where the four bytes are
    const char* bytes;
    std::vector<std::string> messages;
    std::string loss;
};

class DamagedBlocks : public testing::TestWithParam<DamageCase> {};

TEST_P(DamagedBlocks, loseThemselvesAlone) {
    PcapngFile file = fourMessages();
    const Data damage = hex(GetParam().bytes);
    std::copy(damage.bytes().begin(), damage.bytes().end(),
              file.bytes().begin() + static_cast<long>(GetParam().offset));
    for (const std::size_t piece : {std::size_t{1}, SIZE_MAX}) {
        const ReadOut out = readOut(file.data(), piece);
        EXPECT_EQ(out.messages, GetParam().messages);
        EXPECT_THAT(out.losses, ElementsAre(GetParam().loss));
        EXPECT_EQ(out.failure, "");
    }
}

const std::string limits = ", wanted a multiple of 4 from 12 to 17825792";

INSTANTIATE_TEST_SUITE_P(
    Table, DamagedBlocks,
    testing::Values(DamageCase{"LengthNoMultipleOf4", 120, "29000000", without(1),
                               "at 116, 40 bytes, record 2: block length 41" + limits},
                    DamageCase{"LengthZero", 120, "00000000", without(1),
                               "at 116, 40 bytes, record 2: block length 0" + limits},
                    DamageCase{"LengthBelow12", 120, "08000000", without(1),
                               "at 116, 40 bytes, record 2: block length 8" + limits},
                    DamageCase{"LengthAbsurd", 120, "00000080", without(1),
                               "at 116, 40 bytes, record 2: block length 2147483648" + limits},
                    DamageCase{"LengthJustAboveTheLimit", 120, "04001001", without(1),
                               "at 116, 40 bytes, record 2: block length 17825796" + limits},
                    // Reaches past the end of the file; what follows shows that the file was not cut.
                    DamageCase{"LengthPastTheEnd", 120, "28010000", without(1),
                               "at 116, 40 bytes, record 2: block cut off after 120 of 296 bytes"},
                    // The word where a block of 44 bytes would end is the type of the third message's block.
                    DamageCase{"LengthIntoTheNextBlock", 120, "2C000000", without(1),
                               "at 116, 40 bytes, record 2: trailing block length 6, wanted 44"},
                    DamageCase{"TrailingLength", 152, "2C000000", without(1),
                               "at 116, 40 bytes, record 2: trailing block length 44, wanted 40"},
                    DamageCase{"LastTrailingLengthIsDamageNoTail", 232, "00000000", without(3),
                               "at 196, 40 bytes, record 4: trailing block length 0, wanted 40"},
                    DamageCase{"SectionLength", 4, "00000000", fourTexts,
                               "at 0, 28 bytes, record 1: block length 0" + limits}),
    [](const auto& row) { return std::string(row.param.name); });

TEST(RecordingDamage, ofBigEndianFilesIsPassedAsWell) {
    PcapngFile file = fourMessages(true);
    file.bytes()[123] = 0x29;
    const ReadOut out = readOut(file.data());
    EXPECT_EQ(out.messages, without(1));
    EXPECT_THAT(out.losses, ElementsAre("at 116, 40 bytes, record 2: block length 41" + limits));
}

TEST(RecordingDamage, ofManyZeroBytesIsOneLoss) {
    PcapngFile file = fourMessages();
    file.raw(std::vector<std::uint8_t>(3'000'000)).message(9, hex("EE").bytes());
    const ReadOut out = readOut(file.data());
    std::vector<std::string> expected = fourTexts;
    expected.emplace_back("5 at 3000236, 9 ns: EE");
    EXPECT_EQ(out.messages, expected);
    EXPECT_THAT(out.losses, ElementsAre("at 236, 3000000 bytes, record 5: block length 0" + limits));
}

TEST(RecordingDamage, atTheEndIsNoTail) {
    PcapngFile file = fourMessages();
    file.raw(std::vector<std::uint8_t>(100));
    const ReadOut out = readOut(file.data());
    EXPECT_EQ(out.messages, fourTexts);
    EXPECT_THAT(out.losses, ElementsAre("at 236, 100 bytes, record 5: block length 0" + limits));
}

TEST(RecordingDamage, ofARecordingAppendedToOneCutOffAtAnyByteIsPassed) {
    const Data first = fourMessages().data();
    for (std::size_t size = 197; size < fourSize; ++size) {
        PcapngFile file;
        file.raw(first.bytes().first(size))
            .raw(PcapngFile().head().message(2, hex("EE").bytes()).data().bytes());
        const ReadOut out = readOut(file.data());
        std::vector<std::string> expected(fourTexts.begin(), fourTexts.begin() + 3);
        expected.push_back("4 at " + std::to_string(size + 76) + ", 2 ns: EE");
        EXPECT_EQ(out.messages, expected) << size;
        EXPECT_THAT(out.losses,
                    ElementsAre(StartsWith("at 196, " + std::to_string(size - 196) + " bytes, record 4: ")))
            << size;
    }
}

TEST(RecordingDamage, ofManyBlocksThatAllPromiseTheMostIsPassedInTimeAndMemory) {
    // Every second word could begin a block of 16777212 bytes, which would have to end with an odd word.
    std::vector<std::uint8_t> hostile;
    const Data step = hex("06000000 FCFFFF00");
    for (int i = 0; i < 2'500'000; ++i)
        hostile.insert(hostile.end(), step.bytes().begin(), step.bytes().end());
    const ReadOut out = readOut(PcapngFile().head().raw(hostile).data());
    EXPECT_THAT(out.messages, IsEmpty());
    EXPECT_THAT(out.losses,
                ElementsAre("at 76, 20000000 bytes, record 1: trailing block length 6, wanted 16777212"));
}

/// Whether the message's bytes are those of one of the four, and so not made up.
bool isAsWritten(const std::string& text) {
    return std::any_of(fourTexts.begin(), fourTexts.end(),
                       [&](const std::string& known) { return known.substr(1) == text.substr(1); });
}

TEST(RecordingDamage, ofAnyOneByteGivesMessagesOrLosses) {
    const PcapngFile whole = fourMessages();
    for (std::size_t at = 0; at < fourSize; ++at) {
        for (const int flip : {0x01, 0x80, 0xFF}) {
            PcapngFile file = whole;
            file.bytes()[at] ^= static_cast<std::uint8_t>(flip);
            const ReadOut out = readOut(file.data());
            const std::string where = "byte " + std::to_string(at) + " ^ " + std::to_string(flip);
            if (!out.failure.empty()) {
                // Only what makes it a pcapng file at all.
                EXPECT_TRUE(at < 4 || (at >= 8 && at < 12)) << where << ": " << out.failure;
                continue;
            }
            const auto kept = std::count_if(out.messages.begin(), out.messages.end(), isAsWritten);
            // The head's damage may change how all is read; a block's changes that block alone.
            if (at >= 76) {
                EXPECT_GE(kept, 3) << where;
                // A changed type makes a block of another kind, which is a loss that cannot be detected.
                const bool inType = (at - 76) % 40 < 4;
                EXPECT_TRUE(inType || out.messages.size() + out.losses.size() >= 4) << where;
            } else {
                EXPECT_TRUE(out.messages.size() == 4 || !out.losses.empty() || out.passedOver.packets == 4)
                    << where;
            }
        }
    }
}

TEST(RecordingDamage, ofAnyKindKeepsMessagesAndLossesInOrderAndApart) {
    std::mt19937 random(7);
    for (int round = 0; round < 3'000; ++round) {
        PcapngFile file(round % 2 != 0);
        file.head();
        for (std::size_t i = 0; i < 30; ++i)
            file.message(i, std::vector<std::uint8_t>(random() % 50, static_cast<std::uint8_t>(i)));
        // A few bytes changed, removed or inserted, after the first section's magic.
        for (auto changes = random() % 6; changes > 0; --changes) {
            const auto place = file.bytes().begin() + 12 + static_cast<long>(random() % (file.size() - 12));
            const auto length = std::min<long>(static_cast<long>(random() % 9), file.bytes().end() - place);
            if (random() % 3 == 0)
                file.bytes().erase(place, place + length);
            else if (random() % 2 == 0)
                file.bytes().insert(place, static_cast<std::size_t>(length),
                                    static_cast<std::uint8_t>(random()));
            else
                std::fill_n(place, length, static_cast<std::uint8_t>(random()));
        }
        const Data data = file.data();
        auto reader = PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(data, 100), 8192));
        ASSERT_TRUE(reader) << reader.reason();
        std::uint64_t number = 0;
        std::uint64_t end = 0;
        std::vector<std::pair<std::uint64_t, std::uint64_t>> stretches;
        while (const auto message = (*reader)->next()) {
            ASSERT_GT(message->number, number) << round;
            ASSERT_GE(message->offset, end) << round;
            number = message->number;
            end = message->offset + 16 + message->message.size();
            ASSERT_LE(end, data.size()) << round;
            stretches.emplace_back(message->offset, end);
            // Its bytes are in the file, after a header of 12 (simple) or 28 bytes.
            const auto standsBehind = [&](std::size_t header) {
                const std::size_t begin = message->offset + header;
                return begin + message->message.size() <= data.size() &&
                       message->message == Data::copyOf(data.bytes().subspan(begin, message->message.size()));
            };
            ASSERT_TRUE(standsBehind(12) || standsBehind(28)) << round;
        }
        for (const Loss& loss : (*reader)->losses())
            stretches.emplace_back(loss.offset, loss.offset + loss.bytes);
        std::sort(stretches.begin(), stretches.end());
        for (std::size_t i = 1; i < stretches.size(); ++i)
            ASSERT_LE(stretches[i - 1].second, stretches[i].first) << round;
        if (!stretches.empty()) {
            ASSERT_LE(stretches.back().second, data.size()) << round;
        }
    }
}

} // namespace
} // namespace velmora
