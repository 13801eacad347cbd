// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/Samples/SamplesFixture.h"

#include <gmock/gmock.h>

// `decode --samples --wide`: a row for each message, a column for each leaf.

namespace velmora {
namespace {

using testing::ElementsAre;

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

class WideSamplesTest : public SamplesTest {
protected:
    std::vector<std::string> wide(std::vector<std::string> arguments,
                                  std::optional<std::string> input = std::nullopt) {
        arguments.insert(arguments.begin(), {"--wide", "--format", "csv"});
        return lines(samples(std::move(arguments), std::move(input)));
    }
    [[nodiscard]] static std::string wideOfRecording(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"--wide", "--format", "csv"});
        return samplesOfRecording(std::move(arguments));
    }
    /// The record and the value of each row with a value, by the column's title.
    static std::vector<std::string> valuesOf(const std::string& csv, const std::string& title) {
        const auto rows = table(csv);
        const auto columnOf = [&rows](const std::string& name) {
            return static_cast<std::size_t>(std::find(rows[0].begin(), rows[0].end(), name) -
                                            rows[0].begin());
        };
        const std::size_t record = columnOf("record");
        const std::size_t column = columnOf(title);
        std::vector<std::string> values;
        for (std::size_t i = 1; i < rows.size(); ++i)
            if (!rows[i].at(column).empty())
                values.push_back(rows[i][record] + " " + rows[i][column]);
        return values;
    }
};

TEST_F(WideSamplesTest, ColumnsAreLeavesWithTheirUnits) {
    EXPECT_EQ(lines(wideOfRecording({"--select", "level=/GSM/GSM Serving Cell/RSSI", "--select",
                                     "/GSM/GSM Serving Cell/ARFCN", "--select",
                                     "/GSM/Neighboring Cells/*/RSSI", recording("gsm")}))[0],
              "time,modem_time,code,record,row,level (dBm),/GSM/GSM Serving Cell/ARFCN,"
              "/GSM/Neighboring Cells/*/RSSI (dBm)");
    // A name of several leaves precedes theirs.
    EXPECT_EQ(
        lines(wideOfRecording({"--select", "m=/Serving Cell/Serving Cell Measurements/*", "--select",
                               "pci=/Serving Cell/Serving Cell Info/Physical Cell ID", recording("lte")}))[0]
            .substr(0, 46),
        "time,modem_time,code,record,m/Version,m/E-ARFC");
}

TEST_F(WideSamplesTest, LeavesOfTheSameNameHaveTheirPathsInTheTitle) {
    EXPECT_EQ(lines(wideOfRecording({"--select", "state=/Registration/*/MM State", recording("gsm")}))[0],
              "time,modem_time,code,record,state/Registration/Process CS/MM State,"
              "state/Registration/Process PS/MM State,state/Registration/Process CO/MM State");
}

TEST_F(WideSamplesTest, EachMessageThatReportedAValueHasARow) {
    writeDrive("a.pcapng");
    const std::vector<std::string> select = {"--select", "/GSM RR Info/RR State",
                                             "--select", "status=/GSM RR Info/RR Status",
                                             "--select", "/SIM Info/EF-LOCI"};
    std::vector<std::string> arguments = select;
    arguments.push_back(path("a.pcapng"));
    const std::vector<std::string> expected = {
        "time,modem_time,code,record,/GSM RR Info/RR State,status,/SIM Info/EF-LOCI",
        "2026-11-16T05:00:00.000000000Z,1980-01-06T00:00:00.000000000Z,0x512C,1,4,1,",
        "2026-11-16T05:00:02.000000000Z,1980-01-06T00:00:00.000000000Z,0x512C,3,5,1,"};
    EXPECT_EQ(wide(arguments), expected);
    arguments.back() = "-";
    EXPECT_EQ(wide(arguments, contentOf("a.pcapng")), expected);
}

TEST_F(WideSamplesTest, TwoSelectionsOfALeafAreTwoColumns) {
    writeDrive("a.pcapng");
    EXPECT_THAT(wide({"--select", "a=/GSM RR Info/RR State", "--select", "b=/GSM RR Info/RR State",
                      path("a.pcapng"), "--to", "+1"}),
                ElementsAre("time,modem_time,code,record,a,b",
                            "2026-11-16T05:00:00.000000000Z,1980-01-06T00:00:00.000000000Z,0x512C,1,4,4"));
}

TEST_F(WideSamplesTest, TechnologiesShareTheTable) {
    write("both.pcapng", both());
    EXPECT_THAT(wide({"--select", "/GSM RR Info/RR State", "--select", "band=/Band", path("both.pcapng")}),
                ElementsAre("time,technology,modem_time,code,record,row,/GSM RR Info/RR State,band",
                            "2026-11-16T05:00:00.000000000Z,Ostrel_GSM,1980-01-06T00:00:00.000000000Z,0x512C,"
                            "1,,4,",
                            "2026-11-16T05:00:00.500000000Z,IFX,,,2,,,GSM 900",
                            "2026-11-16T05:00:02.100000000Z,Ostrel_GSM,1980-01-06T00:00:00.000000000Z,0x512C,"
                            "3,,5,",
                            "2026-11-16T05:00:07.000000000Z,IFX,,,4,,,GSM 1800"));
}

// No table lists what is in such a tree, so that the columns have no units.
TEST_F(WideSamplesTest, RowsOfAListFollowTheOtherValues) {
    const ArrayRef cells = makeArray();
    cells->append(dictionary({{"Channel", "17"}, {"Level", "-80 dBm"}}));
    cells->append(dictionary({{"Channel", "18"}, {"Band", "GSM 900"}}));
    cells->append(dictionary({{"Channel", "19"}, {"Level", "-90.5 dBm"}}));
    writeRecording(
        "i.pcapng", "IFX",
        {{at(0), serialized(dictionary({{"Own", dictionary({{"Level", "-71 dBm"}, {"Channel", "16"}})},
                                        {"Others", cells},
                                        {"Name", "x"}}))}});
    const std::string begin = "2026-11-16T05:00:00.000000000Z,,,1,";
    EXPECT_THAT(wide({"--select", "level=/Own/Level", "--select", "/Others/*/Level", "--select",
                      "second=/Others/1/Channel", path("i.pcapng")}),
                ElementsAre("time,modem_time,code,record,row,level,/Others/*/Level,second", begin + ",-71,,",
                            begin + "0,,-80,", begin + "1,,,18", begin + "2,,-90.5,"));
}

struct Written {
    const char* recording;
    const char* path;
    const char* title;
    std::vector<std::string> from; ///< where record-values.py finds the values
};

class WrittenValuesTest : public WideSamplesTest, public testing::WithParamInterface<Written> {};

TEST_P(WrittenValuesTest, AreAsManyAsTheRecordsThatWroteThem) {
    std::vector<std::string> arguments = GetParam().from;
    arguments.insert(arguments.begin(), recording(GetParam().recording));
    const std::vector<std::string> expected = recordValues(arguments);
    const std::vector<std::string> values = valuesOf(
        wideOfRecording({"--select", GetParam().path, recording(GetParam().recording)}), GetParam().title);
    ASSERT_GT(expected.size(), 10U);
    ASSERT_EQ(values.size(), expected.size());
    for (std::size_t i = 0; i < values.size(); ++i)
        EXPECT_EQ(values[i].substr(0, values[i].find(' ')), expected[i].substr(0, expected[i].find(' ')));
}

const Written written[] = {
    {"gsm", "/GSM/GSM RR Info/RR State", "/GSM/GSM RR Info/RR State", {"0x512C"}},
    {"gsm", "/GSM/GSM RR Info/DTX Used", "/GSM/GSM RR Info/DTX Used", {"0x5072"}},
    {"gsm", "level=/GSM/GSM Serving Cell/RSSI", "level (dBm)", {"0x5137"}},
    {"gsm", "cs=/Registration/Process CS/MM State", "cs", {"0x7131"}},
    {"lte", "pci=/Serving Cell/Serving Cell Measurements/Physical Cell ID", "pci", {"0xB17F"}},
    {"utran", "state=/Serving Cell/RRC Info/State", "state", {"0xD0E0"}},
    // A record of another type is reported, and decoded.
    {"c2k", "band=/EV-DO/Band Class", "band", {"0x1183:any"}},
    {"ifx", "level=/Serving Cell/RxLev", "level (dBm)", {"Serving Cell", "RxLev"}},
};
INSTANTIATE_TEST_SUITE_P(, WrittenValuesTest, testing::ValuesIn(written), [](const auto& tested) {
    return std::string(tested.param.recording) + std::to_string(tested.index);
});

TEST_F(WideSamplesTest, StatesAreTheBytesOfTheirRecords) {
    EXPECT_EQ(
        valuesOf(wideOfRecording({"--select", "state=/GSM/GSM RR Info/RR State", recording("gsm")}), "state"),
        recordValues({recording("gsm"), "0x512C", "13"}));
}

} // namespace
} // namespace velmora
