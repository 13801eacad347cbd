// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "LogMessages/Record.h"
#include "Telephony/Drives/C2K/C2KScenario.h"
#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"

#include <optional>

namespace velmora {
namespace {

class C2KTruthTest : public TruthTest {
protected:
    C2KTruthTest() : TruthTest(decodedTechnologies[3]) {}

    void compareServing(const Seen& value, const C2KSector& sector, double received_dBm) {
        switch (value.role) {
        case Role::ServingCell: expectNumber(value, sector.baseId); break;
        // 1x and EV-DO have a carrier each.
        case Role::ServingChannel:
            expectNumber(value, value.path.starts_with("/EV-DO/") ? sector.packetChannel : sector.channel);
            break;
        case Role::ServingPhysicalCell: expectNumber(value, sector.pnOffset); break;
        // With the receiver's noise of half a decibel, and its steps.
        case Role::ServingLevel: expectNumber(value, received_dBm, 3); break;
        default: break;
        }
    }
    void compareStates(const Seen& value, const C2KPhone& before, const C2KPhone& after) {
        if (value.role != Role::RadioState)
            return;
        if (value.path.find("EV-DO") != std::string::npos) {
            if (before.evdo == after.evdo)
                expectRaw(value, static_cast<int>(after.evdo));
        } else if (before.oneX == after.oneX && after.oneX != records::OneXState::Paging) {
            expectRaw(value, static_cast<int>(after.oneX)); // between two pages the receiver may sleep
        }
    }
};

TEST_F(C2KTruthTest, WhatIsObservedIsWhatTheDriveMeant) {
    for (const std::uint64_t seed : {1, 7})
        play<C2KScenario>(
            seed, 8000, [&](const C2KNetwork& network, const C2KPhone& before, const C2KPhone& after) {
                const bool isSteady = before.serving && after.serving &&
                                      before.serving->sector.baseId == after.serving->sector.baseId;
                for (const Seen& each : seen()) {
                    compareStates(each, before, after);
                    // Without a carrier EV-DO has no channel.
                    if (isSteady && before.evdo >= records::EVDOState::Sync && before.evdo == after.evdo)
                        compareServing(each, after.serving->sector,
                                       network.received_dBm(after.serving->sector.sid));
                    if (each.role == Role::BlockErrorRate) {
                        EXPECT_GE(each.number, 0) << each.path;
                        EXPECT_LE(each.number, 100) << each.path;
                    }
                }
            });
    expectCompared({Role::ServingCell, Role::ServingChannel, Role::ServingPhysicalCell, Role::ServingLevel,
                    Role::RadioState});
}

/// What has been sent on the forward link up to a record, by its counters of packets of 1024, 2048 and 4096
/// bits.
struct Sent {
    double seconds;
    double bits;
};

std::optional<Sent> sentBy(const Data& message) {
    constexpr std::size_t length = 241;
    const std::optional<LogMessage> parsed = LogMessage::parse(message.bytes());
    if (!parsed || parsed->type != LogMessage::basebandType || parsed->code != 0x1192 ||
        parsed->record.size() < length)
        return std::nullopt;
    const Record record(parsed->record);
    return Sent{static_cast<double>(record.u32(13)),
                1024.0 * record.u32(29) + 2048.0 * record.u32(125) + 4096.0 * record.u32(197)};
}

TEST_F(C2KTruthTest, ADataRateIsTheBitsOfASecond) {
    C2KScenario scenario(1);
    std::optional<Sent> before;
    for (int i = 0; i < 6000; ++i) {
        const Data message = scenario.next().message;
        decode(message);
        const std::optional<Sent> now = sentBy(message);
        if (!now)
            continue;
        for (const Seen& each : seen())
            if (each.role == Role::DataRate && before && now->seconds > before->seconds) {
                const double rate = (now->bits - before->bits) / (now->seconds - before->seconds) / 1000;
                expectNumber(each, rate, 0.001 * rate);
            }
        before = now;
    }
    expectCompared({Role::DataRate});
}

} // namespace
} // namespace velmora
