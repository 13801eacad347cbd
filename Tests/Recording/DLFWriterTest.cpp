// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/DLFWriter.h"

#include "Tests/Recording/FakeRecordingFile.h"
#include "Tests/Recording/LogFile.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <cerrno>
#include <chrono>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::IsEmpty;

class DLFWriterTest : public testing::Test {
protected:
    DLFWriterTest() { _resources.version = "1.2"; }

    [[nodiscard]] std::unique_ptr<DLFWriter> make() {
        auto writer = DLFWriter::start(std::make_unique<FakeRecordingFile>(_medium), "drive.dlf", _clock);
        if (!writer)
            throw std::runtime_error(writer.reason());
        return *std::move(writer);
    }
    [[nodiscard]] std::string written(std::size_t from) const {
        return hexText(Bytes(_medium.content).subspan(from));
    }

    FakeClock _clock;
    FakeResources _resources;
    FakeOutputFile _medium;
};

TEST_F(DLFWriterTest, beginsWithTheVersionReport) {
    _clock.setZone({-(std::chrono::hours(5) + std::chrono::minutes(30)), true});
    const auto writer = make();
    const Data wanted = joined(hex(R"(A100 FD1F 0000000000000000 0100 0100
                                      56656C6D6F7200)"),                // "Velmor", all that finds room
                               hex("45584543555441424C455F4E414D4500"), // "EXECUTABLE_NAME"
                               Data(std::vector<std::uint8_t>(24)),
                               hex("5365702031312032303139 2031383A353400"), // "Sep 11 2019 18:54"
                               hex("D08DFA6A"),                              // seconds since 1970
                               hex("B6FE"),                                  // -330 minutes
                               hex("0100"), Data(std::vector<std::uint8_t>(72)));
    EXPECT_EQ(written(0), hexText(wanted.bytes()));
}

TEST_F(DLFWriterTest, dropsTypeBytesThatFollowFromTheCode) {
    struct Case {
        const char* name;
        const char* message;
        const char* record;
    };
    const Case cases[] = {
        {"baseband", "01 1000 2C51 0000000000000000 05000100", "10002C51000000000000000005000100"},
        {"extra", "FF 0D00 0200 0000000000000000 3C", "0D00020000000000000000003C"},
        {"least", "01 0C00 2C51 0000000000000000", "0C002C510000000000000000"},
        {"baseband with an extra code", "01 0D00 0200 0000000000000000 3C", "010D00020000000000000000003C"},
        {"a live modem's", "FF 0D00 0700 0000000000000000 3C", "0D00070000000000000000003C"},
        {"extra with another code", "FF 0D00 0800 0000000000000000 3C", "FF0D00080000000000000000003C"},
        {"wrong type", "02 0D00 2C51 0000000000000000 05", "020D002C51000000000000000005"},
        {"prefixed", "8171 01 0D00 2C51 0000000000000000 05", "8171010D002C51000000000000000005"},
    };
    for (const Case& each : cases) {
        _medium = FakeOutputFile();
        const auto writer = make();
        EXPECT_TRUE(writer->append(hex(each.message).bytes())) << each.name;
        EXPECT_TRUE(writer->close()) << each.name;
        EXPECT_EQ(written(161), each.record) << each.name;
        EXPECT_EQ(writer->messages(), 1u);
        EXPECT_EQ(writer->refused(), 0u);
    }
}

TEST_F(DLFWriterTest, refusesMessagesThatHideTheNextRecord) {
    struct Case {
        const char* message;
        const char* reason;
    };
    const Case cases[] = {
        {"", "message of 0 bytes, wanted a record header of 13 at least"},
        {"01 1000 2C51", "message of 5 bytes, wanted a record header of 13 at least"},
        {"01 0B00 2C51 00000000000000", "message of 12 bytes, wanted a record header of 13 at least"},
        {"8171 01 0B00 2C51 00000000000000", "message of 14 bytes, wanted a record header of 13 at least"},
        {"01 1100 2C51 0000000000000000 05000100",
         "record length 17 in a message whose record has 16 bytes after its type"},
        {"8171 01 0000 2C51 0000000000000000 05",
         "record length 0 in a message whose record has 13 bytes after its type"},
    };
    const auto writer = make();
    for (const Case& each : cases) {
        const auto refused = writer->append(hex(each.message).bytes());
        ASSERT_FALSE(refused) << each.message;
        EXPECT_EQ(refused.reason(), each.reason);
    }
    // That ends nothing.
    EXPECT_FALSE(writer->hasFailed());
    EXPECT_TRUE(writer->append(record(0x512C, "05000100").bytes()));
    EXPECT_TRUE(writer->close());
    EXPECT_EQ(writer->refused(), 6u);
    EXPECT_EQ(writer->messages(), 1u);
    EXPECT_EQ(_medium.content.size(), 161u + 16u);
}

TEST_F(DLFWriterTest, whatItWritesIsReadAgain) {
    std::vector<Data> messages;
    const auto writer = make();
    for (std::uint64_t i = 0; i < 20'000; ++i) {
        const auto type = static_cast<std::uint8_t>(i % 7 == 0 ? 0xFF : i % 11 == 0 ? 2 : 1);
        const auto code = static_cast<std::uint16_t>(type == 0xFF || i % 13 == 0 ? i % 4 : 0x5000 + i % 512);
        Data message = stampedRecord(code, i % 3 == 0 ? "05000100AABBCCDD" : "0102", stampAfter(i), type);
        if (i % 5 == 0)
            message = joined(hex("8171"), message);
        ASSERT_TRUE(writer->append(message.bytes())) << i;
        messages.push_back(message);
    }
    ASSERT_TRUE(writer->close());
    EXPECT_EQ(_medium.syncsWaitedFor, 1u);
    EXPECT_TRUE(_medium.closed);
    const ReadOut out = readAnyForm(Data::copyOf(_medium.content));
    ASSERT_EQ(out.messages.size(), messages.size());
    for (std::size_t i = 0; i < messages.size(); ++i)
        ASSERT_TRUE(out.messages[i].ends_with(": " + hexText(messages[i].bytes()))) << out.messages[i];
    EXPECT_THAT(out.losses, IsEmpty());
}

TEST_F(DLFWriterTest, recordsWhosePayloadResemblesARecordAreReadAgain) {
    // The last byte of today's time stamps is 01, as a type is. With it these payloads are records
    // themselves, which end where the log ends.
    for (const char* payload : {"0C000000 0000000000000000", "0D000000 000000000000000001",
                                "0C00FF00 0000000000000000", "10000000 0000000000000000 00000000"})
        for (std::uint16_t code = 0; code <= 7; ++code) {
            _medium = FakeOutputFile();
            const auto writer = make();
            const Data message = stampedRecord(code, payload, stampAfter(code), 0xFF);
            ASSERT_EQ(message.bytes()[12], 1);
            ASSERT_TRUE(writer->append(message.bytes()));
            ASSERT_TRUE(writer->close());
            const ReadOut out = readAnyForm(Data::copyOf(_medium.content));
            EXPECT_THAT(out.losses, IsEmpty()) << payload << ", " << code;
            ASSERT_EQ(out.messages.size(), 1U) << payload << ", " << code;
            EXPECT_TRUE(out.messages[0].ends_with(": " + hexText(message.bytes()))) << out.messages[0];
        }
}

TEST_F(DLFWriterTest, payloadsThatSupportEachOtherAsRecordsAreReadAgain) {
    // With the last byte of the time stamp, 01, before it each of these payloads is a record of 256 bytes
    // whose time is in the year 2111, and the one ends where the other begins.
    const char* const payload = "00010000 0000000000000303";
    const auto writer = make();
    std::string between;
    for (int i = 0; i < 256 + 1 - 24 - 12; ++i)
        between += "00";
    const std::vector<std::pair<std::uint16_t, std::string>> records{
        {4, payload}, {2, between}, {5, payload}};
    for (const auto& [code, bytes] : records)
        ASSERT_TRUE(writer->append(stampedRecord(code, bytes, stampAfter(0), 0xFF).bytes()));
    ASSERT_TRUE(writer->close());
    const ReadOut out = readAnyForm(Data::copyOf(_medium.content));
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.messages.size(), 3U);
}

TEST_F(DLFWriterTest, repeatsAFailure) {
    _medium.room = 170;
    const auto writer = make();
    EXPECT_TRUE(writer->append(record(0x512C, "05000100").bytes()));
    const auto closed = writer->close();
    ASSERT_FALSE(closed);
    EXPECT_EQ(closed.reason(), "cannot write drive.dlf: No space left on device");
    EXPECT_TRUE(writer->hasFailed());
    EXPECT_EQ(writer->close().reason(), "cannot write drive.dlf: No space left on device");

    _medium.room = 100;
    _medium.content.clear();
    const auto none = DLFWriter::start(std::make_unique<FakeRecordingFile>(_medium), "drive.dlf", _clock);
    ASSERT_FALSE(none);
    EXPECT_EQ(none.reason(), "cannot write drive.dlf: No space left on device");
}

TEST_F(DLFWriterTest, acceptsNoMessageAfterAFailure) {
    _medium.room = 161;
    const auto writer = make();
    // What is gathered goes out from 64 KiB on: two records of 40012 bytes.
    const Data half = record(0x512C, std::string(80'000, '0'));
    const std::string full = "cannot write drive.dlf: No space left on device";
    EXPECT_TRUE(writer->append(half.bytes()));
    EXPECT_EQ(writer->append(half.bytes()).reason(), full);
    _medium.room = SIZE_MAX;
    EXPECT_EQ(writer->append(half.bytes()).reason(), full);
    EXPECT_EQ(writer->messages(), 2u);
    EXPECT_EQ(writer->refused(), 0u);
    EXPECT_EQ(_medium.content.size(), 161u);
}

TEST_F(DLFWriterTest, reportsAFailedFinalSync) {
    struct Case {
        const char* name;
        bool isRegular;
        int syncError;
        int closeError;
        const char* reason; ///< empty where all is well
    };
    const Case cases[] = {
        {"lost by the medium", true, EIO, 0, "cannot write drive.dlf: Input/output error"},
        {"lost while closing", true, 0, EDQUOT, "cannot close drive.dlf: Disk quota exceeded"},
        {"lost twice", true, ENOSPC, EIO, "cannot write drive.dlf: No space left on device"},
        {"no medium behind it", true, EINVAL, 0, ""},
        {"a pipe", false, EIO, 0, ""},
        {"a pipe that is not closed", false, EIO, EIO, "cannot close drive.dlf: Input/output error"},
    };
    for (const Case& each : cases) {
        _medium = FakeOutputFile();
        _medium.isRegular = each.isRegular;
        _medium.syncError = each.syncError;
        _medium.closeError = each.closeError;
        const auto writer = make();
        const auto closed = writer->close();
        EXPECT_EQ(closed ? "" : closed.reason(), each.reason) << each.name;
        EXPECT_EQ(_medium.syncsWaitedFor, each.isRegular ? 1u : 0u) << each.name;
        EXPECT_TRUE(_medium.closed) << each.name;
    }
}

TEST_F(DLFWriterTest, makesFiles) {
    const TemporaryDirectory directory;
    const std::string path = directory / "drive.dlf";
    std::ofstream(path) << std::string(1000, 'x');
    auto writer = DLFWriter::create(path, _clock);
    ASSERT_TRUE(writer) << writer.reason();
    EXPECT_TRUE((*writer)->append(record(0x512C, "05000100").bytes()));
    EXPECT_TRUE((*writer)->close());
    EXPECT_TRUE((*writer)->close());
    EXPECT_EQ(std::filesystem::file_size(path), 161u + 16u);

    const auto none = DLFWriter::create(directory / "none" / "drive.dlf", _clock);
    ASSERT_FALSE(none);
    EXPECT_EQ(none.reason(),
              "cannot create " + (directory / "none" / "drive.dlf").string() + ": No such file or directory");
}

} // namespace
} // namespace velmora
