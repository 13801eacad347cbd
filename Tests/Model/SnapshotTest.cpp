// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/Snapshot.h"

#include <gmock/gmock.h>

#include <chrono>
#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;

constexpr Time moment = std::chrono::sys_days(std::chrono::year(2026) / 11 / 16) + std::chrono::hours(5) +
                        std::chrono::minutes(4) + std::chrono::milliseconds(22'999);

std::vector<std::string> keysOf(const Dictionary& dictionary) {
    std::vector<std::string> keys;
    for (const auto& [key, value] : dictionary)
        keys.push_back(key);
    return keys;
}

TEST(Snapshot, HoldsTimeDataAndDescriptionInThisOrder) {
    const ArrayRef contents = makeArray();
    contents->append("an entry");
    const DictionaryRef snapshot = makeSnapshot(moment, contents, "gate 4");
    EXPECT_THAT(keysOf(*snapshot), ElementsAre("Timestamp", "Data", "Description"));
    EXPECT_EQ((*snapshot)["Timestamp"], Value("2026-11-16 05:04:22 +0000"));
    EXPECT_EQ((*snapshot)["Data"].asArray(), contents.get());
    EXPECT_EQ((*snapshot)["Description"], Value("gate 4"));
}

TEST(Snapshot, KeepsAnEmptyDescription) {
    EXPECT_EQ((*makeSnapshot(moment, makeArray(), ""))["Description"], Value(""));
}

TEST(Snapshot, EndsWithItsTimeWhereThereIsNoData) {
    EXPECT_THAT(keysOf(*makeSnapshot(moment, nullptr, "gate 4")), ElementsAre("Timestamp"));
}

} // namespace
} // namespace velmora
