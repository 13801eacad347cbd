// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ReplayFormsFixture.h"

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/DLF/DLFReader.h"
#include "Recording/DLF/DLFWriter.h"
#include "Recording/Files/DataSource.h"
#include "Recording/OpenMessages.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/Hex.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <memory>
#include <optional>
#include <string>
#include <vector>

// Every technology's drive in each of the three forms, and the messages that replaying it sends.

namespace velmora {
namespace {

using namespace std::chrono_literals;

using ReplayFormsTest = ReplayFormsFixture;

TEST_P(ReplayFormsTest, recording) {
    const std::string path = (directory / "drive.pcapng").string();
    const auto writer = PcapngWriter::create(path, technology);
    ASSERT_TRUE(writer);
    std::vector<Data> messages;
    for (const ScenarioEvent& event : drive) {
        messages.push_back(event.message);
        ASSERT_TRUE((*writer)->append(FakeClock::defaultNow() + event.offset, event.message.bytes()));
    }
    ASSERT_TRUE((*writer)->close());
    const std::vector<Data> again = replayed(path);
    EXPECT_EQ(again, messages);
    EXPECT_EQ(displayOf(again), displayOf(messages));
}

TEST_P(ReplayFormsTest, dlfLog) {
    if (technology == "IFX")
        GTEST_SKIP() << "its messages are no records";
    const std::string path = (directory / "drive.dlf").string();
    const auto writer = DLFWriter::create(path, clock);
    ASSERT_TRUE(writer) << writer.reason();
    std::vector<Data> messages;
    for (const ScenarioEvent& event : drive) {
        // Only those that were cut short do not fit.
        EXPECT_EQ(static_cast<bool>((*writer)->append(event.message.bytes())), event.message.size() >= 13);
        if (event.message.size() >= 13)
            messages.push_back(event.message);
    }
    EXPECT_EQ((*writer)->refused(), drive.size() - messages.size());
    EXPECT_EQ((*writer)->messages(), messages.size());
    ASSERT_TRUE((*writer)->close());

    const std::vector<Data> again = replayed(path);
    EXPECT_EQ(again, messages);
    EXPECT_EQ(displayOf(again), displayOf(messages));
    EXPECT_THAT(log.textsAt(LogPriority::Warning), Not(testing::Contains(testing::HasSubstr("left out"))));

    auto reader = openMessages(path);
    ASSERT_TRUE(reader);
    EXPECT_EQ((*reader)->form(), "DLF log");
    for (const ScenarioEvent& event : drive) {
        if (event.message.size() < 13)
            continue;
        const auto message = (*reader)->next();
        ASSERT_TRUE(message);
        EXPECT_EQ(message->message, event.message);
    }
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ((*reader)->lossTotals().losses, 0u);
}

TEST_P(ReplayFormsTest, snapshot) {
    see();
    ASSERT_GT(refreshes.size(), 5u);
    const std::vector<Refresh> lastFive(refreshes.end() - 5, refreshes.end());
    auto reader = openMessages(snapshot());
    ASSERT_TRUE(reader) << reader.reason();
    EXPECT_EQ((*reader)->form(), "snapshot");
    EXPECT_EQ((*reader)->technology(), technology);

    // Refresh for refresh the messages that it had, and the date that it was given.
    std::vector<Data> all;
    for (const Refresh& refresh : lastFive) {
        std::vector<Data> wanted;
        for (const Data& message : refresh.messages)
            if (const auto rest = kept(message))
                wanted.push_back(*rest);
        std::vector<Data> got;
        std::optional<Time> date;
        while (!date) {
            const auto message = (*reader)->next();
            ASSERT_TRUE(message);
            EXPECT_GE(message->time, refresh.time - 2s);
            EXPECT_LT(message->time, refresh.time);
            got.push_back(message->message);
            date = message->refresh;
        }
        EXPECT_EQ(date, refresh.time);
        if (technology == "IFX") {
            // The object of the last message, serialized again.
            ASSERT_EQ(got.size(), 1u);
            EXPECT_EQ(*readPropertyList(got[0].bytes()), *readPropertyList(wanted.back().bytes()));
            EXPECT_EQ(displayOf(got), refresh.display);
        } else {
            EXPECT_EQ(got, wanted);
        }
        all.insert(all.end(), got.begin(), got.end());
    }
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ(replayed(snapshot()), all);
}

/// The application's own DLF log, whose buffers keep all type bytes but their first.
TEST_P(ReplayFormsTest, dlfLogOfASnapshot) {
    see();
    const Value& item = (*saveContents)[saveContents->size() - 1];
    const Data* const dlf = (*item.asDictionary())["DLF"].asData();
    if (technology == "IFX") {
        EXPECT_EQ(dlf, nullptr);
        return;
    }
    ASSERT_NE(dlf, nullptr);
    const std::string path = (directory / "drive.dlf").string();
    std::ofstream(path, std::ios::binary)
        .write(reinterpret_cast<const char*>(dlf->bytes().data()), static_cast<std::streamsize>(dlf->size()));
    std::vector<Data> wanted;
    for (auto refresh = refreshes.end() - 5; refresh != refreshes.end(); ++refresh)
        for (const Data& message : refresh->messages)
            if (const auto rest = kept(message))
                wanted.push_back(*rest);
    EXPECT_EQ(replayed(path), wanted);
}

/// Every buffer of a long drive as the application's log has it: less its first byte, with all that is
/// unusual about the drive's messages.
TEST_P(ReplayFormsTest, dlfLogOfManyBuffers) {
    if (technology == "IFX")
        GTEST_SKIP() << "its messages are no records";
    std::vector<std::uint8_t> dlf;
    std::vector<Data> wanted;
    std::uint64_t lost = 0;
    const auto scenario = scenarioKindNamed(GetParam())->make(2);
    std::int64_t buffer = -1;
    for (const ScenarioEvent& event : driveOf(*scenario, 20min)) {
        const bool isFirst = std::exchange(buffer, event.offset / 2s) != buffer;
        const Bytes bytes = event.message.bytes().subspan(isFirst ? 1 : 0);
        dlf.insert(dlf.end(), bytes.begin(), bytes.end());
        if (event.message.size() < LogMessage::headerLength) {
            lost += bytes.size();
            continue;
        }
        wanted.push_back(event.message);
        // A first message's wrong type byte is not stored; the code tells which one it has.
        if (isFirst && event.message.bytes()[0] == 2)
            wanted.back() = joined(hex(technology == "Modem" ? "FF" : "01"), event.message.from(1));
    }
    auto reader = DLFReader::open(ChunkedInput(std::make_unique<DataSource>(Data(std::move(dlf)))));
    ASSERT_TRUE(reader) << reader.reason();
    EXPECT_EQ((*reader)->technology(), technology);
    for (std::size_t i = 0; i < wanted.size(); ++i) {
        const auto message = (*reader)->next();
        ASSERT_TRUE(message);
        ASSERT_EQ(hexText(message->message.bytes()), hexText(wanted[i].bytes()))
            << i << " at " << message->offset;
    }
    EXPECT_FALSE((*reader)->next());
    EXPECT_EQ((*reader)->lossTotals().bytes, lost);
    EXPECT_GT(lost, 0u);
}

INSTANTIATE_TEST_SUITE_P(OfEachTechnology, ReplayFormsTest,
                         ::testing::Values("gsm", "lte", "utran", "c2k", "ifx", "modem"));

} // namespace
} // namespace velmora
