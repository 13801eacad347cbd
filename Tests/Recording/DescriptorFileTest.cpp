// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/DescriptorFile.h"

#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <chrono>
#include <csignal>
#include <fstream>
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

TEST_F(DescriptorFileTest, SyncOfAPipeIsAnError) {
    int ends[2];
    ASSERT_EQ(::pipe2(ends, O_CLOEXEC), 0);
    DescriptorFile file(ends[1], true);
    EXPECT_EQ(file.sync(), EINVAL);
    ::close(ends[0]);
}

} // namespace
} // namespace velmora
