// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Observation.h"
#include "Platform/SystemLog.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Memory/Allocations.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"
#include "Tools/Decode/JSONLines.h"
#include "Tools/Output.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <ostream>
#include <string>
#include <vector>

#include <fcntl.h>
#include <unistd.h>

// A decoder that has seen a drive decodes it again without allocating anything, observed or not, and so does
// what writes a line of each message.

namespace velmora {
namespace {

/// Accepts the lines of the programs' default level, and keeps none.
class ForgetfulLog final : public SystemLog {
public:
    ForgetfulLog()
        : _earlierLevel(detail::systemLogLevel), _earlier(setSystemLog(this, LogPriority::Error)) {}
    ~ForgetfulLog() override { setSystemLog(_earlier, _earlierLevel); }
    ForgetfulLog(const ForgetfulLog&) = delete;
    ForgetfulLog& operator=(const ForgetfulLog&) = delete;

    void write(int, std::string_view) override {}

private:
    int _earlierLevel;
    SystemLog* _earlier;
};

struct Drive {
    std::string scenario;
    std::string resource; ///< the technology's template

    friend std::ostream& operator<<(std::ostream& out, const Drive& drive) { return out << drive.scenario; }
};

class SteadyStateTest : public testing::TestWithParam<Drive> {
    FakeClock _clock;
    FakeResources _resources;
    ForgetfulLog _log;

protected:
    SteadyStateTest() {
        const std::string& resource = GetParam().resource;
        _resources.put(resource, "plist", shippedResource(resource + ".plist"));
        const auto scenario = scenarioKindNamed(GetParam().scenario)->make(1);
        decoder = LogGenerator::generatorFromTechnology(scenario->technology(), _clock);
        // The history keeps the messages themselves, which are no update of a section.
        decoder->setKeepsHistory(false);
        messages.resize(10000);
        for (Data& message : messages)
            message = scenario->next().message;
    }

    /// Decodes the drive. What that allocates, the redraws left out.
    std::uint64_t allocationsOfDrive() {
        return allocationsOf([this](const Data& message) { decoder->updateState(state, message); });
    }

    /// The same of what is done for each message.
    template <class Decode>
    std::uint64_t allocationsOf(Decode decode) {
        std::uint64_t allocations = 0;
        for (std::size_t i = 0; i < messages.size(); ++i) {
            {
                const Allocations counted;
                decode(messages[i]);
                allocations += counted.count();
            }
            if (i % redrawEvery == 0)
                static_cast<void>(decoder->generateLogUsingState(state));
        }
        return allocations;
    }

    static constexpr std::size_t redrawEvery = 100;
    std::unique_ptr<LogGenerator> decoder;
    std::vector<Data> messages;
    Dictionary state;
};

TEST_P(SteadyStateTest, UpdatesAllocateNothing) {
    EXPECT_GT(allocationsOfDrive(), 100u);
    EXPECT_EQ(allocationsOfDrive(), 0u);
}

/// Takes all that there is to an observation, and keeps none of it.
class CountingSink final : public ObservationSink {
public:
    void observed(const ObservedMessage& message) override {
        observations += message.observations.size();
        for (const Observation& each : message.observations)
            characters += _text.of(each).size() + each.rowKey.size();
    }

    std::size_t observations = 0;
    std::size_t characters = 0;

private:
    ObservedText _text;
};

TEST_P(SteadyStateTest, ObservationsAllocateNothing) {
    CountingSink sink;
    decoder->setObservationSink(&sink);
    EXPECT_GT(allocationsOfDrive(), 100u);
    const std::size_t observations = sink.observations;
    EXPECT_EQ(allocationsOfDrive(), 0u);
    EXPECT_GT(observations, messages.size());
    // Not exactly as many: some values count from an earlier record.
    EXPECT_GT(sink.observations, 2 * observations - messages.size() / 100);
    decoder->setObservationSink(nullptr);
}

TEST_P(SteadyStateTest, LinesOfMessagesAllocateNothing) {
    const int nowhere = ::open("/dev/null", O_WRONLY | O_CLOEXEC);
    ASSERT_GE(nowhere, 0);
    {
        Output output(nowhere);
        const NodeSelection everything;
        MessageLines lines(output, false, everything, "");
        lines.didMakeDecoder(*decoder);
        Decoded decoded;
        lines.willConcern(decoded);
        LoggedMessage logged;
        const auto writeLine = [&](const Data& message) {
            lines.willDecode(logged);
            decoder->updateStateReporting(state, message, *lines.effects());
            lines.didDecode(logged, *decoder, state);
        };
        EXPECT_GT(allocationsOf(writeLine), 100u);
        EXPECT_EQ(allocationsOf(writeLine), 0u);
    }
    ::close(nowhere);
}

INSTANTIATE_TEST_SUITE_P(Drives, SteadyStateTest,
                         testing::Values(Drive{"gsm", "Ostrel_GSM"}, Drive{"lte", "LTE"},
                                         Drive{"utran", "Ostrel_UTRAN"}, Drive{"c2k", "C2KTemplate"}),
                         [](const auto& drive) { return drive.param.scenario; });

} // namespace
} // namespace velmora
