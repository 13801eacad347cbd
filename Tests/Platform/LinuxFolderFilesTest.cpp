// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FolderFiles.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class LinuxFolderFilesTest : public testing::Test {
protected:
    void create(const std::string& file) const {
        std::filesystem::create_directories((_directory / file).parent_path());
        std::ofstream(_directory / file) << file;
    }
    /// The files of the directories "first" and "second", each as "second/rules/a.toml 1".
    [[nodiscard]] std::vector<std::string> files() const {
        const std::vector<std::filesystem::path> directories{_directory / "first", _directory / "second",
                                                             _directory / "none"};
        std::vector<std::string> found;
        for (const FolderFile& each : filesInFolder(directories, "rules", "toml"))
            found.push_back(std::filesystem::relative(each.path, _directory.path()).string() + " " +
                            std::to_string(each.layer));
        return found;
    }

private:
    TemporaryDirectory _directory;
};

TEST_F(LinuxFolderFilesTest, ListsTheLastDirectoryFirstAndFilesByName) {
    create("first/rules/z.toml");
    create("first/rules/c.toml");
    create("second/rules/b.toml");
    create("second/rules/a.toml");
    EXPECT_THAT(files(), ElementsAre("second/rules/a.toml 2", "second/rules/b.toml 2", "first/rules/c.toml 3",
                                     "first/rules/z.toml 3"));
}

TEST_F(LinuxFolderFilesTest, AnEarlierDirectoryReplacesAFileOfTheSameName) {
    create("first/rules/a.toml");
    create("second/rules/a.toml");
    create("second/rules/b.toml");
    EXPECT_THAT(files(), ElementsAre("second/rules/b.toml 2", "first/rules/a.toml 3"));
}

TEST_F(LinuxFolderFilesTest, OtherFilesAreLeftOut) {
    create("first/a.toml");
    create("first/rules/a.toml~");
    create("first/rules/toml");
    create("first/rules/more/a.toml");
    EXPECT_THAT(files(), IsEmpty());
}

} // namespace
} // namespace velmora
