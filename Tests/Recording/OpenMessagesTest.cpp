// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/OpenMessages.h"

#include "Recording/Files/FileSource.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Tests/Recording/LogFile.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <chrono>
#include <fstream>
#include <memory>
#include <string>
#include <thread>
#include <vector>

#include <fcntl.h>
#include <gtest/gtest.h>
#include <unistd.h>

namespace velmora {
namespace {

class OpenMessages : public testing::Test {
protected:
    [[nodiscard]] std::string fileOf(const Data& content, const char* name = "file") const {
        std::string path = _directory / name;
        std::ofstream(path, std::ios::binary)
            .write(reinterpret_cast<const char*>(content.bytes().data()),
                   static_cast<std::streamsize>(content.size()));
        return path;
    }
    [[nodiscard]] static std::string reasonFor(const std::string& path) {
        const auto reader = openMessages(path);
        return reader ? "opened" : reader.reason();
    }

    TemporaryDirectory _directory;
};

TEST_F(OpenMessages, opensARecordingOfAnyName) {
    const std::string path =
        fileOf(PcapngFile().head().message(7, hex("0102").bytes()).data(), "snapshot.velmora");
    auto reader = openMessages(path);
    ASSERT_TRUE(reader) << reader.reason();
    EXPECT_EQ((*reader)->technology(), "Ostrel_GSM");
    const auto message = (*reader)->next();
    ASSERT_TRUE(message);
    EXPECT_EQ(describe(*message), "1 at 76, 7 ns: 0102");
    EXPECT_FALSE((*reader)->next());
    EXPECT_FALSE((*reader)->next());
    EXPECT_FALSE((*reader)->failure());
}

TEST_F(OpenMessages, findsTheTechnologiesOfAllOfARecording) {
    PcapngFile file;
    file.head().message(7, hex("0102").bytes());
    // As recordings put one after another have them.
    file.section().messageInterface("Ostrel_LTE").message(8, hex("03").bytes());
    EXPECT_EQ(technologiesOf(fileOf(file.data())), (std::vector<std::string>{"Ostrel_GSM", "Ostrel_LTE"}));
    const std::vector<std::string> none;
    EXPECT_EQ(technologiesOf(fileOf(hex("00 01"), "noise")), none);
    EXPECT_EQ(technologiesOf("-"), none);
    EXPECT_EQ(technologiesOf("/dev/null"), none);
    EXPECT_EQ(technologiesOf(_directory / "gone"), none);
}

TEST_F(OpenMessages, readsStandardInputThroughAPipe) {
    int ends[2];
    ASSERT_EQ(::pipe(ends), 0);
    const Data file =
        PcapngFile().head().message(7, hex("0102").bytes()).message(8, hex("03").bytes()).data();
    ASSERT_EQ(::write(ends[1], file.bytes().data(), file.size()), static_cast<ssize_t>(file.size()));
    ::close(ends[1]);
    const int standardInput = ::dup(STDIN_FILENO);
    ::dup2(ends[0], STDIN_FILENO);
    ::close(ends[0]);
    {
        auto reader = openMessages("-");
        ASSERT_TRUE(reader) << reader.reason();
        auto message = (*reader)->next();
        ASSERT_TRUE(message);
        EXPECT_EQ(describe(*message), "1 at 76, 7 ns: 0102");
        message = (*reader)->next();
        ASSERT_TRUE(message);
        EXPECT_EQ(describe(*message), "2 at 112, 8 ns: 03");
        EXPECT_FALSE((*reader)->next());
    }
    ::dup2(standardInput, STDIN_FILENO);
    ::close(standardInput);
}

TEST_F(OpenMessages, returnsMessagesOfAPipeOnceComplete) {
    int ends[2];
    ASSERT_EQ(::pipe(ends), 0);
    auto writer = PcapngWriter::adopt(ends[1], "pipe", "Ostrel_LTE");
    ASSERT_TRUE(writer);
    auto reader = openMessages("/dev/fd/" + std::to_string(ends[0]));
    ASSERT_TRUE(reader) << reader.reason();
    for (int i = 1; i <= 3; ++i) {
        ASSERT_TRUE((*writer)->append(Time(std::chrono::nanoseconds(i)), hex("AA").bytes()));
        ASSERT_TRUE((*writer)->flush());
        // The writer is still open: a reader that wanted more than this message would wait here for ever.
        const auto message = (*reader)->next();
        ASSERT_TRUE(message);
        EXPECT_EQ(message->time.time_since_epoch().count(), i);
    }
    ASSERT_TRUE((*writer)->close());
    EXPECT_FALSE((*reader)->next());
    ::close(ends[0]);
}

TEST_F(OpenMessages, waitsWherePipesDoNotBlock) {
    int ends[2];
    ASSERT_EQ(::pipe2(ends, O_NONBLOCK), 0);
    constexpr int count = 2'000;
    const std::vector<std::uint8_t> message(1'000, 0x5A);
    // Far more than a pipe holds: each side finds it full or empty at times.
    std::thread other([&] {
        auto writer = PcapngWriter::adopt(ends[1], "pipe", "Ostrel_LTE");
        for (int i = 0; i < count; ++i)
            EXPECT_TRUE((*writer)->append(Time(std::chrono::nanoseconds(i)), message));
        EXPECT_TRUE((*writer)->close());
    });
    auto reader = PcapngReader::open(ChunkedInput(std::make_unique<FileSource>(ends[0], true)));
    EXPECT_TRUE(reader);
    int messages = 0;
    while (const auto next = (*reader)->next()) {
        EXPECT_EQ(next->time.time_since_epoch().count(), messages++);
        EXPECT_TRUE(next->message == Data::copyOf(message));
    }
    other.join();
    EXPECT_EQ(messages, count);
    EXPECT_EQ((*reader)->lossTotals().losses, 0U);
}

TEST_F(OpenMessages, recognisesTheFormByItsFirstBytes) {
    const Data list = snapshotFile({historyEntry(record(0x512C, "05000100"), "2026-11-16 05:00:02 +0000")});
    const Data document = hex("EFBBBF 0A20"); // a mark of UTF-8, and white space
    const auto formOf = [this](const Data& content) {
        const auto reader = openMessages(fileOf(content));
        return reader ? std::string((*reader)->form()) : reader.reason();
    };
    EXPECT_EQ(formOf(PcapngFile().head().data()), "recording");
    EXPECT_EQ(formOf(list), "snapshot");
    EXPECT_EQ(formOf(snapshotFile({}, true)), "snapshot");
    EXPECT_EQ(formOf(joined(document, list.from(39))), "snapshot"); // without its first line
    EXPECT_EQ(formOf(versionReport()), "DLF log");
    EXPECT_EQ(formOf(joined(bareRecord(0x512C, "05000100", stampAfter(0)),
                            bareRecord(0x512C, "04000100", stampAfter(1)))),
              "DLF log");
    // One record that is none of ours, without a time, is no more than a few bytes.
    EXPECT_EQ(
        formOf(bareRecord(0x1375, "05000100", stampAfter(0))),
        "begins 10 00 75 13 00 00 40 32 9B 74 13 01 (hex), wanted a recording, a snapshot or a DLF log");
}

TEST_F(OpenMessages, readsEveryFormThroughAPipe) {
    for (const Data& file :
         {snapshotFile({historyEntry(record(0x512C, "05000100"), "2026-11-16 05:00:02 +0000")}),
          joined(versionReport(), bareRecord(0x512C, "05000100"))}) {
        int ends[2];
        ASSERT_EQ(::pipe(ends), 0);
        ASSERT_EQ(::write(ends[1], file.bytes().data(), file.size()), static_cast<ssize_t>(file.size()));
        ::close(ends[1]);
        auto reader = openMessages("/dev/fd/" + std::to_string(ends[0]));
        ASSERT_TRUE(reader) << reader.reason();
        const auto message = (*reader)->next();
        ASSERT_TRUE(message);
        EXPECT_EQ(message->message, record(0x512C, "05000100"));
        EXPECT_FALSE((*reader)->next());
        ::close(ends[0]);
    }
}

TEST_F(OpenMessages, saysWhatIsWrongWithOtherFiles) {
    EXPECT_EQ(reasonFor(_directory / "none"), "cannot open: No such file or directory");
    EXPECT_EQ(reasonFor(_directory.path()), "cannot read: Is a directory at offset 0");
    EXPECT_EQ(reasonFor(fileOf(Data())), "empty, wanted a recording, a snapshot or a DLF log");
    EXPECT_EQ(reasonFor(fileOf(hex("0A0D0D0A 1C0000"))),
              "begins 0A 0D 0D 0A 1C 00 00 (hex), wanted a pcapng section header");
    for (const char* const magic : {"D4C3B2A1", "A1B2C3D4", "4D3CB2A1", "A1B23C4D"})
        EXPECT_EQ(reasonFor(fileOf(joined(hex(magic), hex("02000400 00000000 00000000")))),
                  "classic pcap file, wanted pcapng; this converts it: editcap -F pcapng IN.pcap OUT.pcapng");
    EXPECT_EQ(reasonFor(fileOf(hex("0A0D0D0A 1C000000 4D3C2B1B 01000000"))),
              "begins 0A 0D 0D 0A 1C 00 00 00 4D 3C 2B 1B (hex), wanted a pcapng section header");
}

} // namespace
} // namespace velmora
