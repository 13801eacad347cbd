// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Playback/PlaybackFixture.h"

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Recording/OpenMessages.h"
#include "Tests/Support/ShellCommand.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Report.h"

#include <stdexcept>

#include <fcntl.h>

namespace velmora {
namespace {

/// The forms that can only be read from the front.
class FileFormsTest : public PlaybackTest {
protected:
    void convert(const std::string& from, const std::string& to, FileForm form) const {
        const auto reader = openMessages(path(from));
        if (!reader)
            throw std::runtime_error(reader.reason());
        Conversion conversion;
        conversion.form = form;
        conversion.title = from;
        const FileDescriptor output(::open(path(to).c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
        WorkContext context(from);
        if (const Result<bool> done = convertMessages(**reader, conversion, output.get(), context); !done)
            throw std::runtime_error(done.reason());
    }
    /// Each moment that the times name.
    void expectSameAtEveryTime(const std::string& name) {
        OpenedRecording opened = openAll(name, {}, {std::size_t{8} << 20, 8});
        ASSERT_GT(opened.index->messages(), 20U);
        for (std::uint64_t moment = opened.index->messages() - 1; moment > 0; moment -= moment < 9 ? 1 : 9) {
            opened.player->seekToMessage(moment);
            const std::optional<Time> next = opened.player->next();
            opened.player->seekToTime(next.value());
            if (opened.player->position() == 0)
                continue;
            ASSERT_EQ(shown(opened), decoded(name, next)) << moment;
        }
    }
};

TEST_F(FileFormsTest, ASnapshotIsPlayed) {
    write("drive.pcapng", "lte", driveOf("lte", 200));
    convert("drive.pcapng", "drive.velmora", FileForm::Snapshot);
    expectSameAtEveryTime("drive.velmora");
    // Its refreshes are its own.
    OpenedRecording opened = openAll("drive.velmora");
    std::vector<std::uint64_t> positions;
    for (int i = 0; i < 5; ++i) {
        opened.player->stepToNextRefresh();
        positions.push_back(opened.player->position());
    }
    EXPECT_EQ(opened.index->refreshes(), 5U);
    EXPECT_EQ(positions.back(), opened.index->messages());
    for (std::size_t i = 4; i > 0; --i) {
        opened.player->stepToEarlierRefresh();
        EXPECT_EQ(opened.player->position(), positions[i - 1]);
    }
}

TEST_F(FileFormsTest, ADLFLogIsPlayed) {
    write("drive.pcapng", "gsm", driveOf("gsm", 300));
    convert("drive.pcapng", "drive.dlf", FileForm::DLFLog);
    expectSameAtEveryTime("drive.dlf");
}

TEST_F(FileFormsTest, ACompressedRecordingIsPlayed) {
    write("drive.pcapng", "c2k", driveOf("c2k", 300));
    ASSERT_EQ(std::system(("gzip " + path("drive.pcapng")).c_str()), 0);
    expectSameAtEveryTime("drive.pcapng.gz");
}

} // namespace
} // namespace velmora
