// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/GzipSource.h"

#include "Recording/OpenMessages.h"
#include "Tests/Recording/LogFile.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <fstream>
#include <iterator>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

/// "abc", and nothing, each a member.
constexpr const char* abc = R"(
    1F 8B 08 00 00000000 02 03   # deflate, no flags, no time
    4B 4C 4A 06 00               # three literals
    C2 41 24 35                  # the CRC
    03 00 00 00)";
constexpr const char* nothing = "1F 8B 08 00 00000000 02 03  03 00  00000000 00000000";

/// What comes out of the source until its end or failure, and the failure's reason after a blank.
std::string unpacked(const Data& file, std::size_t piece = SIZE_MAX, std::size_t good = SIZE_MAX,
                     std::size_t room = 64) {
    GzipSource source(ChunkedInput(std::make_unique<MemorySource>(file, piece, good)));
    std::string text;
    std::vector<std::uint8_t> buffer(room);
    for (;;) {
        const Result<std::size_t> count = source.read(buffer);
        if (!count)
            return text + " " + count.reason();
        if (*count == 0)
            return text;
        text.append(buffer.begin(), buffer.begin() + static_cast<std::ptrdiff_t>(*count));
    }
}

TEST(GzipSource, unpacksMembersOneAfterAnother) {
    for (const std::size_t piece : {std::size_t{1}, std::size_t{5}, SIZE_MAX})
        for (const std::size_t room : {std::size_t{1}, std::size_t{64}}) {
            EXPECT_EQ(unpacked(hex(abc), piece, SIZE_MAX, room), "abc");
            EXPECT_EQ(unpacked(joined(hex(abc), hex(nothing), hex(abc)), piece, SIZE_MAX, room), "abcabc");
            EXPECT_EQ(unpacked(joined(hex(abc), hex("00 00 00")), piece, SIZE_MAX, room), "abc") << "padding";
            EXPECT_EQ(unpacked(hex(nothing), piece, SIZE_MAX, room), "");
        }
}

TEST(GzipSource, reportsWhatIsDamagedAfterTheBytesBefore) {
    const Data whole = hex(abc);
    struct Row {
        const char* name;
        Data file;
        const char* result;
    };
    const Row rows[] = {
        {"empty", Data(), " not gzip'd data, at byte 0 of the file; unpacked it ends"},
        {"no gzip", hex("1F 8B 07 00"), " not gzip'd data, at byte 0 of the file; unpacked it ends"},
        {"short header", hex("1F 8B 08 00 00"),
         " gzip'd data that ends early, at byte 5 of the file; unpacked it ends"},
        {"no trailer", Data::copyOf(whole.bytes().first(15)),
         "abc gzip'd data that ends early, at byte 15 of the file; unpacked it ends"},
        {"wrong CRC", joined(Data::copyOf(whole.bytes().first(15)), hex("C2 41 24 36 03000000")),
         "abc damaged gzip'd data (incorrect data check), near byte 19 of the file; unpacked it ends"},
        {"wrong length", joined(Data::copyOf(whole.bytes().first(19)), hex("04000000")),
         "abc damaged gzip'd data (incorrect length check), near byte 23 of the file; unpacked it ends"},
        {"a block of no type", hex("1F 8B 08 00 00000000 02 03 07"),
         " damaged gzip'd data (invalid block type), near byte 11 of the file; unpacked it ends"},
        {"more after it", joined(whole, hex("00 41 42")),
         "abc gzip'd data followed by something else, at byte 24 of the file; unpacked it ends"},
    };
    for (const Row& row : rows)
        for (const std::size_t piece : {std::size_t{1}, SIZE_MAX})
            EXPECT_EQ(unpacked(row.file, piece), row.result) << row.name;
}

TEST(GzipSource, repeatsAFailure) {
    GzipSource source(ChunkedInput(std::make_unique<MemorySource>(hex("1F 8B 08 00 00"))));
    std::uint8_t byte = 0;
    EXPECT_FALSE(source.read({&byte, 1}));
    EXPECT_FALSE(source.read({&byte, 1}));
}

TEST(GzipSource, passesOnAFailureToRead) {
    EXPECT_THAT(unpacked(hex(abc), 1, 12),
                testing::StartsWith("a cannot read: Input/output error at offset 12"));
}

class GzippedFile : public testing::Test {
protected:
    /// The file packed by the program of that name.
    [[nodiscard]] std::string packed(const Data& content) const {
        const std::string path = _directory / "file";
        std::ofstream(path, std::ios::binary)
            .write(reinterpret_cast<const char*>(content.bytes().data()),
                   static_cast<std::streamsize>(content.size()));
        EXPECT_EQ(runShell("gzip -kf " + path).status, 0);
        return path + ".gz";
    }

    TemporaryDirectory _directory;
};

TEST_F(GzippedFile, ofEveryFormIsReadAsTheFileItself) {
    NEEDS_PROGRAM("gzip");
    PcapngFile recording;
    recording.head();
    for (std::uint64_t i = 0; i < 20'000; ++i) // several chunks, packed and unpacked
        recording.message(i, record(0x512C, i % 3 == 0 ? "05000100" : "04000100").bytes());
    for (const Data& file :
         {recording.data(),
          snapshotFile({historyEntry(record(0x512C, "05000100"), "2026-11-16 05:00:02 +0000")}),
          joined(versionReport(), bareRecord(0x512C, "05000100"))}) {
        const std::string path = packed(file);
        const auto plain = openMessages(ChunkedInput(std::make_unique<MemorySource>(file)));
        const auto reader = openMessages(path);
        ASSERT_TRUE(plain);
        ASSERT_TRUE(reader) << reader.reason();
        EXPECT_FALSE((*plain)->isCompressed());
        EXPECT_TRUE((*reader)->isCompressed());
        EXPECT_EQ((*reader)->form(), (*plain)->form());
        EXPECT_EQ((*reader)->technology(), (*plain)->technology());
        while (const auto wanted = (*plain)->next()) {
            const auto message = (*reader)->next();
            ASSERT_TRUE(message);
            EXPECT_EQ(describe(*message), describe(*wanted));
        }
        EXPECT_FALSE((*reader)->next());
        EXPECT_FALSE((*reader)->failure());
        EXPECT_EQ((*reader)->lossTotals().losses, 0U);
    }
}

TEST_F(GzippedFile, thatEndsEarlyIsReadUpToThere) {
    NEEDS_PROGRAM("gzip");
    PcapngFile recording;
    recording.head();
    for (std::uint64_t i = 0; i < 2'000; ++i)
        recording.message(i * i * 7919, recording.number(i * 104'729, 8).bytes());
    const std::string path = packed(recording.data());
    ASSERT_EQ(runShell("head -c 5000 " + path + " > " + path + ".cut").status, 0);
    const auto reader = openMessages(path + ".cut");
    ASSERT_TRUE(reader) << reader.reason();
    std::uint64_t messages = 0;
    while ((*reader)->next())
        ++messages;
    EXPECT_GT(messages, 10U);
    EXPECT_LT(messages, 2'000U);
    ASSERT_TRUE((*reader)->failure());
    EXPECT_THAT(
        (*reader)->failure()->reason,
        testing::MatchesRegex(
            "gzip'd data that ends early, at byte 5000 of the file; unpacked it ends at offset [0-9]+"));
}

TEST_F(GzippedFile, insideAnotherIsRefused) {
    NEEDS_PROGRAM("gzip");
    std::ifstream file(packed(PcapngFile().head().data()), std::ios::binary);
    const std::vector<std::uint8_t> once{std::istreambuf_iterator<char>(file), {}};
    const auto reader = openMessages(packed(Data::copyOf(once)));
    ASSERT_FALSE(reader);
    EXPECT_THAT(reader.reason(), testing::StartsWith("begins 1F 8B 08 "));
}

} // namespace
} // namespace velmora
