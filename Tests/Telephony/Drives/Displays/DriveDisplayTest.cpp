// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"
#include "Tests/Telephony/Drives/Displays/ExpectedDisplays.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <memory>

namespace velmora {
namespace {

/// What a drive shows, by path.
struct Shown {
    std::map<std::string, Texts> texts;
    std::map<std::string, Lengths> lengths;

    void collect(const Value& level, const std::string& path) {
        if (const std::string* text = level.asString(); text && !text->empty())
            texts[path].insert(*text);
        if (const Array* list = level.asArray()) {
            lengths[path].insert(list->size());
            for (const Value& entry : *list)
                collect(entry, path);
        }
        if (const Dictionary* entries = level.asDictionary())
            for (const auto& [key, value] : *entries)
                if (key != "_sorted") // the pilots of a CDMA2000 list have keys with a semicolon
                    collect(value, key.find(';') == std::string::npos ? path + "/" + key : path);
    }
};

/// Expects just the paths of the table, and of each what the table says.
template <class Found, class Expected>
void expectAll(const Found& found, const Expected& expected) {
    for (const auto& [path, values] : found) {
        const auto row = expected.find(path);
        if (row == expected.end())
            ADD_FAILURE() << path << " is not expected";
        else
            EXPECT_THAT(values, row->second) << path;
    }
    for (const auto& [path, matcher] : expected)
        EXPECT_TRUE(found.contains(path)) << path << " is never shown";
}

class DriveDisplayTest : public testing::TestWithParam<ExpectedDisplay> {
protected:
    DriveDisplayTest() {
        resources.put(expected.templateName, "plist", shippedResource(expected.templateName + ".plist"));
        decoder = LogGenerator::generatorFromTechnology(scenario->technology(), clock);
        static_cast<void>(decoder->generateLogUsingState(state)); // builds the display
    }

    /// Decodes twenty minutes, and calls `look` after every message.
    void play(const std::function<void(const Data& message)>& look) {
        const std::chrono::minutes length(20);
        for (ScenarioEvent event = scenario->next(); event.offset < length; event = scenario->next()) {
            decoder->updateState(state, event.message);
            look(event.message);
        }
    }

    const ExpectedDisplay& expected = GetParam();
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(expected.scenario)->make(1);
    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<LogGenerator> decoder;
    Dictionary state;
};

TEST_P(DriveDisplayTest, everyLabelIsFilledAndPlausible) {
    const CapturedLog log(LogPriority::Emergency);
    Shown shown;
    play([&](const Data&) {
        const Value display = decoder->display(state);
        shown.collect(display, "");
        expected.relations(*display.asDictionary());
    });
    expectAll(shown.texts, expected.texts);
    expectAll(shown.lengths, expected.lengths);
}

TEST_P(DriveDisplayTest, onlyUnusualMessagesAreReported) {
    std::map<std::string, int> counts;
    CapturedLog log(expected.logLevel);
    play([&](const Data& message) {
        if (expected.isReported) {
            EXPECT_EQ(!log.lines().empty(), expected.isReported(message));
        }
        for (const CapturedLog::Line& line : log.lines()) {
            const auto report = std::find_if(
                expected.reports.begin(), expected.reports.end(), [&line](const ExpectedReport& each) {
                    return testing::Value(line.text, testing::MatchesRegex(each.expression));
                });
            if (report == expected.reports.end())
                ADD_FAILURE() << line.text;
            else
                ++counts[report->expression];
        }
        log.clear();
    });
    for (const ExpectedReport& report : expected.reports)
        EXPECT_THAT(counts[report.expression], report.count) << report.expression;
}

INSTANTIATE_TEST_SUITE_P(Drives, DriveDisplayTest,
                         testing::Values(expectedC2KDisplay(), expectedLTEDisplay(), expectedUTRANDisplay()),
                         [](const auto& drive) { return drive.param.scenario; });

} // namespace
} // namespace velmora
