// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"
#include "LogGenerator/UTRAN/TRCHBLERMeasurement.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

#include <algorithm>

/// "TRCH BLER" and "CCTRCH SIR", which read the same records.

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto makeBLER = inArray<TRCHBLERMeasurement>;
const auto makeSIR = inArray<CCTRCHSIRMeasurement>;

/// A 0xD00C record of `length` bytes: the 16 bits at 14, then `parts`, each from its offset on.
struct Part {
    std::size_t offset;
    const char* bytes;
};
Data quality(std::uint16_t counts, std::size_t length, std::initializer_list<Part> parts = {}) {
    std::vector<std::uint8_t> payload(length - 13, 0xFF); // ones where nothing is read
    payload[14 - 13] = static_cast<std::uint8_t>(counts);
    payload[15 - 13] = static_cast<std::uint8_t>(counts >> 8);
    for (const Part& part : parts) {
        const Data bytes = hex(part.bytes);
        std::copy(bytes.bytes().begin(), bytes.bytes().end(),
                  payload.begin() + static_cast<std::ptrdiff_t>(part.offset - 13));
    }
    return recordOf(0xD00C, payload);
}

/// Two transport channels in bits 6 to 11, three composite ones in 12 to 15, ones in the bits below. The
/// composite ones lie at 289 + 34 * 2 = 357.
const Data full = quality(0x30BF, 357 + 3 * 8,
                          {{17, R"(
                               01 3F                   # channel 1: 63
                               FF 80                   # channel 255: 128
                           )"},
                           {357, R"(
                               00 06 01 02 03 04 05 06 # channel 0, six slots
                               07 01 FF 00 00 00 00 00 # channel 7, one
                               FF FF 80 7F 00 FF 10 20
                           )"}});

constexpr const char* blerRows[] = {
    "{TRCH ID '1', TRCH BLER Measurement '63'}",
    "{TRCH ID '255', TRCH BLER Measurement '128'}",
};
constexpr const char* sirRows[] = {
    "{CCTRCH ID '0', TSNUM '6', SIR ['1', '2', '3', '4', '5', '6']}",
    "{CCTRCH ID '7', TSNUM '1', SIR ['255', '0', '0', '0', '0', '0']}",
    "{CCTRCH ID '255', TSNUM '255', SIR ['128', '127', '0', '255', '16', '32']}",
};

template <std::size_t N>
std::string first(const char* const (&rows)[N], std::size_t count) {
    std::string result;
    for (std::size_t i = 0; i < std::min(count, N); ++i) {
        result += i == 0 ? "" : ", ";
        result += rows[i];
    }
    return "[" + result + "]";
}

TEST(TRCHBLERMeasurement, ShowsTheChannels) {
    SectionHarness section = makeBLER();
    section.update(full);
    EXPECT_EQ(section.node(), first(blerRows, 2));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Notice, "TRCH BLER Measurement"}}));
}

TEST(TRCHBLERMeasurement, ShowsTheEntriesThatLieWhollyInside) {
    for (std::size_t length = 0; length <= full.size(); ++length) {
        SCOPED_TRACE("a record cut to " + std::to_string(length) + " bytes");
        SectionHarness section = makeBLER();
        section.update(prefixOf(full, length), 0xD00C);
        if (length < 17) {
            EXPECT_EQ(section.node(), "['earlier']");
            EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Notice, "TRCH BLER Measurement"}}));
            continue;
        }
        const std::size_t whole = std::min<std::size_t>(2, (length - 17) / 2);
        EXPECT_EQ(section.node(), first(blerRows, whole));
        std::vector<std::string> errors;
        if (whole < 2)
            errors.push_back("Record 0xD00C: " + std::to_string(whole) + " of 2 entries");
        EXPECT_EQ(section.errors(), errors);
    }
}

TEST(TRCHBLERMeasurement, TheCountIsBits6To11) {
    struct Case {
        std::uint16_t counts;
        std::size_t channels;
    };
    for (const Case& c :
         {Case{0x0000, 0}, {0x003F, 0}, {0x0040, 1}, {0x0800, 32}, {0x0FC0, 63}, {0xF03F, 0}, {0xFFFF, 63}}) {
        SectionHarness section = makeBLER();
        section.update(quality(c.counts, 17 + 2 * 63));
        EXPECT_EQ(section.value().asArray()->size(), c.channels) << c.counts;
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

TEST(CCTRCHSIRMeasurement, ShowsTheChannels) {
    SectionHarness section = makeSIR();
    section.update(full);
    EXPECT_EQ(section.node(), first(sirRows, 3));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "CCTRCH SIR Measurement"}}));
}

TEST(CCTRCHSIRMeasurement, ShowsTheEntriesThatLieWhollyInside) {
    expectPrefixes(makeSIR, full, 17, "CCTRCH SIR Measurement",
                   [](std::size_t length) { return first(sirRows, length < 357 ? 0 : (length - 357) / 8); });
    SectionHarness section = makeSIR();
    section.update(prefixOf(full, full.size() - 1));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00C: 2 of 3 entries"));
    section.update(prefixOf(full, 17));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00C: 0 of 3 entries"));
}

TEST(CCTRCHSIRMeasurement, EachTransportChannelMovesTheEntriesBy34Bytes) {
    struct Case {
        std::uint16_t counts; ///< one composite channel each
        std::size_t offset;
    };
    for (const Case& c : {Case{0x1000, 289}, {0x1040, 323}, {0x1080, 357}, {0x1FC0, 2431}}) {
        SCOPED_TRACE(c.offset);
        const Data record = quality(c.counts, c.offset + 8, {{c.offset, "00 06 01 02 03 04 05 06"}});
        SectionHarness section = makeSIR();
        section.update(record);
        EXPECT_EQ(section.node(), first(sirRows, 1));
        EXPECT_THAT(section.errors(), IsEmpty());
        section.update(prefixOf(record, c.offset + 7));
        EXPECT_EQ(section.node(), "[]");
        EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00C: 0 of 1 entries"));
    }
}

TEST(CCTRCHSIRMeasurement, TheCountIsTheUpperFourBits) {
    struct Case {
        std::uint16_t counts;
        std::size_t channels;
    };
    for (const Case& c :
         {Case{0x0000, 0}, {0x0FFF, 0}, {0x1000, 1}, {0x8000, 8}, {0xF000, 15}, {0xFFFF, 15}}) {
        SectionHarness section = makeSIR();
        section.update(quality(c.counts, 2431 + 8 * 15));
        EXPECT_EQ(section.value().asArray()->size(), c.channels) << c.counts;
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

TEST(ChannelQuality, CountsOfZeroEmptyBothLists) {
    for (const auto& make : {makeBLER, makeSIR}) {
        SectionHarness section = make();
        const ArrayRef node = section.value().arrayRef();
        section.update(quality(0, 17));
        EXPECT_TRUE(node->empty());
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

} // namespace

} // namespace velmora
