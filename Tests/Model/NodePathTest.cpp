// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/NodePath.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

struct Joining {
    const char* odd;
    const char* path;
    const char* name;
    const char* joined;
};

class NodePathTest : public testing::TestWithParam<Joining> {};

TEST_P(NodePathTest, JoinsAsFileSystemPathsDo) {
    EXPECT_EQ(appendingPathComponent(GetParam().path, GetParam().name), GetParam().joined);
}

INSTANTIATE_TEST_SUITE_P(, NodePathTest,
                         testing::Values(Joining{"BelowTheRoot", "/", "Serving Cell", "/Serving Cell"},
                                         Joining{"DeeperDown", "/Serving Cell", "0", "/Serving Cell/0"},
                                         Joining{"SlashInsideANameAddsALevel", "/Cells", "a/b", "/Cells/a/b"},
                                         Joining{"NameEndingInASlashKeepsIt", "/Cells", "a/", "/Cells/a/"},
                                         Joining{"EmptyNameBelowTheRootIsNotTheRoot", "/", "", "//"},
                                         Joining{"EmptyNameIsNotItsParent", "/Cells", "", "/Cells/"}),
                         [](const auto& test) { return std::string(test.param.odd); });

} // namespace
} // namespace velmora
