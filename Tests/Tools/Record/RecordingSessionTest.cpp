// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recorder/RecordingSession.h"

#include "Tests/Tools/Record/RecordFixture.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <csignal>
#include <filesystem>
#include <fstream>

#include <sys/resource.h>

namespace velmora {
namespace {

using testing::ElementsAre;

/// No file of this process may grow beyond so many bytes while it lives.
class FileSizeLimit {
public:
    explicit FileSizeLimit(rlim_t bytes) : _handler(std::signal(SIGXFSZ, SIG_IGN)) {
        ::getrlimit(RLIMIT_FSIZE, &_earlier);
        const rlimit limit = {bytes, _earlier.rlim_max};
        ::setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~FileSizeLimit() {
        ::setrlimit(RLIMIT_FSIZE, &_earlier);
        std::signal(SIGXFSZ, _handler);
    }
    FileSizeLimit(const FileSizeLimit&) = delete;
    FileSizeLimit& operator=(const FileSizeLimit&) = delete;

private:
    rlimit _earlier = {};
    void (*_handler)(int);
};

class RecordingSessionTest : public RecordTest {
protected:
    RecordingSessionTest() {
        std::filesystem::create_directory(_directory / "drives");
        _file = path("drives/drive.pcapng");
    }
    void putOld() const { std::ofstream(_file) << "old"; }
    [[nodiscard]] std::vector<std::string> files() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(_directory / "drives"))
            names.push_back(entry.path().filename().string());
        std::sort(names.begin(), names.end());
        return names;
    }

    std::string _file;
};

TEST_F(RecordingSessionTest, OverwrittenFileGivesWayInOneStep) {
    putOld();
    std::filesystem::permissions(_file, std::filesystem::perms(0640));
    std::ifstream old(_file); // an open descriptor keeps it
    const auto session = RecordingSession::open(_file, true);
    ASSERT_TRUE(session);
    EXPECT_EQ(contentOf("drives/drive.pcapng"), "old");
    ASSERT_TRUE((*session)->setTechnology("Ostrel_GSM"));
    EXPECT_THAT(messagesOf("drives/drive.pcapng", "Ostrel_GSM"), ElementsAre());
    EXPECT_THAT(files(), ElementsAre("drive.pcapng"));
    ASSERT_TRUE((*session)->append(Time(), rrState(5).bytes()));
    ASSERT_TRUE((*session)->close());
    EXPECT_THAT(messagesOf("drives/drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(5)));
    EXPECT_EQ(std::filesystem::status(_file).permissions(), std::filesystem::perms(0640));
    std::string kept;
    EXPECT_TRUE(std::getline(old, kept));
    EXPECT_EQ(kept, "old");
}

TEST_F(RecordingSessionTest, OverwrittenFileStaysWhereTheNewOneCannotBegin) {
    putOld();
    {
        const auto session = RecordingSession::open(_file, true);
        ASSERT_TRUE(session);
        Result<Done> begun = Done{};
        {
            const FileSizeLimit limit(0);
            begun = (*session)->setTechnology("Ostrel_GSM");
        }
        EXPECT_EQ(begun.reason(), "cannot write " + _file + ": File too large");
    }
    EXPECT_EQ(contentOf("drives/drive.pcapng"), "old");
    EXPECT_THAT(files(), ElementsAre("drive.pcapng"));
}

TEST_F(RecordingSessionTest, SymbolicLinkStaysOne) {
    putOld();
    std::filesystem::create_symlink(_file, _directory / "link.pcapng");
    const auto session = RecordingSession::open(path("link.pcapng"), true);
    ASSERT_TRUE(session);
    ASSERT_TRUE((*session)->setTechnology("Ostrel_GSM"));
    ASSERT_TRUE((*session)->close());
    EXPECT_TRUE(std::filesystem::is_symlink(_directory / "link.pcapng"));
    EXPECT_THAT(messagesOf("drives/drive.pcapng", "Ostrel_GSM"), ElementsAre());
}

TEST_F(RecordingSessionTest, FileThatNothingWasWrittenToIsRemoved) {
    {
        const auto session = RecordingSession::open(_file, false);
        ASSERT_TRUE(session);
        const FileSizeLimit limit(0);
        ASSERT_TRUE((*session)->setTechnology("Ostrel_GSM")); // the head waits
        EXPECT_FALSE((*session)->close());
        EXPECT_EQ((*session)->temporaryError(), "cannot write " + _file + ": File too large");
    }
    EXPECT_THAT(files(), ElementsAre());
}

TEST_F(RecordingSessionTest, ProgramThatEndsAbruptlyRemovesOnlyAnEmptyFile) {
    const auto session = RecordingSession::open(_file, false);
    ASSERT_TRUE(session);
    (*session)->removeIfEmpty();
    EXPECT_THAT(files(), ElementsAre());

    const auto another = RecordingSession::open(_file, false);
    ASSERT_TRUE(another);
    ASSERT_TRUE((*another)->setTechnology("Ostrel_GSM"));
    (*another)->removeIfEmpty();
    EXPECT_THAT(files(), ElementsAre("drive.pcapng"));
}

TEST_F(RecordingSessionTest, ForeignEmptyFileIsNotRemoved) {
    std::ofstream(_file).close();
    {
        const auto session = RecordingSession::open(_file, true);
        ASSERT_TRUE(session);
    }
    EXPECT_THAT(files(), ElementsAre("drive.pcapng"));
}

} // namespace
} // namespace velmora
