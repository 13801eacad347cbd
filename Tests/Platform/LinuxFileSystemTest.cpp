// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/LinuxFileSystem.h"
#include "Platform/Linux/Files/Files.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <optional>

#include <sys/stat.h>

namespace velmora {
namespace {

using testing::ElementsAre;

class LinuxFileSystemTest : public testing::Test {
protected:
    ~LinuxFileSystemTest() override {
        restore("XDG_STATE_HOME", _earlierState);
        restore("HOME", _earlierHome);
    }
    static std::optional<std::string> valueOf(const char* variable) {
        const char* value = std::getenv(variable);
        return value ? std::optional<std::string>(value) : std::nullopt;
    }
    static void restore(const char* variable, const std::optional<std::string>& value) {
        if (value)
            ::setenv(variable, value->c_str(), 1);
        else
            ::unsetenv(variable);
    }
    [[nodiscard]] std::string content(const std::string& name) const {
        std::ifstream file(directory / name);
        return {std::istreambuf_iterator<char>(file), {}};
    }
    [[nodiscard]] std::vector<std::string> names() const {
        std::vector<std::string> all;
        for (const auto& entry : std::filesystem::directory_iterator(directory.path()))
            all.push_back(entry.path().filename().string());
        return all;
    }
    static Bytes bytes(std::string_view text) {
        return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
    }

    TemporaryDirectory directory;

private:
    std::optional<std::string> _earlierState = valueOf("XDG_STATE_HOME");
    std::optional<std::string> _earlierHome = valueOf("HOME");
};

TEST_F(LinuxFileSystemTest, PathIsLookedForUnderTheSystemRoot) {
    std::filesystem::create_directories(directory / "Marks/A bundle");
    std::ofstream(directory / "Marks/file") << "x";
    const LinuxFileSystem rooted({directory.path(), {}});
    EXPECT_TRUE(rooted.exists("/Marks/A bundle"));
    EXPECT_TRUE(rooted.exists("/Marks/file"));
    EXPECT_FALSE(rooted.exists("/Marks/none"));
    EXPECT_FALSE(rooted.exists("/Marks/file/below a file"));
    const LinuxFileSystem plain({{}, {}});
    EXPECT_FALSE(plain.exists("/Marks/file"));
    EXPECT_TRUE(plain.exists((directory / "Marks/file").string()));
}

TEST_F(LinuxFileSystemTest, LogDirectoryIsTheNamedOneOrTheUsersStateUnderTheSystemRoot) {
    ::setenv("HOME", "/home/ada", 1);
    ::unsetenv("XDG_STATE_HOME");
    EXPECT_EQ(LinuxFileSystem({{}, {}}).diagnosticLogDirectory(), "/home/ada/.local/state/velmora");
    ::setenv("XDG_STATE_HOME", "relative", 1); // no absolute path, so it says nothing
    EXPECT_EQ(LinuxFileSystem({{}, {}}).diagnosticLogDirectory(), "/home/ada/.local/state/velmora");
    ::setenv("XDG_STATE_HOME", "/state", 1);
    EXPECT_EQ(LinuxFileSystem({{}, {}}).diagnosticLogDirectory(), "/state/velmora");
    EXPECT_EQ(LinuxFileSystem({"/root/", {}}).diagnosticLogDirectory(), "/root/state/velmora");
    EXPECT_EQ(LinuxFileSystem({"/root", "/named"}).diagnosticLogDirectory(), "/named");
    EXPECT_EQ(LinuxFileSystem({{}, "named/"}).diagnosticLogDirectory(), "named");
    EXPECT_EQ(LinuxFileSystem({{}, "/"}).diagnosticLogDirectory(), "/");
}

TEST_F(LinuxFileSystemTest, StandardLogDirectoryIsMadeANamedOneIsNot) {
    ::setenv("XDG_STATE_HOME", "/state", 1);
    const LinuxFileSystem standard({directory.path(), {}});
    EXPECT_TRUE(standard.makeStandardLogDirectory());
    EXPECT_TRUE(std::filesystem::is_directory(directory / "state/velmora"));
    for (const char* made : {"state", "state/velmora"})
        EXPECT_EQ(std::filesystem::status(directory / made).permissions(), std::filesystem::perms(0700));
    std::filesystem::permissions(directory / "state/velmora", std::filesystem::perms(0750));
    EXPECT_TRUE(standard.makeStandardLogDirectory()); // there already
    EXPECT_EQ(std::filesystem::status(directory / "state/velmora").permissions(),
              std::filesystem::perms(0750));

    const LinuxFileSystem named({{}, directory / "named"});
    EXPECT_TRUE(named.makeStandardLogDirectory());
    EXPECT_FALSE(std::filesystem::exists(directory / "named"));

    std::ofstream(directory / "file") << "x";
    const LinuxFileSystem blocked({directory / "file", {}});
    const auto made = blocked.makeStandardLogDirectory();
    ASSERT_FALSE(made);
    EXPECT_EQ(made.reason(),
              (directory / "file/state/velmora").string() + ": cannot be made: Not a directory");
}

TEST_F(LinuxFileSystemTest, FileIsWrittenInPlace) {
    LinuxFileSystem files({{}, {}});
    const std::string path = (directory / "out").string();
    ASSERT_TRUE(files.writeDirectly(path, "longer than the next"));
    const std::filesystem::path link = directory / "the same file";
    std::filesystem::create_hard_link(path, link);
    ASSERT_TRUE(files.writeDirectly(path, "next"));
    EXPECT_EQ(content("out"), "next");
    EXPECT_EQ(content("the same file"), "next"); // no other file was put in its place
    EXPECT_EQ(std::filesystem::status(path).permissions(), std::filesystem::perms(0600));
    const auto failed = files.writeDirectly((directory / "none/out").string(), "x");
    ASSERT_FALSE(failed);
    EXPECT_EQ(failed.reason(), "cannot be opened for writing: No such file or directory");
}

TEST_F(LinuxFileSystemTest, ReplacingPutsANewFileWithTheOldOnesPermissionsInItsPlace) {
    const std::filesystem::path path = directory / "list";
    ASSERT_TRUE(replaceFile(path, bytes("one")));
    ASSERT_EQ(::chmod(path.c_str(), 0640), 0);
    std::filesystem::create_hard_link(path, directory / "old");
    ASSERT_TRUE(replaceFile(path, bytes("two")));
    EXPECT_EQ(content("list"), "two");
    EXPECT_EQ(content("old"), "one");
    EXPECT_EQ(std::filesystem::status(path).permissions(), std::filesystem::perms(0640));
    EXPECT_THAT(names(), testing::UnorderedElementsAre("list", "old")); // no temporary file is left
}

TEST_F(LinuxFileSystemTest, ReplacingThatFailsLeavesNoDraft) {
    std::filesystem::create_directories(directory / "taken/by");
    const auto failed = replaceFile(directory / "taken", bytes("x"));
    ASSERT_FALSE(failed);
    EXPECT_EQ(failed.reason(), "cannot be replaced: Is a directory");
    EXPECT_THAT(names(), ElementsAre("taken"));
}

} // namespace
} // namespace velmora
