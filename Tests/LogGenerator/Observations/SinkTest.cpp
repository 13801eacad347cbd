// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Observation.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <optional>

// What a decoder passes to its sink of each message, beside the values themselves.

namespace velmora {
namespace {

class LastMessage final : public ObservationSink {
public:
    void observed(const ObservedMessage& message) override {
        ++messages;
        code = message.code;
        timestamp = message.timestamp;
        observations = message.observations.size();
    }

    int messages = 0;
    std::optional<std::uint32_t> code;
    std::optional<std::uint64_t> timestamp;
    std::size_t observations = 0;
};

struct MessageCase {
    const char* name;
    const char* bytes;
    std::optional<std::uint32_t> code;
    std::optional<std::uint64_t> timestamp;
    std::size_t observations;
};

class SinkTest : public testing::Test {
protected:
    void update(const Data& message) { tested.decoder().updateState(tested.state, message); }

    LastMessage sink; // which outlives the decoder
    TechnologyUnderTest tested{decodedTechnologies[2]};
};

class SinkMessageTest : public SinkTest, public testing::WithParamInterface<MessageCase> {};

TEST_P(SinkMessageTest, GetsEveryMessageWithItsCodeAndTimeStamp) {
    tested.decoder().setObservationSink(&sink);
    update(hex(GetParam().bytes));
    EXPECT_EQ(sink.messages, 1);
    EXPECT_EQ(sink.code, GetParam().code);
    EXPECT_EQ(sink.timestamp, GetParam().timestamp);
    EXPECT_EQ(sink.observations, GetParam().observations);
}

const MessageCase cases[] = {
    {"Record", "01 0E00 E0D0 0807060504030201 01 04", 0xD0E0, 0x0102030405060708, 1},
    {"Prefixed", "8100 01 0E00 E0D0 0100000000000000 01 04", 0xD0E0, 1, 1},
    {"NotSubscribed", "01 0E00 3412 0200000000000000 01 04", 0x1234, 2, 0},
    {"WrongType", "02 0E00 E0D0 0300000000000000 01 04", std::nullopt, 3, 0},
    {"ExtraStream", "FF 0E00 0200 0400000000000000 01 04", 0xFF0002, 4, 0},
    {"TooShort", "01 0E00", std::nullopt, std::nullopt, 0},
    {"EndsInItsTimeStamp", "8100 01 0E00 E0D0 010000000000", 0xD0E0, std::nullopt, 1},
    {"Empty", "", std::nullopt, std::nullopt, 0},
};
INSTANTIATE_TEST_SUITE_P(Messages, SinkMessageTest, testing::ValuesIn(cases),
                         [](const auto& tested) { return tested.param.name; });

TEST_F(SinkTest, WithoutASinkNothingIsPassed) {
    update(record(0xD0E0, "01 04"));
    tested.decoder().setObservationSink(&sink);
    update(record(0xD0E0, "01 03"));
    EXPECT_EQ(sink.messages, 1);
    tested.decoder().setObservationSink(nullptr);
    update(record(0xD0E0, "01 02"));
    EXPECT_EQ(sink.messages, 1);
    LastMessage other;
    tested.decoder().setObservationSink(&other);
    update(record(0xD0E0, "01 01"));
    EXPECT_EQ(other.observations, 1u);
    EXPECT_EQ(sink.messages, 1);
    tested.decoder().setObservationSink(nullptr);
}

// What a message that ends the program reported is not left to the next one.
TEST_F(SinkTest, AfterAnUnreadableSIMFileItGoesOn) {
    tested.decoder().setObservationSink(&sink);
    EXPECT_ANY_THROW(update(record(0, "00 01 02", 0xFF)));
    update(record(0xD0E0, "01 04"));
    EXPECT_EQ(sink.observations, 1u);
}

TEST_F(SinkTest, TheAgeOfASectionIsThatOfItsLatestRecord) {
    using namespace std::chrono_literals;
    update(record(0xD0E0, "01 04"));
    EXPECT_EQ(tested.decoder().latestRecord("RRC Info"), std::nullopt); // there is no sink
    tested.decoder().setObservationSink(&sink);
    tested.clock().advance(1s);
    update(record(0xD0E0, "01 03"));
    const Time latest = tested.clock().now();
    tested.clock().advance(1s);
    update(record(0x1234, "01 03"));
    EXPECT_EQ(tested.decoder().latestRecord("RRC Info"), latest);
    EXPECT_EQ(tested.decoder().latestRecord("Serving Cell Info"), std::nullopt);
    EXPECT_EQ(tested.decoder().latestRecord("No Section"), std::nullopt);
}

TEST_F(SinkTest, TheCatalogueStaysTheSame) {
    Catalogue& catalogue = tested.decoder().catalogue();
    EXPECT_EQ(catalogue.technology(), "Ostrel_UTRAN2");
    const std::size_t leaves = catalogue.fields().size();
    EXPECT_GT(leaves, 20u);
    tested.decoder().setObservationSink(&sink);
    EXPECT_EQ(&tested.decoder().catalogue(), &catalogue);
    EXPECT_EQ(catalogue.fields().size(), leaves);
}

} // namespace
} // namespace velmora
