// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <stdexcept>

namespace velmora {
namespace {

/// Codes that no section of a technology's own reads, and such that only sections of another one do.
struct ForeignCode {
    std::uint32_t code;
    const char* line;
};
const ForeignCode foreignCodes[] = {
    {0x0000, "Received an unknown log message: 0"},
    {0x1234, "Received an unknown log message: 4660"},
    {0x5137, "Received an unknown log message: 20791"},
    {0xB178, "Received an unknown log message: 45432"},
    {0xB181, "Received an unknown log message: 45441"},
    {0xD0E1, "Received an unknown log message: 53473"},
    {0xFFB179, "Received an unknown log message: 16757113"},
    {0xFFD0E0, "Received an unknown log message: 16765152"},
    {0xFF0000, "Received an unknown log message: 16711680"},
    {0xFF0003, "Received an unknown log message: 16711683"},
    {0xFFFFFFFE, "Received an unknown log message: -2"}, // a signed number
    {0xFFFFFFFF, "Received an unknown log message: -1"},
};

/// A dictionary or an array that is not empty.
Value filledNode(bool array) {
    return array ? Value(std::make_shared<Array>(Array{"earlier"}))
                 : Value(std::make_shared<Dictionary>(Dictionary{{"Label", "text"}}));
}

LogLines update(Base& section, const Data& record, std::uint32_t code) {
    CapturedLog log;
    section.updateWithData(record, code);
    return log.lines();
}

/// What every section of a technology's own is expected to do, whatever it shows. The shared sections have
/// tests of their own.
class SectionContractTest : public testing::TestWithParam<Technology> {
protected:
    void forEach(const std::function<void(const ExpectedSection& expected, Base& section)>& check) {
        for (const ExpectedSection& expected : technology.sections) {
            const std::string name = expected.name;
            if (name == "SIM Info" || name == "PDP Context Info")
                continue;
            SCOPED_TRACE(name);
            Base* const section = index->getClass(name);
            if (!section)
                throw std::out_of_range(name);
            check(expected, *section);
        }
    }
    /// The same for each code that it reads.
    void
    forEachCode(const std::function<void(const ExpectedSection&, Base& section, std::uint32_t code)>& check) {
        forEach([&](const ExpectedSection& expected, Base& section) {
            for (const std::uint32_t code : expected.codes)
                check(expected, section, code);
        });
    }
    /// Expects the trace first, and so many lines.
    static void expectLines(const LogLines& lines, const ExpectedSection& expected, std::uint32_t code,
                            const LineCounts& counts) {
        ASSERT_FALSE(lines.empty());
        EXPECT_EQ(lines.front(), expected.trace);
        const auto count = counts.find(code);
        EXPECT_THAT(lines.size(), count == counts.end() ? testing::Eq(1u) : count->second)
            << std::hex << code;
    }

    const Technology& technology = GetParam();
    const std::unique_ptr<ClassIndex> index = technology.makeIndex();
};

TEST_P(SectionContractTest, NamesAndCodes) {
    forEach([](const ExpectedSection& expected, Base& section) {
        EXPECT_EQ(section.getSectionName(), expected.name);
        EXPECT_EQ(section.getLogCodeArray(), expected.codes);
    });
}

TEST_P(SectionContractTest, ACodeOfAnotherSectionChangesNothing) {
    forEach([this](const ExpectedSection& expected, Base& section) {
        for (const ForeignCode& foreign : foreignCodes) {
            if (std::count(expected.codes.begin(), expected.codes.end(), foreign.code))
                continue;
            LogLines lines{expected.trace};
            if (!technology.silent.contains(expected.name))
                lines.push_back({LogPriority::Error, foreign.line});
            const Data longEnough = recordWith(static_cast<std::uint16_t>(foreign.code), 400,
                                               {{13, 1}, {14, 1}, {15, 1}, {27, 1}, {28, 1}});
            for (const bool array : {false, true}) {
                const Value node = filledNode(array);
                section.updateSectionRef(node);
                EXPECT_EQ(update(section, longEnough, foreign.code), lines);
                EXPECT_EQ(update(section, Data(), foreign.code), lines);
                section.writeNode();
                EXPECT_EQ(shown(node), array ? "['earlier']" : "{Label 'text'}");
            }
        }
    });
}

TEST_P(SectionContractTest, AShortRecordLeavesTheTraceAlone) {
    // A prefixed message of 13 bytes leaves a record of 11.
    for (const std::size_t length :
         {std::size_t{0}, std::size_t{11}, std::size_t{13}, technology.longestShort})
        forEachCode([&](const ExpectedSection& expected, Base& section, std::uint32_t code) {
            if (code >= LogMessage::firstExtraCode && !technology.shortLines.contains(code))
                return; // has no minimum
            const Data record(std::vector<std::uint8_t>(length, 0));
            expectLines(update(section, record, code), expected, code, technology.shortLines);
        });
}

TEST_P(SectionContractTest, WithoutANodeNothingIsWritten) {
    forEachCode([this](const ExpectedSection& expected, Base& section, std::uint32_t code) {
        const Data& record = code < LogMessage::firstExtraCode ? technology.full : technology.cells;
        expectLines(update(section, record, code), expected, code, technology.fullLines);
    });
}

TEST_P(SectionContractTest, ANodeOfTheOtherKindIsNotChanged) {
    forEach([this](const ExpectedSection& expected, Base& section) {
        if (expected.codes.empty())
            return;
        const bool array = !technology.lists.contains(expected.name);
        const Value other = filledNode(array);
        section.updateSectionRef(other);
        update(section, technology.full, expected.codes.front());
        section.writeNode();
        EXPECT_EQ(shown(other), array ? "['earlier']" : "{Label 'text'}");
    });
}

INSTANTIATE_TEST_SUITE_P(All, SectionContractTest, testing::ValuesIn(technologies()), testName);

} // namespace
} // namespace velmora
