// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Properties/Conversions.h"
#include "Tests/Properties/Subscribed.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <string_view>
#include <vector>

// A snapshot holds the messages of the last five refreshes of a recording, and every other form made of it
// has them.

namespace velmora {
namespace {

std::vector<Data> joinedRefreshes(const std::vector<GivenMessage>& messages) {
    std::vector<Data> all;
    for (const auto& refresh : lastRefreshes(messages))
        all.insert(all.end(), refresh.begin(), refresh.end());
    return all;
}

class SnapshotConversion : public testing::TestWithParam<DecodedTechnology> {
protected:
    TechnologyUnderTest tested{GetParam()};
    const std::string technology{
        shortTechnologyName(scenarioKindNamed(GetParam().scenario)->make(1)->technology())};
};

using BinarySnapshots = SnapshotConversion;

TEST_P(BinarySnapshots, HaveTheMessagesOfTheLastRefreshes) {
    const auto codes = subscribedCodes(tested.decoder());
    rc::detail::checkGTest([&] {
        const auto messages = *inTime(recordOfCodes(codes));
        const Data snapshot = converted(recordingOf(messages, technology), FileForm::Snapshot, technology);
        const std::vector<Data> kept = joinedRefreshes(messages);
        RC_ASSERT(bytesOf(messagesOf(snapshot)) == kept);
        const Data recording = converted(snapshot, FileForm::Recording, technology);
        RC_ASSERT(bytesOf(messagesOf(recording)) == kept);
        const Data log = converted(snapshot, FileForm::DLFLog, technology);
        RC_ASSERT(bytesOf(messagesOf(log)) == kept);
    });
}

/// IFX's messages are no records.
std::vector<DecodedTechnology> binaryTechnologies() {
    std::vector<DecodedTechnology> binary;
    for (const DecodedTechnology& decoded : decodedTechnologies)
        if (std::string_view(decoded.scenario) != "ifx")
            binary.push_back(decoded);
    return binary;
}

INSTANTIATE_TEST_SUITE_P(Technologies, BinarySnapshots, testing::ValuesIn(binaryTechnologies()),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

using ObjectSnapshots = SnapshotConversion;

TEST_P(ObjectSnapshots, HaveTheLastObjectOfTheLastRefreshes) {
    rc::detail::checkGTest([&] {
        const auto messages = *inTime(anyTextTree());
        const Data snapshot = converted(recordingOf(messages, technology), FileForm::Snapshot, technology);
        std::vector<Value> kept;
        for (const auto& refresh : lastRefreshes(messages))
            kept.push_back(*readPropertyList(refresh.back().bytes()));
        for (const Data& form : {snapshot, converted(snapshot, FileForm::Recording, technology)}) {
            std::vector<Value> found;
            for (const GivenMessage& each : messagesOf(form))
                found.push_back(*readPropertyList(each.message.bytes()));
            RC_ASSERT(found == kept);
        }
    });
}

INSTANTIATE_TEST_SUITE_P(Technologies, ObjectSnapshots, testing::Values(decodedTechnologies[4]),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
