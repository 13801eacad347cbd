// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/JobScheduler.h"

#include "Tests/Support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

#include <fcntl.h>
#include <unistd.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

class JobSchedulerTest : public testing::Test {
protected:
    /// Runs `count` jobs; returns whether all succeeded, and keeps their output.
    bool run(std::size_t count, std::size_t atATime, const Job& job) {
        const std::string path = _directory / "output";
        bool good = false;
        testing::internal::CaptureStderr();
        {
            const FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600));
            Output output(file.get());
            output.put("head\n");
            good = JobScheduler(count, atATime, job, output).run();
        }
        _errors = testing::internal::GetCapturedStderr();
        std::ifstream file(path, std::ios::binary);
        _output.assign(std::istreambuf_iterator<char>(file), {});
        return good;
    }

    static void say(const std::string& text) {
        EXPECT_EQ(::write(STDERR_FILENO, text.data(), text.size()), static_cast<ssize_t>(text.size()));
    }

    /// Runs `count` jobs side by side, whose output is a descriptor; returns whether all is written there.
    bool runInto(int descriptor, std::size_t count, const Job& job) {
        testing::internal::CaptureStderr();
        bool good = false;
        {
            Output output(descriptor);
            good = JobScheduler(count, count, job, output).run() && output.state() != Output::State::Failed;
        }
        _errors = testing::internal::GetCapturedStderr();
        return good;
    }

    [[nodiscard]] std::string mark() const { return _directory / "mark"; }
    void waitForMark() const {
        for (int i = 0; i < 3000 && !std::filesystem::exists(mark()); ++i)
            std::this_thread::sleep_for(10ms);
    }

    TemporaryDirectory _directory;
    std::string _output;
    std::string _errors;
};

TEST_F(JobSchedulerTest, OutputAndErrorsComeInTheOrderOfTheJobs) {
    const Job job = [](std::size_t index, Output& output) {
        // The first ends last.
        std::this_thread::sleep_for((4 - index) * 20ms);
        output.put("output " + std::to_string(index) + "\n");
        say("error " + std::to_string(index) + "\n");
        return true;
    };
    EXPECT_TRUE(run(4, 4, job));
    EXPECT_EQ(_output, "head\noutput 0\noutput 1\noutput 2\noutput 3\n");
    EXPECT_EQ(_errors, "error 0\nerror 1\nerror 2\nerror 3\n");
}

TEST_F(JobSchedulerTest, NoMoreRunThanAreWanted) {
    // Each job leaves its mark while it runs and counts the marks that it finds.
    const Job job = [this](std::size_t index, Output& output) {
        const std::filesystem::path mark = _directory / ("mark" + std::to_string(index));
        std::ofstream(mark).put('x');
        std::this_thread::sleep_for(10ms);
        int marks = 0;
        for (const auto& entry : std::filesystem::directory_iterator(_directory.path()))
            marks += entry.path().filename().string().starts_with("mark") ? 1 : 0;
        std::filesystem::remove(mark);
        output.put(marks <= 2 ? "." : "too many\n");
        return true;
    };
    EXPECT_TRUE(run(12, 2, job));
    EXPECT_EQ(_output, "head\n............");
}

TEST_F(JobSchedulerTest, BadInputDoesNotKeepTheNextJobFromBeingDone) {
    const Job job = [](std::size_t index, Output& output) {
        output.put(std::to_string(index) + "\n");
        return index != 1;
    };
    EXPECT_FALSE(run(3, 2, job));
    EXPECT_EQ(_output, "head\n0\n1\n2\n");
}

TEST_F(JobSchedulerTest, JobThatEndsItsProcessEndsThoseAfterIt) {
    for (const bool bySignal : {false, true}) {
        const Job job = [bySignal](std::size_t index, Output& output) {
            output.put(std::to_string(index) + "\n");
            output.flush();
            if (index == 1 && bySignal)
                ::raise(SIGKILL);
            if (index == 1)
                ::_exit(ExitStatus::BadInput);
            return true;
        };
        EXPECT_FALSE(run(4, 4, job));
        EXPECT_EQ(_output, "head\n0\n1\n");
    }
}

TEST_F(JobSchedulerTest, MoreThanPipesHoldIsKeptForLater) {
    constexpr std::size_t size = std::size_t{1} << 21;
    const Job job = [](std::size_t index, Output& output) {
        if (index == 0)
            std::this_thread::sleep_for(50ms);
        output.put(std::string(size, static_cast<char>('a' + index)));
        say(std::string(size, static_cast<char>('A' + index)));
        return true;
    };
    EXPECT_TRUE(run(3, 3, job));
    EXPECT_TRUE(_output ==
                "head\n" + std::string(size, 'a') + std::string(size, 'b') + std::string(size, 'c'));
    EXPECT_TRUE(_errors == std::string(size, 'A') + std::string(size, 'B') + std::string(size, 'C'));
}

TEST_F(JobSchedulerTest, FirstJobWritesToTheOutputItself) {
    const Job job = [this](std::size_t index, Output& output) {
        output.put("text");
        output.flush();
        // No other process has had to do anything for it.
        return index != 0 || std::filesystem::file_size(_directory / "output") == 9;
    };
    EXPECT_TRUE(run(2, 2, job));
    EXPECT_EQ(_output, "head\ntexttext");
}

TEST_F(JobSchedulerTest, JobWhoseTurnComesGoesOnByItself) {
    const Job job = [this](std::size_t index, Output& output) {
        if (index == 0) {
            waitForMark(); // the second has kept something by then
            output.put("first ");
            return true;
        }
        output.put("second ");
        output.flush();
        std::ofstream(mark()).put('x');
        for (int i = 0; i < 3000 && !output.isFirst(); ++i)
            std::this_thread::sleep_for(10ms);
        output.put("waits ");
        output.flush();
        output.put("and writes");
        output.flush();
        return std::filesystem::file_size(_directory / "output") == 34;
    };
    EXPECT_TRUE(run(2, 2, job));
    EXPECT_EQ(_output, "head\nfirst second waits and writes");
}

TEST_F(JobSchedulerTest, JobThatIsKilledAfterItsTurnHasComeLosesNothing) {
    const Job job = [](std::size_t index, Output& output) {
        if (index == 0)
            return true;
        output.put("kept ");
        output.flush();
        for (int i = 0; i < 3000 && !output.isFirst(); ++i)
            std::this_thread::sleep_for(1ms);
        output.put("written");
        output.flush();
        ::raise(SIGKILL);
        return true;
    };
    EXPECT_FALSE(run(2, 2, job));
    EXPECT_EQ(_output, "head\nkept written");
}

TEST_F(JobSchedulerTest, KeptOutputGoesThroughAPipe) {
    int ends[2];
    ASSERT_EQ(::pipe2(ends, O_CLOEXEC), 0);
    const FileDescriptor reading(ends[0]);
    FileDescriptor writing(ends[1]);
    std::string text;
    std::thread reader([&] {
        std::vector<char> buffer(1 << 16);
        while (const ssize_t count = ::read(reading.get(), buffer.data(), buffer.size()))
            text.append(buffer.data(), static_cast<std::size_t>(count));
    });
    constexpr std::size_t size = 300'001;
    const Job job = [](std::size_t index, Output& output) {
        output.put(std::string(size, static_cast<char>('a' + index)));
        return true;
    };
    EXPECT_TRUE(runInto(writing.get(), 3, job));
    writing.reset();
    reader.join();
    EXPECT_TRUE(text == std::string(size, 'a') + std::string(size, 'b') + std::string(size, 'c'));
}

TEST_F(JobSchedulerTest, ClosedReaderEndsAllJobsWithoutAnError) {
    for (const std::size_t writer : {0U, 1U}) {
        int ends[2];
        ASSERT_EQ(::pipe2(ends, O_CLOEXEC), 0);
        ::close(ends[0]);
        const FileDescriptor writing(ends[1]);
        const auto handler = std::signal(SIGPIPE, SIG_IGN);
        const Job job = [writer](std::size_t index, Output& output) {
            if (index == writer)
                output.put("text");
            if (index == 2)
                std::this_thread::sleep_for(60s);
            return true;
        };
        const auto started = std::chrono::steady_clock::now();
        EXPECT_TRUE(runInto(writing.get(), 3, job));
        std::signal(SIGPIPE, handler);
        EXPECT_LT(std::chrono::steady_clock::now() - started, 30s);
        EXPECT_EQ(_errors, "");
    }
}

TEST_F(JobSchedulerTest, FailedWriteIsReportedOnceAndEndsAllJobs) {
    for (const std::size_t writer : {0U, 1U}) {
        const FileDescriptor full(::open("/dev/full", O_WRONLY | O_CLOEXEC));
        const Job job = [writer](std::size_t index, Output& output) {
            if (index >= writer)
                output.put("text");
            return true;
        };
        EXPECT_FALSE(runInto(full.get(), 3, job));
        EXPECT_EQ(_errors, "velmora-log: cannot write standard output: No space left on device\n");
    }
}

} // namespace
} // namespace velmora
