// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Comparison/ObservedDisplay.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/ShownDisplay.h"

#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>
#include <vector>

// The display that observations make is the one that the decoder shows, text for text, for every scenario.

namespace velmora {
namespace {

class Sink final : public ObservationSink {
public:
    void observed(const ObservedMessage& message) override { display.update(message); }

    ObservedDisplay display;
};

class ObservedDisplayOfDrives : public testing::TestWithParam<DecodedTechnology> {
protected:
    using Texts = std::map<std::string, std::multiset<std::string>>; ///< by the path in the catalogue

    ObservedDisplayOfDrives() { decoder.setObservationSink(&sink); }
    ~ObservedDisplayOfDrives() override { decoder.setObservationSink(nullptr); }

    [[nodiscard]] Texts observed() const {
        Texts texts;
        for (const ShownValue& value : sink.display.values())
            texts[value.leaf->path].insert(value.text);
        return texts;
    }
    [[nodiscard]] Texts shown() {
        const bool hasNumberedLists = std::string(GetParam().scenario) == "c2k";
        Texts texts;
        for (const auto& [path, leaf] :
             ShownDisplay(decoder.display(technology.state), decoder.catalogue(), hasNumberedLists).leaves)
            texts[leaf.pattern].insert(leaf.texts.begin(), leaf.texts.end());
        return texts;
    }

    TechnologyUnderTest technology{GetParam()};
    LogGenerator& decoder = technology.decoder();
    Sink sink;
};

TEST_P(ObservedDisplayOfDrives, IsWhatTheDecoderShows) {
    Texts ofTemplate;
    if (std::string(GetParam().scenario) != "ifx") { // whose messages are displays
        static_cast<void>(decoder.generateLogUsingState(technology.state));
        ofTemplate = shown();
    }
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam().scenario)->make(1);
    std::size_t compared = 0;
    for (int i = 1; i <= 3000; ++i) {
        decoder.updateState(technology.state, scenario->next().message);
        if (i % 500 != 0)
            continue;
        Texts display = shown();
        for (const auto& [path, texts] : observed()) {
            EXPECT_EQ(display[path], texts) << path << " after message " << i;
            display.erase(path);
            ++compared;
        }
        // What is left no message has reported.
        for (const auto& [path, texts] : display)
            EXPECT_EQ(ofTemplate[path], texts) << path << " after message " << i;
    }
    EXPECT_GT(compared, 100u);
}

INSTANTIATE_TEST_SUITE_P(Technologies, ObservedDisplayOfDrives, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
