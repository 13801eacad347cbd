// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/DecodeLinesFixture.h"
#include "Tools/Decode/Jobs/UsableProcessors.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <chrono>
#include <cstddef>
#include <fstream>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

// `decode --jobs`: several files in parallel.

namespace velmora {
namespace {

using testing::StartsWith;

class DecodeJobsTest : public DecodeLinesTest {
protected:
    /// The same, file after file.
    static std::vector<std::string> one(std::vector<std::string> arguments) {
        arguments.insert(arguments.end(), {"--jobs", "1"});
        return arguments;
    }
};

TEST_F(DecodeJobsTest, ParallelJobsPrintWhatSequentialOnesPrint) {
    writeDrive("a.pcapng");
    writeRecording("empty.pcapng", "Ostrel_GSM", {});
    // More than a pipe holds, at both ends of the row.
    writeRecording("long.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(20'000, {at(0), rrState(5)}));
    const std::vector<std::string> files = {path("long.pcapng"),  path("a.pcapng"), path("gone.pcapng"),
                                            path("empty.pcapng"), path("a.pcapng"), path("long.pcapng")};
    for (const std::vector<std::string>& format :
         {std::vector<std::string>{"--format", "jsonl", "--every", "message"},
          {"--format", "json"},
          {"--format", "csv", "--every", "message", "--select", "/GSM RR Info/RR State"},
          {}}) {
        std::vector<std::string> arguments = {"decode", "--log-level", "0"};
        arguments.insert(arguments.end(), format.begin(), format.end());
        arguments.insert(arguments.end(), files.begin(), files.end());
        ToolProcess serial(tool(one(arguments)));
        EXPECT_EQ(serial.exitStatus(), 1);
        for (const char* jobs : {"2", "5", "100"}) {
            arguments.emplace_back("--jobs");
            arguments.emplace_back(jobs);
            ToolProcess side(tool(arguments));
            arguments.resize(arguments.size() - 2);
            EXPECT_EQ(side.exitStatus(), 1);
            EXPECT_TRUE(side.output() == serial.output()) << jobs << " jobs";
            EXPECT_EQ(ownMessages(side.errors()),
                      "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
        }
        EXPECT_EQ(ownMessages(serial.errors()),
                  "velmora-log: " + path("gone.pcapng") + ": cannot open: No such file or directory\n");
    }
}

TEST_F(DecodeJobsTest, JobsGoWithoutADirectoryForTemporaryFiles) {
    writeRecording("long.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(5'000, {at(0), rrState(5)}));
    ToolProcess::Setup setup = tool({"decode", "--format", "jsonl", "--every", "message", path("long.pcapng"),
                                     path("long.pcapng"), path("long.pcapng")});
    ToolProcess serial(tool(one(setup.arguments)));
    EXPECT_EQ(serial.exitStatus(), 0);
    setup.arguments.insert(setup.arguments.end(), {"--jobs", "3"});
    setup.environment["TMPDIR"] = path("no such directory");
    ToolProcess side(setup);
    EXPECT_EQ(side.exitStatus(), 0);
    EXPECT_TRUE(side.output() == serial.output());
}

TEST_F(DecodeJobsTest, JobsGoWithFewDescriptors) {
    writeRecording("long.pcapng", "Ostrel_GSM", std::vector<TimedMessage>(5'000, {at(0), rrState(5)}));
    std::vector<std::string> arguments = {"decode", "--format", "jsonl", "--every", "message"};
    for (int file = 0; file < 12; ++file)
        arguments.push_back(path("long.pcapng"));
    ToolProcess serial(tool(one(arguments)));
    EXPECT_EQ(serial.exitStatus(), 0);
    // With 8 there is room for a single job, with 6 for none: they are done without processes. What the
    // tests' own caller left open would not leave room for that.
    for (const char* descriptors : {"16", "8", "6"}) {
        std::vector<std::string> words = {"-c",
                                          std::string("exec 3>&- 4>&- 5>&- 6>&- 7>&- 8>&- 9>&-; ulimit -n ") +
                                              descriptors + "; exec \"$0\" \"$@\" --jobs 8",
                                          VELMORA_BUILD_DIR "/velmora-log"};
        words.insert(words.end(), arguments.begin(), arguments.end());
        ToolProcess side(tool(words), "/bin/sh");
        EXPECT_EQ(side.exitStatus(), 0) << descriptors << ": " << side.errors();
        EXPECT_TRUE(side.output() == serial.output()) << descriptors;
    }
}

TEST_F(DecodeJobsTest, StrictJobThatADecoderEndsEndsThoseAfterIt) {
    writeDrive("a.pcapng");
    const std::vector<std::uint64_t> offsets =
        writeRecording("sim.pcapng", "Ostrel_GSM", {{at(0), record(0x0000, "DE AD BE EF", 0xFF)}});
    ToolProcess process(tool({"decode", "--strict", "--jobs", "3", "--log-level", "0", "--format", "csv",
                              "--select", "/", path("a.pcapng"), path("sim.pcapng"), path("a.pcapng")}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_THAT(process.output(), StartsWith("time,file,/\r\n2026-11-16T05:00:02.000000000Z," +
                                             path("a.pcapng") + ",\"{\"\"GSM RR Info"));
    EXPECT_EQ(std::count(process.output().begin(), process.output().end(), '\r'), 3);
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("sim.pcapng") + ": record 1 at offset " +
                                                 std::to_string(offsets[0]) +
                                                 ": SIM File dictionary data could not be constructed\n");
}

TEST_F(DecodeJobsTest, JobWithAMessageThatIsNotDecodedLetsTheOthersBeDone) {
    writeDrive("a.pcapng");
    const std::vector<std::uint64_t> offsets = writeRecording(
        "sim.pcapng", "Ostrel_GSM", {{at(0), record(0x0000, "DE AD BE EF", 0xFF)}, {at(1), rrState(5)}});
    for (const char* jobs : {"1", "3"}) {
        ToolProcess process(
            tool({"decode", "--jobs", jobs, "--log-level", "0", "--format", "csv", "--select",
                  "/GSM RR Info/RR State", path("a.pcapng"), path("sim.pcapng"), path("a.pcapng")}));
        EXPECT_EQ(process.exitStatus(), 1);
        const auto row = [this](const char* time, const char* file, const char* state) {
            return std::string("2026-11-16T05:00:0") + time + ".000000000Z," + path(file) + "," + state +
                   "\r\n";
        };
        const std::string a =
            row("2", "a.pcapng", "RR_PLMN_LIST_CONSTRUCTION") + row("4", "a.pcapng", "RR_IDLE");
        EXPECT_EQ(process.output(),
                  "time,file,/GSM RR Info/RR State\r\n" + a + row("2", "sim.pcapng", "RR_IDLE") + a);
        EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + path("sim.pcapng") +
                                                     ": record 1 at offset " + std::to_string(offsets[0]) +
                                                     ": SIM File dictionary data could not be constructed\n"
                                                     "velmora-log: " +
                                                     path("sim.pcapng") +
                                                     ": 1 message could not be decoded\n");
    }
}

TEST_F(DecodeJobsTest, StandardInputTwiceIsReadInTurn) {
    writeDrive("a.pcapng");
    ToolProcess::Setup setup = tool({"decode", "--format", "jsonl", "--jobs", "2", "-", "-"});
    setup.input = contentOf("a.pcapng");
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.output(),
              std::string("{\"file\":\"-\",") + firstRefresh + "\n{\"file\":\"-\"," + secondRefresh + "\n");
    EXPECT_THAT(ownMessages(process.errors()), StartsWith("velmora-log: standard input: empty"));
}

TEST_F(DecodeJobsTest, ByDefaultEachUsableProcessorHasAFile) {
    writeDrive("a.pcapng");
    // A pipe that gets no message keeps its file from being decoded, and the program from ending.
    const std::string pipe = path("pipe");
    ASSERT_EQ(::mkfifo(pipe.c_str(), 0600), 0);
    const FileDescriptor end(::open(pipe.c_str(), O_RDWR | O_CLOEXEC));
    const std::vector<std::string> files = {pipe, path("a.pcapng")};
    const auto processesOf = [](const ToolProcess& process) {
        const std::string id = std::to_string(process.id());
        std::ifstream children("/proc/" + id + "/task/" + id + "/children");
        return std::distance(std::istream_iterator<int>(children), {});
    };
    const ToolProcess one(tool({"decode", "--jobs", "1", files[0], files[1]}));
    const ToolProcess byDefault(tool({"decode", files[0], files[1]}));
    const std::ptrdiff_t wanted = usableProcessors() > 1 ? 2 : 0;
    for (int i = 0; i < 2000 && processesOf(byDefault) != wanted; ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(5));
    EXPECT_EQ(processesOf(byDefault), wanted);
    EXPECT_EQ(processesOf(one), 0);
}

TEST_F(DecodeJobsTest, PipesAreReadInTurnByDefault) {
    writeDrive("a.pcapng");
    const std::string content = contentOf("a.pcapng");
    const std::string first = path("first");
    const std::string second = path("second");
    ASSERT_EQ(::mkfifo(first.c_str(), 0600), 0);
    ASSERT_EQ(::mkfifo(second.c_str(), 0600), 0);
    ToolProcess process(tool({"decode", "--format", "json", first, second}));
    // The writer has both open and writes the second after the first.
    FileDescriptor one(::open(first.c_str(), O_WRONLY | O_CLOEXEC));
    ASSERT_EQ(::write(one.get(), content.data(), content.size()), static_cast<ssize_t>(content.size()));
    const FileDescriptor tooEarly(::open(second.c_str(), O_WRONLY | O_NONBLOCK | O_CLOEXEC));
    EXPECT_EQ(tooEarly.get(), -1);
    one.reset();
    FileDescriptor two(::open(second.c_str(), O_WRONLY | O_CLOEXEC));
    ASSERT_EQ(::write(two.get(), content.data(), content.size()), static_cast<ssize_t>(content.size()));
    two.reset();
    EXPECT_EQ(process.exitStatus(), 0);
}

} // namespace
} // namespace velmora
