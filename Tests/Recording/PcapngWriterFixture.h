// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Pcapng/PcapngWriter.h"
#include "Tests/Recording/FakeRecordingFile.h"
#include "Tests/Recording/PcapngFile.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {

inline constexpr std::size_t headSize = 100; // of a technology's name of 9 to 12 bytes
inline constexpr std::size_t blockSize = 36; // of a message of 1 to 4 bytes
inline const std::string full = "cannot write the recording: No space left on device";
inline const std::string broken = "cannot write the recording: Input/output error";

/// A recording on a disk with errors. Each message is one byte, its number.
class PcapngWriterFixture : public testing::Test {
protected:
    void start() {
        auto started =
            PcapngWriter::start(std::make_unique<FakeRecordingFile>(medium), "the recording", "Ostrel_GSM");
        ASSERT_TRUE(started) << started.reason();
        writer = *std::move(started);
    }
    Result<Done> append(std::uint8_t number) {
        return writer->append(Time(std::chrono::nanoseconds(number)), Bytes(&number, 1));
    }
    /// The numbers of the messages on the disk, which must be complete.
    [[nodiscard]] std::vector<int> numbers() const {
        const auto reader =
            PcapngReader::open(ChunkedInput(std::make_unique<MemorySource>(Data::copyOf(medium.content))));
        if (!reader) {
            ADD_FAILURE() << reader.reason();
            return {};
        }
        std::vector<int> found;
        while (const auto message = (*reader)->next())
            found.push_back(message->message.bytes()[0]);
        EXPECT_EQ((*reader)->lossTotals().losses, 0U);
        return found;
    }
    static std::string reasonOf(const Result<Done>& result) { return result ? "success" : result.reason(); }

    FakeOutputFile medium;
    std::unique_ptr<PcapngWriter> writer;
};

} // namespace velmora
