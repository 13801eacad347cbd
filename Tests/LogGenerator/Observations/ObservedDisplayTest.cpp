// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/DisplayCheck.h"
#include "Tests/LogGenerator/Observations/RandomMessages.h"

#include <gmock/gmock.h>

#include <cstdio>
#include <memory>
#include <string>

// What a message's observations say is what the display shows of it, for every scenario and for messages that
// no modem sends; and together they reach every row of the catalogue.

namespace velmora {
namespace {

std::string hexText(Bytes bytes) {
    std::string text;
    for (const std::uint8_t byte : bytes) {
        char digits[4];
        std::snprintf(digits, sizeof digits, "%02X ", static_cast<unsigned>(byte));
        text += digits;
    }
    return text;
}

class ObservedDisplayTest : public testing::TestWithParam<DecodedTechnology> {
    TechnologyUnderTest _tested{GetParam()};

protected:
    [[nodiscard]] static std::unique_ptr<Scenario> makeScenario(std::uint64_t seed) {
        return scenarioKindNamed(GetParam().scenario)->make(seed);
    }
    [[nodiscard]] static std::vector<Data> drive(std::uint64_t seed, std::size_t messages) {
        const std::unique_ptr<Scenario> scenario = makeScenario(seed);
        std::vector<Data> all(messages);
        for (Data& each : all)
            each = scenario->next().message;
        return all;
    }

    /// Decodes the message and expects its observations to be what is shown. False after some failures, which
    /// would otherwise be thousands.
    [[nodiscard]] bool expectObserved(const Data& message) {
        if (state["Display"].isNone()) // so that the template's own texts are there before the first message
            static_cast<void>(decoder.generateLogUsingState(state));
        check.mark(state);
        try {
            decoder.updateState(state, message);
        } catch (const LogCode_0xFF0000::UnknownDataException&) {
            return true;
        } catch (const AssertionFailure&) {
            return true;
        }
        const std::vector<std::string> problems = check.problems(state);
        if (problems.empty())
            return true;
        EXPECT_THAT(problems, testing::IsEmpty()) << "message " << hexText(message.bytes());
        return ++_failures < 5;
    }
    void play(const std::vector<Data>& messages) {
        for (const Data& message : messages)
            if (!expectObserved(message))
                return;
    }
    void playRandom(std::uint64_t seed, std::size_t messages) {
        RandomMessages random(decoder, drive(seed, 4000), seed);
        for (std::size_t i = 0; i < messages; ++i)
            if (!expectObserved(random.next()))
                return;
    }

    LogGenerator& decoder = _tested.decoder();
    Dictionary& state = _tested.state;
    DisplayCheck check{decoder};

private:
    int _failures = 0;
};

TEST_P(ObservedDisplayTest, ADrivesObservationsAreWhatItShows) {
    for (const std::uint64_t seed : {1, 2, 99})
        play(drive(seed, 6000));
}

TEST_P(ObservedDisplayTest, RandomMessagesObservationsAreWhatTheyShow) {
    for (const std::uint64_t seed : {1, 2})
        playRandom(seed, 6000);
}

TEST_P(ObservedDisplayTest, EveryRowOfTheCatalogueIsReached) {
    play(drive(1, 8000));
    playRandom(3, 8000);
    for (const CatalogueField& field : decoder.catalogue().fields()) {
        // A list that shows nothing until the first record of it: no record makes it empty again.
        if (field.path != "/1x/Active Set") {
            EXPECT_TRUE(check.leaves().contains(&field)) << field.path;
        }
        for (const CatalogueSource& source : field.sources)
            EXPECT_TRUE(check.sources().contains(&source))
                << field.path << " of 0x" << std::hex << source.code;
    }
}

INSTANTIATE_TEST_SUITE_P(Technologies, ObservedDisplayTest, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
