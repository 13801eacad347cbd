// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileDraft.h"

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
using WhereThereIsOne = FileDraft::WhereThereIsOne;

class LinuxFileDraftTest : public testing::Test {
protected:
    [[nodiscard]] FileDraft create(const std::string& name, const std::string& content) const {
        Result<FileDraft> draft = FileDraft::create(directory / name, 0666);
        EXPECT_TRUE(draft) << draft.reason();
        EXPECT_TRUE(writeAll(draft->descriptor(),
                             Bytes(reinterpret_cast<const std::uint8_t*>(content.data()), content.size())));
        return *std::move(draft);
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

TEST_F(LinuxFileDraftTest, TakesItsPlaceInTheEnd) {
    FileDraft draft = create("out", "text");
    EXPECT_EQ(std::filesystem::path(draft.path()).parent_path(), directory.path()) << "on the same disk";
    EXPECT_EQ(names().size(), 1U);
    EXPECT_FALSE(std::filesystem::exists(directory / "out"));
    ASSERT_TRUE(draft.publish(WhereThereIsOne::Refuse));
    EXPECT_EQ(content("out"), "text");
    EXPECT_THAT(names(), ElementsAre("out"));
}

TEST_F(LinuxFileDraftTest, IsRemovedUnlessItIsPublished) {
    {
        const FileDraft draft = create("out", "text");
        EXPECT_EQ(names().size(), 1U);
    }
    EXPECT_THAT(names(), ElementsAre());
    FileDraft draft = create("out", "text");
    const FileDraft moved = std::move(draft);
    draft.discard(); // NOLINT(bugprone-use-after-move) which is what is tested
    EXPECT_EQ(names().size(), 1U) << "the other one has it";
}

TEST_F(LinuxFileDraftTest, ReplacesOrRefuses) {
    std::ofstream(directory / "out") << "earlier";
    FileDraft refused = create("out", "text");
    const auto result = refused.publish(WhereThereIsOne::Refuse);
    ASSERT_FALSE(result);
    EXPECT_EQ(result.reason(), "cannot be replaced: File exists");
    EXPECT_EQ(content("out"), "earlier");
    EXPECT_THAT(names(), ElementsAre("out"));
    ASSERT_TRUE(create("out", "text").publish(WhereThereIsOne::Replace));
    EXPECT_EQ(content("out"), "text");
    EXPECT_THAT(names(), ElementsAre("out"));
}

TEST_F(LinuxFileDraftTest, HasThePermissionsOfTheFileOrTheUsualOnes) {
    const mode_t earlier = ::umask(0027);
    ASSERT_TRUE(create("new", "").publish(WhereThereIsOne::Refuse));
    ::umask(earlier);
    EXPECT_EQ(std::filesystem::status(directory / "new").permissions(), std::filesystem::perms(0640));
    std::filesystem::permissions(directory / "new", std::filesystem::perms(0604));
    ASSERT_TRUE(create("new", "").publish(WhereThereIsOne::Replace));
    EXPECT_EQ(std::filesystem::status(directory / "new").permissions(), std::filesystem::perms(0604));
}

TEST_F(LinuxFileDraftTest, TellsWhereItCannotBe) {
    const auto draft = FileDraft::create(directory / "none/out", 0666);
    ASSERT_FALSE(draft);
    EXPECT_EQ(draft.reason(), "cannot be opened for writing: No such file or directory");
    std::filesystem::create_directories(directory / "taken/by");
    FileDraft overDirectory = create("taken", "text");
    const auto result = overDirectory.publish(WhereThereIsOne::Replace);
    ASSERT_FALSE(result);
    EXPECT_EQ(result.reason(), "cannot be replaced: Is a directory");
    EXPECT_THAT(names(), UnorderedElementsAre("taken"));
}

} // namespace
} // namespace velmora
