// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/Spool.h"

#include "Tests/Support/TemporaryDirectory.h"
#include "Tools/Decode/Jobs/SpoolBudget.h"
#include "Tools/Output.h"

#include <gtest/gtest.h>

#include <csignal>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <optional>
#include <string>
#include <string_view>

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

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

    /// What the spool's text is in a file that is opened with those flags.
    [[nodiscard]] std::string moved(Spool& spool, int flags = O_TRUNC) const {
        const std::string path = _directory / "output";
        {
            const FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC | flags, 0600));
            Output output(file.get());
            EXPECT_TRUE(spool.moveTo(output));
        }
        std::ifstream file(path, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }

    SpoolBudget _budget{std::uint64_t{1} << 20};
    TemporaryDirectory _directory;

private:
    std::optional<std::string> _earlier;
};

TEST_F(SpoolTest, GivesBackWhatItKeptInItsOrder) {
    Spool spool(_budget);
    std::string all;
    for (int i = 0; i < 1000; ++i) {
        const std::string text = "line " + std::to_string(i) + "\n";
        ASSERT_EQ(spool.append(text), "");
        all += text;
    }
    EXPECT_EQ(moved(spool), all);
}

TEST_F(SpoolTest, MovesOnlyWhatIsNew) {
    Spool spool(_budget);
    ASSERT_EQ(spool.append("first"), "");
    EXPECT_EQ(moved(spool), "first");
    ASSERT_EQ(spool.append(" second"), "");
    EXPECT_EQ(moved(spool), " second");
    EXPECT_EQ(moved(spool), "");
}

TEST_F(SpoolTest, MovesToTheEndOfAFileThatIsAppendedTo) {
    std::ofstream(_directory / "output") << "earlier ";
    Spool spool(_budget);
    const std::string text(200'000, 'x');
    ASSERT_EQ(spool.append(text), "");
    EXPECT_EQ(moved(spool, O_APPEND), "earlier " + text);
}

TEST_F(SpoolTest, LeavesNoNameInTheDirectory) {
    Spool spool(_budget);
    ASSERT_EQ(spool.append("text"), "");
    EXPECT_TRUE(std::filesystem::is_empty(_directory.path()));
}

TEST_F(SpoolTest, EmptyOneGivesNothing) {
    Spool spool(_budget);
    EXPECT_EQ(moved(spool), "");
}

TEST_F(SpoolTest, KeepsNothingOnceItIsClosed) {
    Spool spool(_budget);
    ASSERT_EQ(spool.append("text"), "");
    spool.discard();
    EXPECT_EQ(spool.append("more"), "more");
    EXPECT_EQ(moved(spool), "");
}

TEST_F(SpoolTest, KeepsNothingWithoutADirectory) {
    setDirectory(_directory / "no such directory");
    Spool spool(_budget);
    EXPECT_EQ(spool.append("text"), "text");
    EXPECT_EQ(moved(spool), "");
}

TEST_F(SpoolTest, SpoolsShareTheirBudget) {
    SpoolBudget budget(10);
    Spool first(budget);
    Spool second(budget);
    EXPECT_EQ(first.append("1234567"), "");
    EXPECT_EQ(second.append("abcde"), "de");
    EXPECT_EQ(first.append("8"), "8");
    first.discard();
    EXPECT_EQ(second.append("defghijkl"), "kl");
    EXPECT_EQ(moved(second), "abcdefghij");
}

TEST_F(SpoolTest, KeepsWhatAFullDiskTakes) {
    // The file's largest size stands for the disk's.
    rlimit earlier{};
    ASSERT_EQ(::getrlimit(RLIMIT_FSIZE, &earlier), 0);
    auto* const handler = std::signal(SIGXFSZ, SIG_IGN);
    const rlimit small{6, earlier.rlim_max};
    Spool spool(_budget);
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &small), 0);
    const std::string_view rest = spool.append("123456789");
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &earlier), 0);
    std::signal(SIGXFSZ, handler);
    EXPECT_EQ(rest, "789");
    EXPECT_EQ(moved(spool), "123456");
    // Only what it has counts.
    spool.discard();
    EXPECT_EQ(_budget.take(std::uint64_t{2} << 20), std::uint64_t{1} << 20);
}

TEST(SpoolBudgetTest, GivesNoMoreThanThereIs) {
    SpoolBudget budget(100);
    EXPECT_EQ(budget.take(60), 60U);
    EXPECT_EQ(budget.take(60), 40U);
    EXPECT_EQ(budget.take(1), 0U);
    budget.giveBack(30);
    EXPECT_EQ(budget.take(60), 30U);
}

TEST(SpoolBudgetTest, CountsWhatOtherProcessesTake) {
    SpoolBudget budget(100);
    const pid_t process = ::fork();
    if (process == 0)
        ::_exit(budget.take(70) == 70 ? 0 : 1);
    int status = -1;
    ASSERT_EQ(::waitpid(process, &status, 0), process);
    EXPECT_EQ(status, 0);
    EXPECT_EQ(budget.take(60), 30U);
}

TEST(SpoolBudgetTest, HasNothingForADirectoryThatIsNotThere) {
    EXPECT_EQ(SpoolBudget::limitIn("/no such directory"), 0U);
    EXPECT_GT(SpoolBudget::limitIn("/tmp"), 0U);
    EXPECT_LE(SpoolBudget::limitIn("/tmp"), std::uint64_t{4} << 30);
}

} // namespace
} // namespace velmora
