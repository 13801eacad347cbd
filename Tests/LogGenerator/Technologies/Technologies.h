// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/LogGenerator.h"
#include "Platform/Bytes.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <iosfwd>
#include <map>
#include <memory>
#include <set>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

/// The technologies whose decoders are a list of sections, as the tests expect them. One file each holds what
/// is expected, and the suites of this folder state once what holds for all of them.

namespace velmora {

/// The section that a field of a class index holds.
template <class Index, class Section>
const Base* sectionOf(const ClassIndex& index, ClassIndex::Held<Section> Index::*field) {
    return (static_cast<const Index&>(index).*field).get();
}
template <auto field>
const Base* held(const ClassIndex& index) {
    return sectionOf(index, field);
}

/// A section as its technology's list has it.
struct ExpectedSection {
    const char* name;
    const Base* (*field)(const ClassIndex& index);
    std::vector<std::uint32_t> codes; ///< in the order in which the section names them
    CapturedLog::Line trace;          ///< the line that every record causes

    /// One whose line is a warning: `word`, or its name.
    ExpectedSection(const char* sectionName, const Base* (*inIndex)(const ClassIndex&),
                    std::vector<std::uint32_t> logCodes, const char* word = nullptr,
                    int priority = LogPriority::Warning)
        : name(sectionName), field(inIndex),
          codes(std::move(logCodes)), trace{priority, word ? word : sectionName} {}
};

/// The two sections that the technologies share.
[[nodiscard]] ExpectedSection simInfo(const Base* (*field)(const ClassIndex&));
[[nodiscard]] ExpectedSection contextList(const Base* (*field)(const ClassIndex&));

/// How many log lines a record of a code causes where its trace is not the only one.
using LineCounts = std::map<std::uint32_t, testing::Matcher<std::size_t>>;

/// A decoder of the technology's class; null where the other is of another class.
template <class Decoder>
std::unique_ptr<LogGenerator> anotherLike(const LogGenerator& other, const Clock& clock) {
    if (!dynamic_cast<const Decoder*>(&other))
        return nullptr;
    return Decoder::generator(clock);
}

struct DecoderExpectation {
    std::unique_ptr<LogGenerator> (*another)(const LogGenerator& other, const Clock& clock);
    CapturedLog::Line firstLine;          ///< when it is made
    std::vector<const char*> destruction; ///< the names whose destruction it logs

    Data record;       ///< one of a section, and what it shows
    const char* group; ///< empty for a section that is in none
    const char* section;
    const char* node;
};

struct Technology {
    std::string name; ///< of the tests
    std::string_view constant;
    const char* templateName; ///< of the resource
    std::function<std::unique_ptr<ClassIndex>()> makeIndex;
    std::vector<ExpectedSection> sections; ///< in the order of their creation
    const char* noSection;                 ///< resembles a section's name and is none
    const char* consoleAtEnd;              ///< what an index prints when it is destroyed
    std::set<std::string> lists;           ///< the sections whose node is an array
    std::set<std::string> silent;          ///< those that log nothing for a code that they do not read
    std::vector<std::string> groups;       ///< what else the template holds, in its order

    std::size_t longestShort; ///< of the record lengths that are below every minimum
    LineCounts shortLines;    ///< of records that are too short
    Data full;                ///< a record that holds all that any of the sections reads
    Data cells;               ///< a cell information array that each section finds a cell in
    LineCounts fullLines;     ///< of these two
    Data emptyCells = extraRecord(1, makeArray());    ///< without a cell
    Data emptyContexts = extraRecord(2, makeArray()); ///< without a context

    DecoderExpectation decoder;

    /// The sections that read the code, in the order of their creation.
    [[nodiscard]] std::vector<ExpectedSection> subscribers(std::uint32_t code) const;
    /// Every code that a section reads.
    [[nodiscard]] std::set<std::uint32_t> codes() const;
};

/// As a failing test prints it: by its name.
void PrintTo(const Technology& technology, std::ostream* out);

/// One technology each.
[[nodiscard]] Technology expectedLTE();
[[nodiscard]] Technology expectedModem();
[[nodiscard]] Technology expectedOstrelGSM();
[[nodiscard]] Technology expectedUTRAN();
/// All of them.
[[nodiscard]] const std::vector<Technology>& technologies();

/// The name of a parameterized test: the technology's.
[[nodiscard]] inline std::string testName(const testing::TestParamInfo<Technology>& info) {
    return info.param.name;
}

} // namespace velmora
