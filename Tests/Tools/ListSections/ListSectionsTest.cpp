// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/ShellCommand.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

/// The program that prints the tables which are generated from the sections.

namespace velmora {
namespace {

using testing::AllOf;
using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

/// What comes of it with these words, which may redirect; `input` as its standard input.
ShellOutcome listSections(const std::string& words, const std::string& input = "") {
    return runShell("printf %s " + shellQuoted(input) + " | " +
                    shellQuoted(VELMORA_BUILD_DIR "/generated/list-sections") + " " + words);
}

TEST(ListSections, PutsTheTablesInPlaceOfTheirNames) {
    const ShellOutcome outcome =
        listSections("dissector", "first\n@SECTIONS@\n-- @RECORDS@\n@RECORDS@\nlast\n");
    EXPECT_EQ(outcome.status, 0);
    EXPECT_THAT(
        outcome.output,
        AllOf(StartsWith("first\n    order = {\"Ostrel_GSM\", "),
              HasSubstr("\n        [0xB180] = {\"Neighbor Measurements\", \"Neighbor Cells List\"},\n"),
              HasSubstr("\n    },\n-- @RECORDS@\n    [0x108A] = \"Finger C/I\",\n"),
              EndsWith("    [0x134F] = \"System identification\",\nlast\n")));
}

TEST(ListSections, WantsEachTableOnceInTheTemplate) {
    for (const char* const source : {"", "@SECTIONS@\n", "@RECORDS@\n", "@SECTIONS@\n@RECORDS@\n@SECTIONS@\n",
                                     "@RECORDS@\n@SECTIONS@\n@RECORDS@\n", " @SECTIONS@\n@RECORDS@\n"})
        EXPECT_EQ(listSections("dissector", source).status, 1) << source;
}

TEST(ListSections, PutsFieldsAndViewsAndPartsInPlaceOfTheirNames) {
    const ShellOutcome outcome =
        listSections("dissector", "@SECTIONS@\n@RECORDS@\n@FIELDS@\n@VIEWS@\n@PART times.lua@\n");
    EXPECT_EQ(outcome.status, 0);
    // 0xB17F: nine bits from bit 0 of byte 21 on, in quarters of a dB from -140 dBm.
    EXPECT_THAT(
        outcome.output,
        AllOf(
            HasSubstr(
                "{\"velmora.lte.serving_cell_measurements.measured_rsrp\",\"Measured RSRP\",\"d\",\" dBm\"}"),
            HasSubstr("{l=\"Measured RSRP\",f={"), HasSubstr("},o=21,w=9,a=0.25,c=-140}"),
            HasSubstr("\n-- Time stamps ---")));
    EXPECT_EQ(listSections("dissector", "@SECTIONS@\n@RECORDS@\n@PART nothing.lua@\n").status, 1);
}

/// The classes that it asks print lines of their own, which are not part of the source.
TEST(ListSections, PrintsNothingButTheSource) {
    EXPECT_THAT(listSections("log-codes").output,
                AllOf(StartsWith("// Generated"), EndsWith("\n} // namespace velmora\n")));
}

TEST(ListSections, WantsOneOfItsTables) {
    for (const char* const words : {"", "log-code", "log-codes dissector"}) {
        const ShellOutcome outcome = listSections(words);
        EXPECT_EQ(outcome.status, 2) << words;
        EXPECT_EQ(outcome.output, "") << words;
    }
}

TEST(ListSections, FailsWhereItsOutputCannotBeWritten) {
    EXPECT_EQ(listSections("log-codes >/dev/full").status, 1);
}

} // namespace
} // namespace velmora
