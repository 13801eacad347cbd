// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Tests/LogGenerator/DecoderFixture.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cstdio>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

std::vector<std::int64_t> ascending(const Value& list) {
    std::vector<std::int64_t> numbers;
    for (const Value& number : *list.asArray())
        numbers.push_back(*number.asInteger());
    std::sort(numbers.begin(), numbers.end());
    return numbers;
}

class TechnologyDecoderTest : public DecoderFixture, public testing::WithParamInterface<Technology> {
protected:
    TechnologyDecoderTest() : DecoderFixture(GetParam().templateName, GetParam().constant) {}

    /// The lines that the sections log for each record under the code.
    [[nodiscard]] LogLines traces(std::uint32_t code) const {
        LogLines lines;
        for (const ExpectedSection& section : technology.subscribers(code))
            lines.push_back(section.trace);
        return lines;
    }
    /// Every code of the baseband's stream, or of the extra stream.
    [[nodiscard]] std::vector<std::uint16_t> streamCodes(bool isExtra = false) const {
        std::vector<std::uint16_t> codes;
        for (const std::uint32_t code : technology.codes())
            if ((code >= LogMessage::firstExtraCode) == isExtra)
                codes.push_back(static_cast<std::uint16_t>(code));
        return codes;
    }

    const Technology& technology = GetParam();
    const DecoderExpectation& expected = technology.decoder;
};

TEST_P(TechnologyDecoderTest, IsTheTechnologysDecoder) {
    CapturedLog log;
    std::unique_ptr<LogGenerator> another = expected.another(*generator, clock);
    ASSERT_NE(another, nullptr);
    ASSERT_FALSE(log.lines().empty());
    EXPECT_EQ(log.lines().front(), expected.firstLine);

    char address[40];
    std::snprintf(address, sizeof address, "%p", static_cast<const void*>(another.get()));
    LogLines lines;
    for (const char* name : expected.destruction)
        lines.push_back({LogPriority::Warning, std::string(name) + " is destructed " + address});
    log.clear();
    another.reset();
    EXPECT_EQ(log.lines(), lines);
}

TEST_P(TechnologyDecoderTest, AsksForTheCodesOfItsSections) {
    const std::vector<std::uint16_t> codes = streamCodes();
    const DictionaryRef command = generator->getStartCommand();
    EXPECT_EQ(command->size(), 3u);
    EXPECT_EQ((*command)["SetState"], Value("Streaming"));
    EXPECT_EQ(ascending((*command)["SetOstrelLogCodes"]),
              std::vector<std::int64_t>(codes.begin(), codes.end()));
    const std::vector<std::uint16_t> extraCodes = streamCodes(true);
    EXPECT_EQ(ascending((*command)["SetVoxExtraCodes"]),
              std::vector<std::int64_t>(extraCodes.begin(), extraCodes.end()));
    EXPECT_THAT(extraCodes, testing::IsSupersetOf({0, 1, 2}));
}

TEST_P(TechnologyDecoderTest, ARecordReachesItsSectionsInOrder) {
    for (const std::uint16_t code : streamCodes()) {
        LogLines lines = update(recordWith(code, 13));
        if (technology.shortLines.contains(code))
            lines.resize(1); // what else it logs is checked elsewhere
        EXPECT_EQ(lines, traces(code)) << std::hex << code;
        // The same code of the extra stream is another one.
        EXPECT_THAT(update(record(code, "01 03", 0xFF)), IsEmpty()) << std::hex << code;
    }
    EXPECT_EQ(update(extraRecord(0, makeDictionary())), traces(0xFF0000));
    EXPECT_EQ(update(technology.emptyCells), traces(0xFF0001));
    EXPECT_EQ(update(technology.emptyContexts), traces(0xFF0002));
    for (const std::uint16_t unknown : std::initializer_list<std::uint16_t>{0x1234, 0xD0E1})
        EXPECT_THAT(update(recordWith(unknown, 20)), IsEmpty()) << std::hex << unknown;
}

TEST_P(TechnologyDecoderTest, APrefixedRecordIsDecodedAlike) {
    update(joined(hex("81 00"), expected.record));
    EXPECT_EQ(node(expected.group, expected.section), expected.node);
}

INSTANTIATE_TEST_SUITE_P(All, TechnologyDecoderTest, testing::ValuesIn(technologies()), testName);

} // namespace
} // namespace velmora
