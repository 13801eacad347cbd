// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Log/LineText.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(LineTextTest, FindsTheLogCodeOfALine) {
    struct Row {
        const char* line;
        const char* subject;
        const char* what;
    };
    const Row rows[] = {
        {"Received an unknown log message: 45249", " of 0xB0C1", "unknown log message"},
        {"Received an unknown log message: 16711681", " of 0xFF0001", "unknown log message"},
        {"Received an unknown log message: 7", " of 0x0007", "unknown log message"},
        {"Record 0x5137: 6 of 8 entries", " of 0x5137", "6 of 8 entries"},
        {"Log code 0x134f is 150 bytes long but must be at least 171 bytes.", " of 0x134F",
         "150 bytes long but must be at least 171 bytes."},
        {"Log code 0x119d: missing traffic demod subpacket.", " of 0x119D",
         "missing traffic demod subpacket."},
        {"Log code 0x108a has bad length of 107 bytes, but has 7 substructs (size=23).", " of 0x108A",
         "has bad length of 107 bytes, but has 7 substructs (size=23)."},
        // No code, or no line of these kinds.
        {"Invalid log type: 2. Dropping.", "", "Invalid log type: 2. Dropping."},
        {"Received an unknown log message: ", "", "Received an unknown log message: "},
        {"Received an unknown log message: 1 and more", "", "Received an unknown log message: 1 and more"},
        {"Record 0x", "", "Record 0x"},
        {"Record 0x12", "", "Record 0x12"},
        {"Record 0x99999999999: 1", "", "Record 0x99999999999: 1"},
        {"", "", ""},
    };
    for (const Row& row : rows) {
        const LineText line = parseLine(row.line);
        EXPECT_EQ(line.subject(), row.subject) << row.line;
        EXPECT_EQ(line.what, row.what);
    }
}

TEST(LineTextTest, LinesOfObjectsMadeAndDestroyedAreKnown) {
    for (const char* const line :
         {"Creating Ostrel_GSMLogGenerator object", "Creating OstrelLogGenerator2 object with 0x55b8e25ef5f0",
          "Created UTRANLogGenerator object", "Class Index: 1", "Initialized class index: 0x1, Self: 0x2",
          "LTELogGenerator is destructed 0x559cf6d3fdc0", " ***** Created ports (send=0x1, recv=0x2)",
          "Got log generated: 0x5599ef05f590", "Starting the display update timer"})
        EXPECT_TRUE(isLifecycleLine(line)) << line;
    for (const char* const line : {"Got log generated: (nil)", "Received an unknown log message: 1", "",
                                   "Cannot load template for display", " ***** INVALIDATED 0x1 *****"})
        EXPECT_FALSE(isLifecycleLine(line)) << line;
}

TEST(LineTextTest, NumbersAreReplaced) {
    std::string key = "3";
    appendWithoutNumbers(key, "12 of 8 entries, 0x12ab, 5");
    EXPECT_EQ(key, "3# of # entries, #x#ab, #");
}

} // namespace
} // namespace velmora
