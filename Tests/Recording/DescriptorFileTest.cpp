// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/DescriptorFile.h"

#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <chrono>
#include <csignal>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iterator>
#include <string>
#include <thread>

#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/resource.h>
#include <unistd.h>

namespace velmora {
namespace {

class DescriptorFileTest : public testing::Test {
protected:
    [[nodiscard]] int open(int flags) const { return ::open(_path.c_str(), flags | O_CLOEXEC, 0600); }
    [[nodiscard]] std::string content() const {
        std::ifstream file(_path, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }
    void put(const std::string& text) const { std::ofstream(_path) << text; }

    TemporaryDirectory _directory;
    std::string _path = _directory / "file";
    const Data _three = hex("61 62 63"); // "abc"
};

TEST_F(DescriptorFileTest, NewFileIsWrittenAndCut) {
    DescriptorFile file(open(O_WRONLY | O_CREAT), true);
    EXPECT_TRUE(file.isRegular());
    EXPECT_EQ(file.write(_three.bytes()).bytes, 3U);
    EXPECT_EQ(file.truncateTo(1), 0);
    EXPECT_EQ(file.write(_three.bytes()).bytes, 3U);
    EXPECT_EQ(content(), "aabc");
    EXPECT_EQ(file.close(), 0);
    EXPECT_EQ(file.close(), 0) << "the second does nothing";
}

TEST_F(DescriptorFileTest, WhatStoodThereBeforeIsNeverCut) {
    put("before");
    DescriptorFile file(open(O_WRONLY | O_APPEND), true);
    EXPECT_TRUE(file.isRegular());
    EXPECT_EQ(file.write(_three.bytes()).bytes, 3U);
    EXPECT_EQ(file.truncateTo(2), 0);
    EXPECT_EQ(content(), "beforeab");
    EXPECT_EQ(file.truncateTo(0), 0);
    EXPECT_EQ(content(), "before");
}

TEST_F(DescriptorFileTest, MiddleOfAFileCannotBeCut) {
    put("before");
    DescriptorFile file(open(O_WRONLY), true);
    EXPECT_FALSE(file.isRegular());
}

TEST_F(DescriptorFileTest, PipeCannotBeCut) {
    int ends[2];
    ASSERT_EQ(::pipe2(ends, O_CLOEXEC), 0);
    DescriptorFile file(ends[1], true);
    EXPECT_FALSE(file.isRegular());
    EXPECT_EQ(file.write(_three.bytes()).bytes, 3U);
    ::close(ends[0]);
}

TEST_F(DescriptorFileTest, ForeignDescriptorStaysOpen) {
    const int descriptor = open(O_WRONLY | O_CREAT);
    EXPECT_EQ(DescriptorFile(descriptor, false).close(), 0);
    EXPECT_EQ(::close(descriptor), 0);
}

TEST_F(DescriptorFileTest, SizeLimitIsAnError) {
    auto* const earlierHandler = std::signal(SIGXFSZ, SIG_IGN);
    rlimit earlier = {};
    ASSERT_EQ(::getrlimit(RLIMIT_FSIZE, &earlier), 0);
    rlimit limit = earlier;
    limit.rlim_cur = 4;
    DescriptorFile file(open(O_WRONLY | O_CREAT), true);
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    EXPECT_EQ(file.write(_three.bytes()).bytes, 3U);
    const auto rest = file.write(_three.bytes());
    const auto refused = file.write(_three.bytes());
    EXPECT_EQ(::setrlimit(RLIMIT_FSIZE, &earlier), 0);
    std::signal(SIGXFSZ, earlierHandler);
    EXPECT_EQ(rest.bytes, 1U);
    EXPECT_EQ(rest.error, 0);
    EXPECT_EQ(refused.bytes, 0U);
    EXPECT_EQ(refused.error, EFBIG);
    EXPECT_EQ(content(), "abca");
}

TEST_F(DescriptorFileTest, SyncIsWaitedForElsewhere) {
    DescriptorFile file(open(O_WRONLY | O_CREAT), true);
    EXPECT_FALSE(file.takeSyncResult()) << "none was started";
    EXPECT_EQ(file.write(_three.bytes()).bytes, 3U);
    file.startSync();
    file.startSync();
    std::optional<int> outcome;
    while (!(outcome = file.takeSyncResult()))
        std::this_thread::yield();
    EXPECT_EQ(outcome, 0);
    EXPECT_FALSE(file.takeSyncResult()) << "it is taken once";
    EXPECT_EQ(file.sync(), 0);
    file.startSync();
    EXPECT_EQ(file.close(), 0) << "closing waits for it";
}

using Kind = OutputFile::Change::Kind;

TEST_F(DescriptorFileTest, ChangesByOthersAreNoticed) {
    struct Case {
        const char* name;
        std::function<void(const std::string& path)> change;
        Kind kind;
        std::uint64_t intact;
    };
    namespace fs = std::filesystem;
    const Case cases[] = {
        {"nothing", [](const std::string&) {}, Kind::None, 0},
        {"removed", [](const std::string& path) { fs::remove(path); }, Kind::Removed, 0},
        {"moved", [](const std::string& path) { fs::rename(path, path + ".old"); }, Kind::Moved, 6},
        {"replaced",
         [](const std::string& path) {
             std::ofstream(path + ".new") << "abcabc";
             fs::rename(path + ".new", path);
         },
         Kind::Replaced, 0},
        {"moved and replaced",
         [](const std::string& path) {
             fs::rename(path, path + ".old");
             std::ofstream(path) << "abcabc";
         },
         Kind::Replaced, 6},
        {"truncated", [](const std::string& path) { fs::resize_file(path, 2); }, Kind::Truncated, 2},
        {"emptied", [](const std::string& path) { std::ofstream(path).close(); }, Kind::Truncated, 0},
        {"written to", [](const std::string& path) { std::ofstream(path, std::ios::app) << "x"; },
         Kind::Altered, 0},
    };
    for (const Case& each : cases) {
        fs::remove(_path);
        DescriptorFile file(open(O_WRONLY | O_CREAT), true);
        file.watchForChanges(_path);
        ASSERT_EQ(file.write(_three.bytes()).bytes, 3U);
        ASSERT_EQ(file.write(_three.bytes()).bytes, 3U);
        ASSERT_EQ(file.change().kind, Kind::None) << each.name;
        each.change(_path);
        EXPECT_EQ(file.change().kind, each.kind) << each.name;
        EXPECT_EQ(file.change().intact, each.intact) << each.name;
    }
}

TEST_F(DescriptorFileTest, TruncationBeforeAWriteIsNoticedWhateverTheLengthIsAfterwards) {
    DescriptorFile file(open(O_WRONLY | O_CREAT), true);
    file.watchForChanges(_path);
    ASSERT_EQ(file.write(_three.bytes()).bytes, 3U);
    std::filesystem::resize_file(_path, 1);
    ASSERT_EQ(file.write(_three.bytes()).bytes, 3U);
    EXPECT_EQ(content(), "aabc") << "no hole";
    std::filesystem::resize_file(_path, 6); // as long as it should be
    EXPECT_EQ(file.change().kind, Kind::Truncated);
    EXPECT_EQ(file.change().intact, 1U);
}

TEST_F(DescriptorFileTest, OwnTruncationIsNoChange) {
    DescriptorFile file(open(O_WRONLY | O_CREAT), true);
    file.watchForChanges(_path);
    ASSERT_EQ(file.write(_three.bytes()).bytes, 3U);
    ASSERT_EQ(file.truncateTo(1), 0);
    EXPECT_EQ(file.change().kind, Kind::None);
    ASSERT_EQ(file.write(_three.bytes()).bytes, 3U);
    EXPECT_EQ(file.change().kind, Kind::None);
    EXPECT_EQ(content(), "aabc");
}

TEST_F(DescriptorFileTest, FileThatIsNotWatchedHasNoChanges) {
    DescriptorFile file(open(O_WRONLY | O_CREAT), true);
    std::filesystem::remove(_path);
    EXPECT_EQ(file.change().kind, Kind::None);
}

TEST_F(DescriptorFileTest, SyncOfAPipeIsAnError) {
    int ends[2];
    ASSERT_EQ(::pipe2(ends, O_CLOEXEC), 0);
    DescriptorFile file(ends[1], true);
    EXPECT_EQ(file.sync(), EINVAL);
    ::close(ends[0]);
}

} // namespace
} // namespace velmora
