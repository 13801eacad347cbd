// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/Spool.h"

#include "Tests/Support/TemporaryDirectory.h"
#include "Tools/Output.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>
#include <string>

#include <fcntl.h>

namespace velmora {
namespace {

class SpoolTest : public testing::Test {
protected:
    SpoolTest() {
        if (const char* const earlier = std::getenv("TMPDIR"))
            _earlier = earlier;
        setDirectory(_directory.path());
    }
    ~SpoolTest() override {
        if (_earlier)
            ::setenv("TMPDIR", _earlier->c_str(), 1);
        else
            ::unsetenv("TMPDIR");
    }
    static void setDirectory(const std::string& path) { ::setenv("TMPDIR", path.c_str(), 1); }

    /// The spool's text, read back through a buffer of `pieceSize`.
    [[nodiscard]] std::string moved(Spool& spool, std::size_t pieceSize) const {
        const std::string path = _directory / "output";
        {
            const FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600));
            Output output(file.get());
            std::vector<char> buffer(pieceSize);
            EXPECT_TRUE(spool.moveTo(output, buffer));
        }
        std::ifstream file(path, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }

    TemporaryDirectory _directory;

private:
    std::optional<std::string> _earlier;
};

TEST_F(SpoolTest, GivesBackWhatItKeptInItsOrder) {
    Spool spool;
    std::string all;
    for (int i = 0; i < 1000; ++i) {
        const std::string text = "line " + std::to_string(i) + "\n";
        ASSERT_TRUE(spool.hasRoom());
        ASSERT_TRUE(spool.append(text));
        all += text;
    }
    EXPECT_EQ(moved(spool, 100), all);
}

TEST_F(SpoolTest, LeavesNoNameInTheDirectory) {
    Spool spool;
    ASSERT_TRUE(spool.append("text"));
    EXPECT_TRUE(std::filesystem::is_empty(_directory.path()));
}

TEST_F(SpoolTest, EmptyOneGivesNothing) {
    Spool spool;
    EXPECT_EQ(moved(spool, 100), "");
}

TEST_F(SpoolTest, KeepsNothingOnceItHasGivenItAll) {
    Spool spool;
    ASSERT_TRUE(spool.append("text"));
    EXPECT_EQ(moved(spool, 100), "text");
    EXPECT_FALSE(spool.hasRoom());
    EXPECT_FALSE(spool.append("more"));
    EXPECT_EQ(moved(spool, 100), "");
}

TEST_F(SpoolTest, KeepsNothingWithoutADirectory) {
    setDirectory(_directory / "no such directory");
    Spool spool;
    EXPECT_FALSE(spool.hasRoom());
    EXPECT_FALSE(spool.append("text"));
    EXPECT_EQ(moved(spool, 100), "");
}

} // namespace
} // namespace velmora
