// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"
#include "Fuzz/QuietProcess.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <ostream>
#include <set>
#include <string>

#include <gtest/gtest.h>

namespace velmora {

void PrintTo(const FuzzTargetKind& kind, std::ostream* out) {
    *out << kind.name;
}

namespace {

namespace fs = std::filesystem;

class FuzzTargetTest : public testing::TestWithParam<FuzzTargetKind> {
protected:
    QuietProcess quiet;
    std::unique_ptr<FuzzTarget> target = GetParam().make();
};

std::vector<fs::path> findingsOf(std::string_view target) {
    std::vector<fs::path> files;
    const fs::path directory = fs::path(VELMORA_SOURCE_DIR "/Fuzz/findings") / target;
    if (fs::is_directory(directory))
        for (const fs::directory_entry& entry : fs::directory_iterator(directory))
            files.push_back(entry.path());
    std::sort(files.begin(), files.end());
    return files;
}

Data contentOf(const fs::path& path) {
    std::ifstream file(path, std::ios::binary);
    return Data(std::vector<std::uint8_t>(std::istreambuf_iterator<char>(file), {}));
}

TEST_P(FuzzTargetTest, AcceptsFormerFindings) {
    for (const fs::path& file : findingsOf(GetParam().name)) {
        SCOPED_TRACE(file.filename().string());
        EXPECT_NO_THROW(target->run(contentOf(file).bytes()));
    }
}

TEST_P(FuzzTargetTest, AcceptsItsSeeds) {
    const FuzzCorpus corpus = GetParam().corpus();
    EXPECT_GE(corpus.seeds.size(), 4u);
    for (std::size_t i = 0; i < corpus.seeds.size(); ++i) {
        SCOPED_TRACE("seed " + std::to_string(i + 1));
        EXPECT_NO_THROW(target->run(corpus.seeds[i].bytes()));
    }
}

TEST_P(FuzzTargetTest, AcceptsTruncatedInputs) {
    const FuzzCorpus corpus = GetParam().corpus();
    const Bytes seed =
        std::min_element(corpus.seeds.begin(), corpus.seeds.end(), [](const Data& a, const Data& b) {
            return a.size() < b.size();
        })->bytes();
    for (std::size_t length = 0; length <= seed.size(); ++length) {
        SCOPED_TRACE("the first " + std::to_string(length) + " bytes");
        EXPECT_NO_THROW(target->run(Data::copyOf(seed.first(length)).bytes()));
    }
}

TEST_P(FuzzTargetTest, HasTheSameCorpusEveryTime) {
    const FuzzCorpus first = GetParam().corpus();
    const FuzzCorpus second = GetParam().corpus();
    EXPECT_EQ(first.seeds, second.seeds);
    EXPECT_EQ(first.tokens, second.tokens);
}

TEST_P(FuzzTargetTest, HasTokensThatFitTheEngine) {
    for (const Data& token : GetParam().corpus().tokens) {
        EXPECT_GE(token.size(), 1u);
        EXPECT_LE(token.size(), 64u);
    }
}

INSTANTIATE_TEST_SUITE_P(Targets, FuzzTargetTest,
                         testing::ValuesIn(fuzzTargets().begin(), fuzzTargets().end()),
                         [](const auto& tested) {
                             std::string name(tested.param.name);
                             std::replace(name.begin(), name.end(), '-', '_');
                             return name;
                         });

TEST(FuzzFindingsTest, AreOfTargetsThatThereAre) {
    std::set<std::string> names;
    for (const FuzzTargetKind& kind : fuzzTargets())
        EXPECT_TRUE(names.emplace(kind.name).second) << kind.name << " is listed twice";
    for (const fs::directory_entry& entry : fs::directory_iterator(VELMORA_SOURCE_DIR "/Fuzz/findings"))
        EXPECT_TRUE(!entry.is_directory() || names.contains(entry.path().filename().string()))
            << entry.path();
}

} // namespace
} // namespace velmora
