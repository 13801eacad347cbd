// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Record/RecordFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <string>

#include <unistd.h>

// What others do to the file of a recorder, and what the recorder makes of it.

namespace velmora {
namespace {

using testing::ElementsAre;
namespace fs = std::filesystem;

class RecordFileChangeTest : public RecordTest {
protected:
    /// A recorder with one message in its file.
    void startRecorder() {
        startService();
        _process.emplace(tool({"record", _file}));
        ASSERT_TRUE(isStreaming());
        _service->send(rrState(1));
        ASSERT_TRUE(fileHolds(1));
    }
    /// Whether the recorder reports within a second that it has left the file.
    [[nodiscard]] bool isNoticed(const std::string& what) {
        const auto start = std::chrono::steady_clock::now();
        const bool isReported = _process->waitForError("velmora-log: " + _file + " " + what +
                                                       "; recording goes on into " + _second + "\n");
        EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(1));
        return isReported;
    }
    /// Ends the recorder after another message, which goes into that file; returns the words that it ends
    /// with.
    std::string end(const std::string& file = "drive-2.pcapng") {
        _service->send(rrState(3));
        bool isThere = false;
        LoopTimer look([&] {
            const std::vector<Data> messages = messagesOf(file, "Ostrel_GSM");
            isThere = !messages.empty() && messages.back() == rrState(3);
        });
        look.startRepeating(std::chrono::milliseconds(20));
        EXPECT_TRUE(eventually([&] { return isThere; }));
        _process->signal(SIGTERM);
        EXPECT_EQ(_process->exitStatus(), 1);
        const std::string words = ownMessages(_process->errors());
        const std::size_t last = words.rfind("velmora-log: ");
        return words.substr(last, words.size() - last - 1);
    }
    [[nodiscard]] std::string ending(int messages, int since) const {
        return "velmora-log: recorded " + std::to_string(messages) + " messages of Ostrel_GSM, " +
               std::to_string(17 * messages) + " bytes, the last " + std::to_string(since) + " of them in " +
               _second;
    }

    const std::string _file = path("drive.pcapng");
    const std::string _second = path("drive-2.pcapng");
    std::optional<ToolProcess> _process;
};

TEST_F(RecordFileChangeTest, RemovedFileIsFollowedByAnother) {
    startRecorder();
    fs::remove(_file);
    _service->send(rrState(2));
    ASSERT_TRUE(isNoticed("was removed"));
    EXPECT_TRUE(_process->waitForError("<3>" + _file + " was removed")) << "in the log as well";
    EXPECT_EQ(fs::status(_second).permissions(), fs::perms(0600));
    EXPECT_EQ(end(), ending(3, 2));
    EXPECT_THAT(messagesOf("drive-2.pcapng", "Ostrel_GSM"), ElementsAre(rrState(2), rrState(3)));
    EXPECT_FALSE(exists("drive.pcapng"));
}

TEST_F(RecordFileChangeTest, TruncatedFileIsFollowedByAnother) {
    startRecorder();
    fs::resize_file(_file, 0);
    _service->send(rrState(2));
    ASSERT_TRUE(isNoticed("was truncated"));
    EXPECT_EQ(end(), ending(3, 2));
    EXPECT_THAT(messagesOf("drive-2.pcapng", "Ostrel_GSM"), ElementsAre(rrState(2), rrState(3)));
}

TEST_F(RecordFileChangeTest, FileMovedAwayIsComplete) {
    startRecorder();
    fs::rename(_file, path("kept.pcapng"));
    _service->send(rrState(2));
    ASSERT_TRUE(isNoticed("was moved away"));
    EXPECT_EQ(end(), ending(3, 2));
    EXPECT_THAT(messagesOf("kept.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1)));
    EXPECT_THAT(messagesOf("drive-2.pcapng", "Ostrel_GSM"), ElementsAre(rrState(2), rrState(3)));
}

TEST_F(RecordFileChangeTest, FileThatTakesItsPlaceIsLeftAlone) {
    startRecorder();
    std::ofstream(path("other")) << "another";
    fs::rename(path("other"), _file);
    _service->send(rrState(2));
    ASSERT_TRUE(isNoticed("was replaced by another file"));
    EXPECT_EQ(end(), ending(3, 2));
    EXPECT_EQ(contentOf("drive.pcapng"), "another");
    EXPECT_THAT(messagesOf("drive-2.pcapng", "Ostrel_GSM"), ElementsAre(rrState(2), rrState(3)));
}

TEST_F(RecordFileChangeTest, FileThatAnotherProgramWritesToIsLeftAlone) {
    startRecorder();
    const std::string before = contentOf("drive.pcapng");
    std::ofstream(_file, std::ios::app) << "another";
    _service->send(rrState(2));
    ASSERT_TRUE(isNoticed("was written to by another program"));
    EXPECT_EQ(end().substr(0, 38), ending(3, 2).substr(0, 38));
    EXPECT_EQ(contentOf("drive.pcapng"), before + "another");
    EXPECT_THAT(messagesOf("drive-2.pcapng", "Ostrel_GSM"), testing::IsSupersetOf({rrState(2), rrState(3)}));
}

TEST_F(RecordFileChangeTest, NamesThatAreTakenAreLeftAlone) {
    std::ofstream(_second) << "there before";
    startRecorder();
    fs::remove(_file);
    ASSERT_TRUE(_process->waitForError("goes on into " + path("drive-3.pcapng") + "\n"));
    fs::remove(path("drive-3.pcapng"));
    ASSERT_TRUE(_process->waitForError(path("drive-3.pcapng") + " was removed"));
    EXPECT_THAT(end("drive-3.pcapng"),
                testing::EndsWith(" in " + path("drive-3.pcapng") + " and " + path("drive-3.pcapng")));
    EXPECT_EQ(contentOf("drive-2.pcapng"), "there before");
    EXPECT_THAT(messagesOf("drive-3.pcapng", "Ostrel_GSM"), ElementsAre(rrState(3)));
}

TEST_F(RecordFileChangeTest, MessagesWaitWhileThereIsNoPlaceBesideIt) {
    fs::create_directory(path("drives"));
    startService();
    const std::string file = path("drives/drive.pcapng");
    _process.emplace(tool({"record", file}));
    ASSERT_TRUE(isStreaming());
    fs::rename(path("drives"), path("gone"));
    _service->send(rrState(2));
    ASSERT_TRUE(_process->waitForError("velmora-log: " + file + " was moved away, and cannot create " +
                                       path("drives/drive-2.pcapng") + ": No such file or directory; "));
    fs::create_directory(path("drives"));
    ASSERT_TRUE(_process->waitForError("goes on into " + path("drives/drive-2.pcapng") + "\n"));
    static_cast<void>(end("drives/drive-2.pcapng"));
    EXPECT_THAT(messagesOf("drives/drive-2.pcapng", "Ostrel_GSM"), ElementsAre(rrState(2), rrState(3)));
}

TEST_F(RecordFileChangeTest, FileRemovedBeforeThereIsAServiceIsReported) {
    _process.emplace(tool({"record", _file}));
    ASSERT_TRUE(eventually([this] { return exists("drive.pcapng"); }));
    fs::remove(_file);
    ASSERT_TRUE(isNoticed("was removed"));
    _process->signal(SIGHUP);
    EXPECT_EQ(_process->exitStatus(), 1);
    EXPECT_FALSE(exists("drive-2.pcapng")) << "nothing was recorded";
}

TEST_F(RecordFileChangeTest, SecondRecorderIsRefused) {
    startRecorder();
    for (const bool force : {false, true}) {
        std::vector<std::string> arguments = {"record", _file};
        if (force)
            arguments.emplace_back("--force");
        ToolProcess second(tool(arguments));
        EXPECT_EQ(second.exitStatus(), 1);
        EXPECT_EQ(ownMessages(second.errors()),
                  "velmora-log: " + _file + " is being recorded to by another program\n");
    }
    _process->signal(SIGHUP);
    EXPECT_EQ(_process->exitStatus(), 0) << "as on SIGTERM";
    EXPECT_THAT(messagesOf("drive.pcapng", "Ostrel_GSM"), ElementsAre(rrState(1)));
}

TEST_F(RecordFileChangeTest, OverwrittenFileIsLockedAndWatchedAsWell) {
    std::ofstream(_file) << "an earlier recording";
    startService();
    _process.emplace(tool({"record", "--force", _file}));
    ToolProcess early(tool({"record", "--force", "--timeout", "5", path("other.pcapng")}));
    ASSERT_TRUE(isStreaming(2));
    ASSERT_TRUE(eventually([this] { return contentOf("drive.pcapng") != "an earlier recording"; }));
    ToolProcess second(tool({"record", "--force", _file}));
    EXPECT_EQ(second.exitStatus(), 1);
    EXPECT_EQ(ownMessages(second.errors()),
              "velmora-log: " + _file + " is being recorded to by another program\n");
    fs::remove(_file);
    ASSERT_TRUE(isNoticed("was removed"));
    early.signal(SIGTERM);
    EXPECT_EQ(early.exitStatus(), 0);
    EXPECT_EQ(end(), ending(1, 1));
}

TEST_F(RecordFileChangeTest, SymbolicLinkToAnotherUsersFileIsRefused) {
    std::ofstream(path("theirs")) << "theirs";
    fs::create_symlink(path("theirs"), _file);
    if (::chown(path("theirs").c_str(), 1, 1) != 0)
        GTEST_SKIP() << "only root can give files away";
    ToolProcess process(tool({"record", "--force", _file}));
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(ownMessages(process.errors()), "velmora-log: " + _file + " is a symbolic link to " +
                                                 path("theirs") + ", wanted a regular file of this user\n");
    EXPECT_EQ(contentOf("theirs"), "theirs");
}

} // namespace
} // namespace velmora
