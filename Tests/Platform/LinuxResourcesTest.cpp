// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/Files/Files.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;

class LinuxResourcesTest : public testing::Test {
protected:
    LinuxResourcesTest() {
        std::filesystem::create_directories(_first);
        std::filesystem::create_directories(_second);
    }

    static void put(const std::filesystem::path& file, const std::string& text) {
        std::ofstream(file) << text;
    }
    static std::string textOf(const Data& data) { return {data.bytes().begin(), data.bytes().end()}; }

    TemporaryDirectory _directory;
    std::filesystem::path _first = _directory / "first";
    std::filesystem::path _second = _directory / "second";
    std::filesystem::path _absent = _directory / "absent";
    FileResources _resources{{_absent, _first, _second}};
};

TEST_F(LinuxResourcesTest, EachResourceComesFromTheFirstDirectoryThatHasIt) {
    put(_first / "LTE.plist", "own");
    put(_second / "LTE.plist", "installed");
    put(_second / "C2KTemplate.plist", "installed too");
    EXPECT_EQ(textOf(*_resources.read("LTE", "plist")), "own");
    EXPECT_EQ(textOf(*_resources.read("C2KTemplate", "plist")), "installed too");
}

TEST_F(LinuxResourcesTest, AFailureNamesThePlaces) {
    const auto none = _resources.read("LTE", "plist");
    ASSERT_FALSE(none);
    EXPECT_EQ(none.reason(), "no resource LTE.plist in " + _absent.string() + ", " + _first.string() + ", " +
                                 _second.string());
    for (const char* name : {"", "../first/LTE", "a/b"}) {
        const auto result = _resources.read(name, "plist");
        ASSERT_FALSE(result);
        EXPECT_EQ(result.reason(), "\"" + std::string(name) + ".plist\" is no resource's name");
    }
}

TEST_F(LinuxResourcesTest, AnUnreadableResourceIsNotSkipped) {
    std::filesystem::create_directory(_first / "LTE.plist");
    put(_second / "LTE.plist", "installed");
    const auto result = _resources.read("LTE", "plist");
    ASSERT_FALSE(result);
    EXPECT_EQ(result.reason(), (_first / "LTE.plist").string() + ": cannot be read: Is a directory");
}

TEST_F(LinuxResourcesTest, NamesAreListedOnceAndSorted) {
    put(_first / "UTRAN.plist", "");
    put(_first / "LTE.plist", "");
    put(_second / "LTE.plist", "");
    put(_second / "C2KTemplate.plist", "");
    put(_second / "Icon.png", "");
    put(_second / ".plist", "");
    EXPECT_THAT(_resources.list("plist"), ElementsAre("C2KTemplate", "LTE", "UTRAN"));
    EXPECT_THAT(_resources.list("txt"), IsEmpty());
}

TEST_F(LinuxResourcesTest, TheStandardDirectoriesAreInOrder) {
    ::setenv("VELMORA_RESOURCES", "/own", 1);
    ::setenv("XDG_CONFIG_HOME", "/config", 1);
    auto places = FileResources::standardDirectories();
    ASSERT_GE(places.size(), 4U);
    EXPECT_EQ(places[0], "/own");
    EXPECT_EQ(places[1], "/config/velmora");
    const auto program = std::filesystem::read_symlink("/proc/self/exe");
    EXPECT_EQ(places[2], program.parent_path().parent_path() / "share/velmora");
    EXPECT_EQ(places.back().filename(), "Resources");

    ::unsetenv("VELMORA_RESOURCES");
    ::setenv("XDG_CONFIG_HOME", "relative", 1);
    ::setenv("HOME", "/home/engineer", 1);
    places = FileResources::standardDirectories();
    EXPECT_EQ(places[0], "/home/engineer/.config/velmora");
    EXPECT_EQ(std::count(places.begin(), places.end(), places[0]), 1);
}

TEST_F(LinuxResourcesTest, TheProgramHasItsVersionAndBuildStamp) {
    ASSERT_TRUE(_resources.bundleVersion());
    EXPECT_THAT(*_resources.bundleVersion(), MatchesRegex("[0-9]+\\.[0-9]+\\.[0-9]+"));
    EXPECT_THAT(
        _resources.buildStamp(),
        MatchesRegex("[A-Z][a-z][a-z] [ 0-9][0-9] [0-9][0-9][0-9][0-9] [0-9][0-9]:[0-9][0-9]:[0-9][0-9]"));
}

TEST_F(LinuxResourcesTest, FilesAreReadUpToALimit) {
    const auto file = _directory / "file";
    put(file, "four");
    EXPECT_EQ(textOf(*readFile(file, 4)), "four");
    const auto longer = readFile(file, 3);
    ASSERT_FALSE(longer);
    EXPECT_EQ(longer.reason(), "more than 3 bytes");
    put(file, "");
    EXPECT_TRUE(readFile(file, 0)->empty());
    const auto none = readFile(_directory / "none", 10);
    ASSERT_FALSE(none);
    EXPECT_EQ(none.reason(), "cannot be opened: No such file or directory");
    const auto endless = readFile("/dev/zero", 1'000'000);
    ASSERT_FALSE(endless);
    EXPECT_EQ(endless.reason(), "more than 1000000 bytes");
}

TEST_F(LinuxResourcesTest, FilesAreWrittenAndReplaced) {
    const auto file = _directory / "file";
    put(file, "a longer content than the one that follows");
    const Data content(std::vector<std::uint8_t>(300'000, 0x5A));
    EXPECT_TRUE(writeFile(file, content.bytes()));
    EXPECT_TRUE(*readFile(file, 1'000'000) == content);
    EXPECT_TRUE(writeFile(file, hex("01 02").bytes()));
    EXPECT_EQ(*readFile(file, 10), hex("01 02"));
    const auto nowhere = writeFile(_absent / "file", content.bytes());
    ASSERT_FALSE(nowhere);
    EXPECT_EQ(nowhere.reason(), "cannot be opened for writing: No such file or directory");
    const auto full = writeFile("/dev/full", content.bytes());
    ASSERT_FALSE(full);
    EXPECT_EQ(full.reason(), "cannot be written: No space left on device");
}

} // namespace

} // namespace velmora
