// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemLogGenerator.h"
#include "Tests/LogGenerator/Observations/DisplayCheck.h"
#include "Tests/LogGenerator/Observations/RandomModemMessages.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <map>

// What a live modem's messages make of the display, for messages that no service sends.

namespace velmora {
namespace {

class ModemObservationsTest : public testing::Test {
    CapturedLog _log{LogPriority::Emergency};
    FakeClock _clock;
    FakeResources _resources;

protected:
    ModemObservationsTest() {
        _resources.put("Modem", "plist", shippedResource("Modem.plist"));
        decoder = ModemLogGenerator::generator(_clock);
        decoder->setKeepsHistory(false);
        static_cast<void>(decoder->generateLogUsingState(state));
    }

    std::unique_ptr<LogGenerator> decoder;
    Dictionary state;
};

TEST_F(ModemObservationsTest, AreWhatTheDisplayShowsAndReachTheWholeCatalogue) {
    DisplayCheck check(*decoder);
    RandomModemMessages random(1);
    for (int i = 0, failures = 0; i < 5000 && failures < 5; ++i) {
        check.mark(state);
        decoder->updateState(state, random.next());
        const std::vector<std::string> problems = check.problems(state);
        EXPECT_THAT(problems, testing::IsEmpty()) << "message " << i;
        failures += problems.empty() ? 0 : 1;
    }
    for (const CatalogueField& field : decoder->catalogue().fields()) {
        EXPECT_TRUE(check.leaves().contains(&field)) << field.path;
        EXPECT_EQ(field.sameAs, "") << field.path; // the state of one section is not that of another
        for (const CatalogueSource& source : field.sources)
            EXPECT_TRUE(check.sources().contains(&source)) << field.path;
    }
}

/// The order in which the catalogue has the labels of each dictionary.
std::map<std::string, std::vector<std::string>> labelsOf(const CatalogueNode& node) {
    std::map<std::string, std::vector<std::string>> all;
    for (const auto& child : node.children()) {
        all[node.path()].push_back(child->name());
        all.merge(labelsOf(*child));
    }
    return all;
}

void expectOrder(const Value& value, const std::string& path,
                 const std::map<std::string, std::vector<std::string>>& labels) {
    if (const Array* const array = value.asArray())
        for (const Value& row : *array)
            expectOrder(row, path + "/*", labels);
    const Dictionary* const dictionary = value.asDictionary();
    if (!dictionary || dictionary->empty())
        return;
    const std::vector<std::string>& wanted = labels.at(path.empty() ? "/" : path);
    auto at = wanted.begin();
    for (const auto& [key, child] : *dictionary) {
        at = std::find(at, wanted.end(), key);
        ASSERT_NE(at, wanted.end()) << path << '/' << key << " is out of its order";
        expectOrder(child, path + "/" + key, labels);
    }
}

TEST_F(ModemObservationsTest, TheDisplayKeepsTheOrderOfTheTables) {
    const auto labels = labelsOf(decoder->catalogue().root());
    RandomModemMessages random(2);
    for (int i = 0; i < 1500 && !HasFailure(); ++i) {
        decoder->updateState(state, random.next());
        if (i % 3 == 0)
            expectOrder(decoder->display(state), "", labels);
    }
}

} // namespace
} // namespace velmora
