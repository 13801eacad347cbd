// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/PropertyLists/SameValue.h"
#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/LogGenerator/Observations/DisplayCheck.h"
#include "Tests/LogGenerator/Observations/RandomMessages.h"
#include "Tests/Properties/GivenMessages.h"
#include "Tests/Properties/Subscribed.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <memory>

// Every message generator makes messages that the decoders take: none ends with an exception other than the
// two by which a decoder refuses what it must not show, what is shown is what is observed, and the same
// messages show the same.

namespace velmora {
namespace {

class MessageGenerators : public testing::TestWithParam<DecodedTechnology> {
protected:
    /// False where the decoder refuses the message.
    static bool update(TechnologyUnderTest& tested, const Data& message) {
        try {
            tested.decoder().updateState(tested.state, message);
            return true;
        } catch (const LogCode_0xFF0000::UnknownDataException&) {
            return false;
        } catch (const AssertionFailure&) {
            return false;
        }
    }
    static Value shownAfter(const std::vector<GivenMessage>& messages) {
        TechnologyUnderTest tested(GetParam());
        for (const GivenMessage& each : messages)
            RC_ASSERT(update(tested, each.message));
        return tested.decoder().generateLogUsingState(tested.state);
    }
    /// What this technology's messages look like to a decoder that asks for them.
    static rc::Gen<Data> given() {
        TechnologyUnderTest tested(GetParam());
        const auto codes = subscribedCodes(tested.decoder());
        return codes.empty() ? anyTextTree() : recordOfCodes(codes);
    }
};

TEST_P(MessageGenerators, RandomMessagesShowWhatIsObserved) {
    std::vector<Data> drive(500);
    const auto scenario = scenarioKindNamed(GetParam().scenario)->make(1);
    for (Data& each : drive)
        each = scenario->next().message;
    rc::detail::checkGTest([&drive] {
        TechnologyUnderTest tested(GetParam());
        DisplayCheck check(tested.decoder());
        static_cast<void>(tested.decoder().generateLogUsingState(tested.state));
        RandomMessages random(tested.decoder(), drive, *rc::gen::arbitrary<std::uint64_t>().as("seed"));
        for (int i = 0; i < 20; ++i) {
            check.mark(tested.state);
            if (update(tested, random.next()))
                RC_ASSERT(check.problems(tested.state) == std::vector<std::string>());
        }
    });
}

TEST_P(MessageGenerators, RecordsOfEverySubscribedCodeAreDecoded) {
    const auto generator = inTime(given());
    rc::detail::checkGTest([&generator] {
        const auto messages = *generator;
        const Value display = shownAfter(messages);
        RC_ASSERT(sameValue(shownAfter(messages), display));
        if (display.isNone()) {
            RC_ASSERT(messages.empty());
            return;
        }
        const auto written = writeBinaryPropertyList(display);
        RC_ASSERT(bool(written));
        RC_ASSERT(sameValue(*readPropertyList(*written), display));
    });
}

INSTANTIATE_TEST_SUITE_P(Technologies, MessageGenerators, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
