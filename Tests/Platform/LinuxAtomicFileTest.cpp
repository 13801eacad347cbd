// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/AtomicFile.h"

#include "Platform/Linux/Files/Files.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>
#include <string>
#include <utility>
#include <vector>

#include <sys/stat.h>
#include <unistd.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::UnorderedElementsAre;
using IfExists = AtomicFile::IfExists;

class LinuxAtomicFileTest : public testing::Test {
protected:
    [[nodiscard]] AtomicFile create(const std::string& name, const std::string& content) const {
        Result<AtomicFile> file = AtomicFile::create(directory / name, 0666);
        EXPECT_TRUE(file) << file.reason();
        EXPECT_TRUE(writeAll(file->descriptor(),
                             Bytes(reinterpret_cast<const std::uint8_t*>(content.data()), content.size())));
        return *std::move(file);
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

    TemporaryDirectory directory;
};

TEST_F(LinuxAtomicFileTest, ReplacesTheTargetOnCommit) {
    AtomicFile file = create("out", "text");
    EXPECT_EQ(std::filesystem::path(file.path()).parent_path(), directory.path()) << "on the same disk";
    EXPECT_EQ(names().size(), 1U);
    EXPECT_FALSE(std::filesystem::exists(directory / "out"));
    ASSERT_TRUE(file.commit(IfExists::Refuse));
    EXPECT_EQ(content("out"), "text");
    EXPECT_THAT(names(), ElementsAre("out"));
}

TEST_F(LinuxAtomicFileTest, IsRemovedUnlessItIsPublished) {
    {
        const AtomicFile file = create("out", "text");
        EXPECT_EQ(names().size(), 1U);
    }
    EXPECT_THAT(names(), ElementsAre());
    AtomicFile file = create("out", "text");
    const AtomicFile moved = std::move(file);
    file.discard(); // NOLINT(bugprone-use-after-move) which is what is tested
    EXPECT_EQ(names().size(), 1U) << "the other one has it";
}

TEST_F(LinuxAtomicFileTest, ReplacesOrRefuses) {
    std::ofstream(directory / "out") << "earlier";
    AtomicFile refused = create("out", "text");
    const auto result = refused.commit(IfExists::Refuse);
    ASSERT_FALSE(result);
    EXPECT_EQ(result.reason(), "cannot be replaced: File exists");
    EXPECT_EQ(content("out"), "earlier");
    EXPECT_THAT(names(), ElementsAre("out"));
    ASSERT_TRUE(create("out", "text").commit(IfExists::Replace));
    EXPECT_EQ(content("out"), "text");
    EXPECT_THAT(names(), ElementsAre("out"));
}

TEST_F(LinuxAtomicFileTest, HasThePermissionsOfTheFileOrTheUsualOnes) {
    const mode_t earlier = ::umask(0027);
    ASSERT_TRUE(create("new", "").commit(IfExists::Refuse));
    ::umask(earlier);
    EXPECT_EQ(std::filesystem::status(directory / "new").permissions(), std::filesystem::perms(0640));
    std::filesystem::permissions(directory / "new", std::filesystem::perms(0604));
    ASSERT_TRUE(create("new", "").commit(IfExists::Replace));
    EXPECT_EQ(std::filesystem::status(directory / "new").permissions(), std::filesystem::perms(0604));
}

TEST_F(LinuxAtomicFileTest, ReportsAnUnusableDirectory) {
    const auto file = AtomicFile::create(directory / "none/out", 0666);
    ASSERT_FALSE(file);
    EXPECT_EQ(file.reason(), "cannot be opened for writing: No such file or directory");
    std::filesystem::create_directories(directory / "taken/by");
    AtomicFile overDirectory = create("taken", "text");
    const auto result = overDirectory.commit(IfExists::Replace);
    ASSERT_FALSE(result);
    EXPECT_EQ(result.reason(), "cannot be replaced: Is a directory");
    EXPECT_THAT(names(), UnorderedElementsAre("taken"));
}

} // namespace
} // namespace velmora
