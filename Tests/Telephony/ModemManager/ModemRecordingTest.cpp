// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemRecordingFixture.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <map>
#include <set>
#include <string>
#include <vector>

/// A recording of a live modem over changes of its technology, its presence and its SIM, decoded to samples.

namespace velmora {
namespace {

using nlohmann::json;
using ::testing::Contains;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

/// Values with their units by role; of a list, those of its first row.
using Roles = std::map<std::string, std::string>;

// What the mock says of each cell, by hand: identities are hexadecimal there; GSM's levels count from -111
// dBm.
const Roles onLTE{
    {"serving.mcc", "001"},
    {"serving.mnc", "01"},
    {"serving.area", "33997"},
    {"serving.cell", "27447299"},
    {"serving.physical-cell", "416"},
    {"serving.channel", "1300"},
    {"serving.level", "-101 dBm"},
    {"serving.quality", "-9.5 dB"},
    {"neighbour.physical-cell", "411"},
    {"neighbour.channel", "6300"},
    {"neighbour.level", "-110.5 dBm"},
};
const Roles onUMTS{
    {"serving.mcc", "001"},
    {"serving.mnc", "01"},
    {"serving.area", "4101"},
    {"serving.cell", "13828438"},
    {"serving.physical-cell", "256"},
    {"serving.channel", "10700"},
    {"serving.level", "-80.4 dBm"},
    {"serving.quality", "-6.5 dB"},
    {"neighbour.physical-cell", "63"},
    {"neighbour.channel", "62"},
    {"neighbour.level", "-71 dBm"},
};
const Roles onNR{
    {"serving.mcc", "001"},
    {"serving.mnc", "01"},
    {"serving.area", "65541"},
    {"serving.cell", "46118400291"},
    {"serving.physical-cell", "1007"},
    {"serving.channel", "431000"},
    {"serving.level", "-88.5 dBm"},
    {"serving.quality", "-10.5 dB"},
};
const Roles onGSM{
    {"serving.mcc", "001"},       {"serving.mnc", "02"},      {"serving.area", "2000"},
    {"serving.cell", "20000"},    {"serving.channel", "512"}, {"serving.physical-cell", "7"},
    {"serving.level", "-61 dBm"},
};

/// The roles of each message of that code, without repetitions.
std::vector<Roles> accountsOf(const std::vector<json>& samples, std::uint32_t code,
                              const std::map<std::string, std::string>& roles,
                              std::string (*text)(const json&)) {
    std::map<std::int64_t, Roles> byRecord;
    for (const json& sample : samples) {
        if (sample["code"] != code)
            continue;
        Roles& account = byRecord[sample["record"]];
        if (const auto role = roles.find(sample["path"]); role != roles.end())
            account[role->second] = text(sample);
    }
    std::vector<Roles> accounts;
    for (const auto& [record, account] : byRecord)
        if (accounts.empty() || accounts.back() != account)
            accounts.push_back(account);
    return accounts;
}

using ModemRecordingTest = ModemRecordingFixture;

TEST_F(ModemRecordingTest, samplesHaveTheCellsOfEachPhaseAndNoOlderOnes) {
    ASSERT_NO_FATAL_FAILURE(record());
    const std::vector<json> all = samples();

    // Every message about the cells has the whole of one phase, or nothing.
    EXPECT_THAT(accountsOf(all, LiveModemCode::cells, rolesOfPaths(), textOf),
                ::testing::ElementsAre(IsEmpty(), onLTE, onUMTS, onNR, IsEmpty(), onGSM));

    // The state says why there is nothing. What it is for less than a poll depends on which answer is faster.
    const std::set<std::string> passing{"Cells not reported yet", "Searching"};
    std::vector<std::string> states;
    std::map<std::string, std::vector<std::string>> values;
    bool hasGone = false;
    std::map<std::uint32_t, bool> isAbsent;
    for (const json& sample : all) {
        EXPECT_FALSE(sample.contains("technology")) << "there is but one";
        const std::string path = sample["path"];
        const std::string value = textOf(sample);
        const std::uint32_t code = sample["code"];
        if (path == "/Serving Cell/State" && !passing.contains(value) &&
            (states.empty() || states.back() != value))
            states.push_back(value);
        values[path].push_back(value);
        // From the message on that says that the first modem has gone, nothing is of that modem.
        hasGone |= !values["/SIM/ICCID"].empty();
        isAbsent[code] |= hasGone && value == "No modem";
        if (!isAbsent[code])
            continue;
        for (const char* mark : {"111", "Elder", "elder", "46118400291"})
            EXPECT_THAT(value, Not(HasSubstr(mark))) << sample;
    }
    EXPECT_THAT(isAbsent, ::testing::Each(::testing::Pair(::testing::_, true)));
    EXPECT_EQ(isAbsent.size(), 8U) << "codes";
    EXPECT_THAT(states, ::testing::ElementsAre("No modem", "Registered", "Searching, no serving cell",
                                               "No modem", "Registered"));
    // Of the levels each technology's are gone when the next one's are there.
    EXPECT_THAT(values["/Link/LTE RSRP"], Contains("-101 dBm"));
    EXPECT_THAT(values["/Link/UMTS RSCP"], Contains("-80.4 dBm"));
    EXPECT_THAT(values["/Link/NR RSRP"], Contains("-88.5 dBm"));
    std::vector<std::string> levels;
    for (const json& sample : all) {
        const std::string path = sample["path"];
        const bool isLevel = path == "/Link/LTE RSRP" || path == "/Link/UMTS RSCP" || path == "/Link/NR RSRP";
        if (isLevel && (levels.empty() || levels.back() != path))
            levels.push_back(path);
    }
    EXPECT_THAT(levels, ::testing::ElementsAre("/Link/LTE RSRP", "/Link/UMTS RSCP", "/Link/NR RSRP"));
    EXPECT_THAT(values["/SIM/ICCID"],
                ::testing::IsSupersetOf({"89111010000000000011", "89011020000000000025"}));
    EXPECT_THAT(values["/SIM/ICCID"].back(), "89011020000000000025");

    // The display in the end is that of the other modem alone.
    const std::string text = run({"decode", "--format", "json", recording});
    const json decoded = json::parse(text);
    EXPECT_EQ(decoded["technology"], "Modem");
    EXPECT_EQ(decoded["display"]["Serving Cell"]["ARFCN"], "512");
    EXPECT_EQ(decoded["display"]["Modem"]["Manufacturer"], "Younger");
    for (const char* mark : {"111", "Elder", "elder", "RSRP", "RSCP", "27447299", "13828438", "46118400291"})
        EXPECT_THAT(text, Not(HasSubstr(mark)));
}

} // namespace
} // namespace velmora
