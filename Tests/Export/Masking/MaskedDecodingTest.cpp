// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MessageMask.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"
#include "Tests/Export/Masking/ExampleKey.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/RandomMessages.h"

#include <gtest/gtest.h>

#include <span>
#include <string>
#include <vector>

// What masked messages are decoded to differs from what they were decoded to before in what identifies, and
// in nothing else.

namespace velmora {
namespace {

/// The first leaf that differs although it is no identity; empty where there is none.
std::string unexpectedDifference(const Value& a, const Value& b, const CatalogueNode* node, MaskLevel level) {
    const auto below = [&](const char* name) { return node ? node->find(name) : nullptr; };
    if (a.asDictionary() && b.asDictionary()) {
        if (a.asDictionary()->size() != b.asDictionary()->size())
            return "entries of " + (node ? node->path() : std::string());
        for (const auto& [key, value] : *a.asDictionary())
            if (const std::string found =
                    unexpectedDifference(value, (*b.asDictionary())[key], below(key.c_str()), level);
                !found.empty())
                return found;
        return {};
    }
    if (a.asArray() && b.asArray()) {
        if (a.asArray()->size() != b.asArray()->size())
            return "rows of " + (node ? node->path() : std::string());
        for (std::size_t i = 0; i < a.asArray()->size(); ++i)
            if (const std::string found =
                    unexpectedDifference((*a.asArray())[i], (*b.asArray())[i], below("*"), level);
                !found.empty())
                return found;
        return {};
    }
    if (a == b)
        return {};
    if (!node || !node->leaf())
        return "a value without a leaf";
    const Identity identity = node->leaf()->identity;
    if (identity == Identity::None)
        return node->path();
    return identity == Identity::Location && level == MaskLevel::Identity ? node->path() : std::string();
}

/// Beside those with an identity class: what a level masks because it names the network in other words.
bool namesTheNetwork(const std::string& path) {
    for (const char* const name : {"PLMN", "MCC", "MNC", "Operator", "APN", "Network Name", "EF-", "Bands"})
        if (path.find(name) != std::string::npos)
            return true;
    return false;
}

class MaskedDecoding : public testing::TestWithParam<DecodedTechnology> {
protected:
    static std::vector<Data> driveOf(std::uint64_t seed, std::size_t count) {
        const auto scenario = scenarioKindNamed(GetParam().scenario)->make(seed);
        std::vector<Data> drive;
        while (drive.size() < count)
            drive.push_back(scenario->next().message);
        return drive;
    }
    static std::string technology() {
        return std::string(
            shortTechnologyName(scenarioKindNamed(GetParam().scenario)->make(1)->technology()));
    }
    static Data masked(MessageMask& mask, const Data& message) {
        LoggedMessage logged;
        logged.message = message;
        return mask.mask(logged, technology())->message;
    }
};

TEST_P(MaskedDecoding, DriveDiffersInIdentitiesAlone) {
    for (const MaskLevel level : {MaskLevel::Identity, MaskLevel::Location}) {
        TechnologyUnderTest original(GetParam());
        TechnologyUnderTest copy(GetParam());
        MessageMask mask(exampleOptions(level));
        std::size_t number = 0;
        for (const Data& message : driveOf(1, 2000)) {
            const Data changed = masked(mask, message);
            original.decoder().updateState(original.state, message);
            copy.decoder().updateState(copy.state, changed);
            if (++number % 50 != 0)
                continue;
            const std::string found =
                unexpectedDifference(original.decoder().generateLogUsingState(original.state),
                                     copy.decoder().generateLogUsingState(copy.state),
                                     &original.decoder().catalogue().root(), level);
            ASSERT_TRUE(found.empty() || (level == MaskLevel::Location && namesTheNetwork(found)))
                << found << " after message " << number << " at level " << nameOf(level);
        }
    }
}

class MaskedRecords : public MaskedDecoding {};

TEST_P(MaskedRecords, KeepTheBytesThatDecodersRead) {
    TechnologyUnderTest original(GetParam());
    TechnologyUnderTest copy(GetParam());
    MessageMask mask(exampleOptions());
    RandomMessages random(original.decoder(), driveOf(2, 500), 7);
    for (int i = 0; i < 3000; ++i) {
        const Data message = random.next();
        const auto parsed = LogMessage::parse(message.bytes());
        if (!parsed || parsed->type == LogMessage::extraType)
            continue;
        const Data changed = masked(mask, message);
        ASSERT_EQ(changed.size(), message.size());
        original.decoder().updateState(original.state, message);
        copy.decoder().updateState(copy.state, changed);
        const std::string found =
            unexpectedDifference(original.decoder().generateLogUsingState(original.state),
                                 copy.decoder().generateLogUsingState(copy.state),
                                 &original.decoder().catalogue().root(), MaskLevel::Identity);
        ASSERT_EQ(found, "") << "after message " << i << " of code " << std::hex << parsed->logCode();
    }
}

TEST_P(MaskedDecoding, SecondTimeChangesNothing) {
    for (const MaskLevel level : {MaskLevel::Identity, MaskLevel::Location, MaskLevel::All}) {
        MessageMask once(exampleOptions(level));
        MaskOptions again = exampleOptions(level);
        again.done = level;
        MessageMask twice(again);
        Time time = FakeClock::defaultNow();
        for (const Data& message : driveOf(3, 1000)) {
            LoggedMessage logged;
            logged.time = time += std::chrono::milliseconds(25);
            logged.message = message;
            const auto changed = once.mask(logged, technology());
            const auto unchanged = twice.mask(*changed, technology());
            ASSERT_EQ(unchanged->message, changed->message);
            ASSERT_EQ(unchanged->time, changed->time);
        }
        EXPECT_EQ(twice.report().changed, 0U);
    }
}

INSTANTIATE_TEST_SUITE_P(Technologies, MaskedDecoding, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

// The others have property lists alone.
INSTANTIATE_TEST_SUITE_P(Technologies, MaskedRecords,
                         testing::ValuesIn(std::span(decodedTechnologies).first<4>()),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
