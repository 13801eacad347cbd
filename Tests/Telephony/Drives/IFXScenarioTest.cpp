// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/IFX/IFXScenario.h"

#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "PropertyLists/PropertyList.h"
#include "Telephony/Service/LogFilter.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Telephony/Drives/ScenarioTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <charconv>
#include <set>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// Whether it holds nothing that ends the application, and no key that the display's paths cannot bear.
bool isDisplay(const Value& value) {
    if (const Dictionary* dictionary = value.asDictionary())
        return std::all_of(dictionary->begin(), dictionary->end(), [](const Dictionary::Entry& entry) {
            return entry.key.find('/') == std::string::npos && isDisplay(entry.value);
        });
    if (const Array* array = value.asArray())
        return std::all_of(array->begin(), array->end(), isDisplay);
    return value.asString() != nullptr;
}

/// The displays that the decoder makes of a drive.
std::vector<Value> displays(std::uint64_t seed, std::chrono::nanoseconds duration) {
    const FakeClock clock;
    GSMLogGenerator decoder(clock);
    std::vector<Value> result;
    for (const ScenarioEvent& event : driveOf<IFXScenario>(seed, duration)) {
        Dictionary state;
        decoder.updateState(state, event.message);
        result.push_back(state["Display"]);
    }
    return result;
}

const Value& at(const Value& display, std::initializer_list<std::string_view> path) {
    static const Value none;
    const Value* value = &display;
    for (const std::string_view key : path) {
        const Dictionary* dictionary = value->asDictionary();
        value = dictionary ? &(*dictionary)[key] : &none;
    }
    return *value;
}

int numberAt(const Value& display, std::initializer_list<std::string_view> path) {
    const std::string* text = at(display, path).asString();
    int number = -9999;
    if (text)
        std::from_chars(text->data(), text->data() + text->size(), number);
    return number;
}

TEST(IFXScenarioTest, oneMessageComesASecond) {
    const Drive drive = driveOf<IFXScenario>(1, 10min);
    ASSERT_EQ(drive.size(), 600U);
    for (std::size_t i = 0; i < drive.size(); ++i)
        ASSERT_EQ(drive[i].offset, std::chrono::seconds(i));
}

TEST(IFXScenarioTest, anotherSeedGivesAnotherDrive) {
    std::set<std::vector<std::uint8_t>> messages;
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        const Data last = driveOf<IFXScenario>(seed, 30s).back().message;
        messages.emplace(last.bytes().begin(), last.bytes().end());
    }
    EXPECT_EQ(messages.size(), 5U);
}

TEST(IFXScenarioTest, bothFormsAlternate) {
    bool binary = true;
    for (const ScenarioEvent& event : driveOf<IFXScenario>(1, 1min)) {
        const std::string start(event.message.bytes().begin(), event.message.bytes().begin() + 6);
        EXPECT_EQ(start, binary ? "bplist" : "<?xml ");
        binary = !binary;
    }
}

TEST(IFXScenarioTest, noMessageEverHoldsWhatEndsTheApplication) {
    for (const std::uint64_t seed : severalSeeds)
        for (const ScenarioEvent& event : driveOf<IFXScenario>(seed, 15min)) {
            const auto list = readPropertyList(event.message.bytes());
            ASSERT_TRUE(list) << list.reason();
            EXPECT_TRUE(list->asDictionary());
            ASSERT_TRUE(isDisplay(*list));
        }
}

TEST(IFXScenarioTest, theStartCommandsFilterLetsEverythingPass) {
    const FakeClock clock;
    const auto filter = LogFilter::fromStartCommand(*GSMLogGenerator(clock).getStartCommand());
    ASSERT_TRUE(filter) << filter.reason();
    for (const ScenarioEvent& event : driveOf<IFXScenario>(1, 1min))
        EXPECT_TRUE(filter->passes(event.message.bytes()));
}

TEST(IFXScenarioTest, everyStateComesWithinARound) {
    std::set<std::string> states;
    for (const Value& display : displays(1, 150s)) {
        const Value& folded = at(display, {"Registration"});
        const Value& state = folded.asString() ? folded : at(folded, {"State"});
        ASSERT_TRUE(state.asString());
        states.insert(*state.asString());
    }
    EXPECT_EQ(states, (std::set<std::string>{"Searching", "Limited Service", "Registering", "Idle", "Call",
                                             "Packet Transfer"}));
}

TEST(IFXScenarioTest, oneEntryDictionariesShowAsTheirValue) {
    bool call = false;
    bool folded = false;
    for (const Value& display : displays(1, 150s)) {
        EXPECT_EQ(at(display, {"SIM"}), Value("8900101000000000017"));
        if (const std::string* state = at(display, {"Registration"}).asString()) {
            EXPECT_THAT(*state, ::testing::AnyOf("Searching", "Limited Service", "Registering"));
            folded = true;
        } else {
            EXPECT_EQ(at(display, {"Registration", "Network Name"}), Value("Test Network"));
            const Array* equivalents = at(display, {"Registration", "Equivalent PLMNs"}).asArray();
            ASSERT_TRUE(equivalents);
            for (const Value& each : *equivalents)
                EXPECT_TRUE(each.asString());
        }
        const Value& channel = at(display, {"Dedicated Channel"});
        if (channel.asDictionary()) {
            call = true;
            EXPECT_GE(numberAt(channel, {"Duration"}), 1);
            EXPECT_LE(numberAt(channel, {"Duration"}), 30);
        } else {
            EXPECT_EQ(channel, Value("None"));
        }
    }
    EXPECT_TRUE(call);
    EXPECT_TRUE(folded);
}

TEST(IFXScenarioTest, valuesArePlausible) {
    std::set<int> levels;
    std::set<std::size_t> contextCounts;
    std::set<std::string> schemes;
    const auto plausibleCell = [&](const Value& cell) {
        const int arfcn = numberAt(cell, {"ARFCN"});
        const bool gsm900 = arfcn >= 1 && arfcn <= 124;
        EXPECT_TRUE(gsm900 || (arfcn >= 512 && arfcn <= 885)) << arfcn;
        EXPECT_EQ(at(cell, {"Band"}), Value(gsm900 ? "GSM 900" : "GSM 1800"));
        EXPECT_THAT(*at(cell, {"BSIC"}).asString(), ::testing::MatchesRegex("[0-7]-[0-7]"));
        const int level = numberAt(cell, {"RxLev"});
        EXPECT_GE(level, -110);
        EXPECT_LE(level, -47);
        EXPECT_EQ(numberAt(cell, {"C1"}), level + 105);
        levels.insert(level);
    };
    for (const Value& display : displays(1, 10min)) {
        if (const Value& serving = at(display, {"Serving Cell"}); !serving.isNone()) {
            plausibleCell(serving);
            EXPECT_GT(numberAt(serving, {"Cell ID"}), 0);
        } else {
            EXPECT_EQ(at(display, {"Registration"}), Value("Searching"));
        }
        const Array* neighbours = at(display, {"Neighbor Cells"}).asArray();
        ASSERT_TRUE(neighbours);
        EXPECT_LE(neighbours->size(), 6U);
        for (const Value& each : *neighbours)
            plausibleCell(each);
        if (const Array* contexts = at(display, {"Packet Data"}).asArray()) {
            contextCounts.insert(contexts->size()); // the dictionary of one entry is folded
        } else {
            contextCounts.insert(at(display, {"Packet Data", "Contexts"}).asArray()->size());
            schemes.insert(*at(display, {"Packet Data", "Coding Scheme"}).asString());
        }
        if (const Value& area = at(display, {"Registration", "LAC"}); !area.isNone()) {
            EXPECT_THAT(numberAt(display, {"Registration", "LAC"}), ::testing::AnyOf(4101, 4102, 5201));
            EXPECT_THAT(*at(display, {"Registration", "PLMN"}).asString(),
                        ::testing::AnyOf("001-01", "001-02"));
        }
        if (at(display, {"Dedicated Channel"}).asDictionary()) {
            EXPECT_THAT(numberAt(display, {"Dedicated Channel", "RxQual Full"}),
                        ::testing::AllOf(::testing::Ge(0), ::testing::Le(7)));
        }
    }
    EXPECT_GE(levels.size(), 20U) << "levels rise and fall";
    EXPECT_EQ(contextCounts, (std::set<std::size_t>{0, 1, 2}));
    for (const std::string& scheme : schemes)
        EXPECT_THAT(scheme, ::testing::MatchesRegex("CS-[1-4]"));
}

} // namespace
} // namespace velmora
