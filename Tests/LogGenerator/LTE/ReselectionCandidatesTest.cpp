// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ReselectionCandidatesList.h"
#include "LogGenerator/LTE/ReselectionCandidatesMisc.h"
#include "Tests/LogGenerator/LTE/BitFields.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A record with a count of `count` candidates, and what follows the header.
Data candidates(unsigned count, std::string_view bytes) {
    const std::uint8_t header[] = {0xEE,
                                   0xEE,
                                   0xEE,
                                   0xEE,
                                   0xEE,
                                   0xEE,
                                   static_cast<std::uint8_t>(count),
                                   static_cast<std::uint8_t>(count >> 8)};
    return joined(recordOf(0xB186, header), hex(bytes));
}

SectionHarness& update(SectionHarness& section, const Data& record) {
    return section.update(record, 0xB186);
}

TEST(ReselectionCandidatesMisc, ShowsTheHeader) {
    const Data header = record(0xB186, R"(
        01                              # version
        EE
        14 05                           # serving EARFCN: 1300
        F7 01                           # serving cell 503
        05 00                           # candidates, which the record need not hold
        99                              # longer than needed
    )");
    expectPrefixes(inDictionary<ReselectionCandidatesMisc>, header, 21, "Reselection Candidates",
                   "{Version '1', Serving EARFCN '1300', Serving Cell ID '503'}");
}

TEST(ReselectionCandidatesMisc, ReadsEveryFieldFromItsBits) {
    constexpr BitField fields[] = {
        {"Version", 13, 0, 8, "0", "1", "255"},
        {"Serving EARFCN", 15, 0, 16, "0", "1", "65535"},
        {"Serving Cell ID", 17, 0, 16, "0", "1", "65535"},
    };
    expectBitFields(fields, 21, [](Bytes bytes) {
        SectionHarness section = inDictionary<ReselectionCandidatesMisc>();
        section.update(recordOf(0xB186, bytes.subspan(13)));
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Reselection Candidates"}}));
        return section.node();
    });
}

struct RATCase {
    const char* name;
    const char* bytes;
    const char* expected;
};

TEST(ReselectionCandidatesList, ShowsEachRATType) {
    const RATCase cases[] = {
        {"LTE", "05 00   00 00   14 05   80 FB",
         // 0xFB80 >> 7
         "{Candidate Priority '5', Candidate RAT Type 'LTE', E ARFCN '1300', Cell ID '503'}"},
        {"UTRAN", "03 00   01 00   5C 29   FF 01",
         "{Candidate Priority '3', Candidate RAT Type 'UTRAN', U ARFCN '10588', PSC '511'}"},
        {"GERAN", "01 00   02 00   7C 00   01 3F",
         "{Candidate Priority '1', Candidate RAT Type 'GERAN', ARFCN '124', Band '1', BSIC ID '63'}"},
        {"CDMA 1x", "02 00   03 00   0A   EE EE EE   1B 01   A8 01",
         "{Candidate Priority '2', Candidate RAT Type 'CDMA1XRTT', Band '10', Channel '283', Pilot '424'}"},
        {"CDMA HRPD", "02 00   04 00   0A   EE EE EE   1B 01   A8 01",
         "{Candidate Priority '2', Candidate RAT Type 'CDMAHRPD', Band '10', Channel '283', Pilot '424'}"},
        {"5 is none", "07 00   05 00   14 05   80 FB", "{Candidate Priority '7', Candidate RAT Type '?\?'}"},
        {"7 is none", "07 00   07 00   14 05   80 FB", "{Candidate Priority '7', Candidate RAT Type '?\?'}"},
        {"the type has 16 bits", "07 00   00 01   14 05   80 FB",
         "{Candidate Priority '7', Candidate RAT Type '?\?'}"},
        {"all ones", "FF FF   FF FF   FF FF   FF FF",
         "{Candidate Priority '65535', Candidate RAT Type '?\?'}"},
        {"values are unsigned", "FF FF   01 00   FF FF   FF FF",
         "{Candidate Priority '65535', Candidate RAT Type 'UTRAN', U ARFCN '65535', PSC '65535'}"},
        {"bytes are unsigned", "00 80   02 00   00 80   80 FF",
         "{Candidate Priority '32768', Candidate RAT Type 'GERAN', ARFCN '32768', Band '128', "
         "BSIC ID '255'}"},
    };
    for (const RATCase& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = inArray<ReselectionCandidatesList>();
        const Array* array = section.value().asArray();
        update(section, candidates(1, c.bytes));
        EXPECT_EQ(section.node(), "[" + std::string(c.expected) + "]");
        EXPECT_EQ(section.value().asArray(), array);
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Reselection Candidates List"}}));
    }
}

/// One candidate of that type: what lies between its header and its fields, and the fields by their bits.
void expectDetails(std::uint8_t type, std::span<const BitField> fields, std::size_t length) {
    expectBitFields(fields, length, [type](Bytes bytes) {
        SectionHarness section = inArray<ReselectionCandidatesList>();
        const std::uint8_t header[] = {0, 0, type, 0};
        update(section, joined(candidates(1, ""), Data::copyOf(header), Data::copyOf(bytes)));
        EXPECT_EQ(section.value().asArray()->size(), 1u);
        const Dictionary& row = *(*section.value().asArray())[0].asDictionary();
        const DictionaryRef details = makeDictionary();
        for (const auto& [key, value] : row)
            if (!key.starts_with("Candidate "))
                details->set(key, value);
        return shown(details);
    });
}

TEST(ReselectionCandidatesList, ReadsEveryFieldFromItsBits) {
    // Offsets from the end of the candidate's header.
    constexpr BitField lte[] = {
        {"E ARFCN", 0, 0, 16, "0", "1", "65535"},
        {"Cell ID", 2, 7, 9, "0", "1", "511"},
    };
    expectDetails(0, lte, 4);
    constexpr BitField utran[] = {
        {"U ARFCN", 0, 0, 16, "0", "1", "65535"},
        {"PSC", 2, 0, 16, "0", "1", "65535"},
    };
    expectDetails(1, utran, 4);
    constexpr BitField geran[] = {
        {"ARFCN", 0, 0, 16, "0", "1", "65535"},
        {"Band", 2, 0, 8, "0", "1", "255"},
        {"BSIC ID", 3, 0, 8, "0", "1", "255"},
    };
    expectDetails(2, geran, 4);
    constexpr BitField cdma[] = {
        {"Band", 0, 0, 8, "0", "1", "255"},
        {"Channel", 4, 0, 16, "0", "1", "65535"},
        {"Pilot", 6, 0, 16, "0", "1", "65535"},
    };
    expectDetails(3, cdma, 8);
    expectDetails(4, cdma, 8);
}

TEST(ReselectionCandidatesList, FieldsLieWhereTheNextCandidatesHeaderDoes) {
    SectionHarness section = inArray<ReselectionCandidatesList>();
    update(section, candidates(2, R"(
        06 00   02 00                   # GERAN
        34 12   01 07                   # priority 4660, type 0x0701
    )"));
    EXPECT_EQ(section.node(),
              "[{Candidate Priority '6', Candidate RAT Type 'GERAN', ARFCN '4660', Band '1', BSIC ID '7'}, "
              "{Candidate Priority '4660', Candidate RAT Type '?\?'}]");
    EXPECT_THAT(section.errors(), IsEmpty());

    update(section, candidates(5, R"(
        01 00   00 00                   # LTE: what follows is its channel and cell
        02 00   01 00                   # UTRAN
        03 00   03 00                   # CDMA: band from the next, channel and pilot from the one after
        04 00   02 00                   # GERAN
        05 00   00 00                   # LTE
        14 05   80 FB                   # the last one's channel and cell
    )"));
    EXPECT_EQ(section.node(),
              "[{Candidate Priority '1', Candidate RAT Type 'LTE', E ARFCN '2', Cell ID '0'}, "
              "{Candidate Priority '2', Candidate RAT Type 'UTRAN', U ARFCN '3', PSC '3'}, "
              "{Candidate Priority '3', Candidate RAT Type 'CDMA1XRTT', Band '4', Channel '5', Pilot '0'}, "
              "{Candidate Priority '4', Candidate RAT Type 'GERAN', ARFCN '5', Band '0', BSIC ID '0'}, "
              "{Candidate Priority '5', Candidate RAT Type 'LTE', E ARFCN '1300', Cell ID '503'}]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

struct EndCase {
    const char* name;
    unsigned count;
    const char* bytes;
    std::size_t shown;
};

TEST(ReselectionCandidatesList, EndsBeforeTheFirstIncompleteCandidate) {
    const EndCase cases[] = {
        {"nothing", 1, "", 0},
        {"a header less a byte", 1, "01 00 05", 0},
        {"a header is all of a type without fields", 1, "01 00 05 00", 1},
        {"the header of LTE alone", 1, "01 00 00 00", 0},
        {"LTE less a byte", 1, "01 00 00 00 14 05 80", 0},
        {"LTE", 1, "01 00 00 00 14 05 80 FB", 1},
        {"UTRAN less a byte", 1, "01 00 01 00 14 05 80", 0},
        {"UTRAN", 1, "01 00 01 00 14 05 80 FB", 1},
        {"GERAN less a byte", 1, "01 00 02 00 14 05 80", 0},
        {"GERAN", 1, "01 00 02 00 14 05 80 FB", 1},
        {"CDMA 1x less a byte", 1, "01 00 03 00 14 05 80 FB 00 00 00", 0},
        {"CDMA 1x", 1, "01 00 03 00 14 05 80 FB 00 00 00 00", 1},
        {"CDMA HRPD less a byte", 1, "01 00 04 00 14 05 80 FB 00 00 00", 0},
        {"CDMA HRPD", 1, "01 00 04 00 14 05 80 FB 00 00 00 00", 1},
        {"the second is cut", 2, "01 00 05 00   01 00 00 00   14 05 80", 1},
        {"a whole one behind one that is not is left out", 2, "01 00 03 00   01 00 05 00", 0},
        {"the rest of many", 255, "01 00 05 00   01 00 06 00   01 00 00 00", 2},
    };
    for (const EndCase& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = inArray<ReselectionCandidatesList>();
        update(section, candidates(c.count, c.bytes));
        EXPECT_EQ(section.value().asArray()->size(), c.shown);
        EXPECT_EQ(section.node().find("earlier"), std::string::npos);
        if (c.shown == c.count)
            EXPECT_THAT(section.errors(), IsEmpty());
        else
            EXPECT_THAT(section.errors(), ElementsAre("Record 0xB186: " + std::to_string(c.shown) + " of " +
                                                      std::to_string(c.count) + " entries"));
    }
}

TEST(ReselectionCandidatesList, EveryPrefix) {
    const Data three = candidates(3, R"(
        01 00   00 00                   # LTE: to byte 29
        02 00   05 00                   # ??: to byte 29
        03 00   04 00                   # CDMA: to byte 41
        04 00   00 00   05 00   06 00
    )");
    ASSERT_EQ(three.size(), 41u);
    expectPrefixes(inArray<ReselectionCandidatesList>, recordOf(0xB186, three.bytes().subspan(13)), 21,
                   "Reselection Candidates List", [](std::size_t length) {
                       std::string list;
                       if (length >= 29)
                           list.append("{Candidate Priority '1', Candidate RAT Type 'LTE', E ARFCN '2', "
                                       "Cell ID '0'}, {Candidate Priority '2', Candidate RAT Type '?\?'}");
                       if (length >= 41)
                           list.append(", {Candidate Priority '3', Candidate RAT Type 'CDMAHRPD', "
                                       "Band '4', Channel '5', Pilot '6'}");
                       return "[" + list + "]";
                   });
}

TEST(ReselectionCandidatesList, OnlyTheCountsLowByteCounts) {
    SectionHarness section = inArray<ReselectionCandidatesList>();
    update(section, candidates(1, "01 00 05 00"));
    EXPECT_EQ(section.value().asArray()->size(), 1u);
    update(section, candidates(256, "01 00 05 00"));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Reselection Candidates List"}}));
    update(section, candidates(257, "01 00 05 00"));
    EXPECT_EQ(section.node(), "[{Candidate Priority '1', Candidate RAT Type '?\?'}]");
    EXPECT_THAT(section.errors(), IsEmpty());
    update(section, candidates(0xFF00, "01 00 05 00"));
    EXPECT_EQ(section.node(), "[]");
    update(section, candidates(0, ""));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(ReselectionCandidatesList, AllThatTheCountCanSay) {
    SectionHarness section = inArray<ReselectionCandidatesList>();
    std::vector<std::uint8_t> headers(255 * 4, 9);
    update(section, joined(candidates(255, ""), Data(std::move(headers))));
    EXPECT_EQ(section.value().asArray()->size(), 255u);
    EXPECT_THAT(section.errors(), IsEmpty());
}

} // namespace

} // namespace velmora
