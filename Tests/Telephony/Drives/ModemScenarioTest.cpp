// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemScenario.h"

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/Drives/ExpectedDrives.h"
#include "Tests/Telephony/Drives/ModemTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <string>

/// What the drive goes through. What its messages hold is in ModemMessagesTest.cpp.

namespace velmora {

using namespace std::chrono_literals;

ExpectedDrive expectedModemDrive() {
    ExpectedDrive drive{.name = "modem",
                        .length = 15min,
                        .round = 5min,
                        .leastRate = 2,
                        .mostRate = 4,
                        .codes = {LiveModemCode::sim, LiveModemCode::cells, LiveModemCode::contexts,
                                  LiveModemCode::registration, LiveModemCode::link, LiveModemCode::traffic,
                                  LiveModemCode::modem, LiveModemCode::position},
                        .good = [](const LogMessage& message) { return !modemRoot(message).isNone(); },
                        .trait = {}};
    drive.trait = [](const LogMessage& message) -> std::optional<unsigned> {
        const Value root = modemRoot(message);
        if (root.isNone() || !root.asDictionary()->contains(kVoxLinkSignalQuality))
            return std::nullopt;
        return static_cast<unsigned>(numberOf(*root.asDictionary(), kVoxLinkSignalQuality));
    };
    return drive;
}

namespace {

/// The radio technologies of the serving cells, or "none" where there is no cell.
std::string servingTechnologies(const ModemAccount& account) {
    std::string technologies;
    for (const Dictionary* cell : account.rows(kVoxCellMonitorCells)) {
        if (*(*cell)[kVoxCellMonitorCellType].asString() != kVoxCellMonitorCellTypeServing)
            continue;
        const std::string& name = *(*cell)[kVoxCellMonitorCellRadioAccessTechnology].asString();
        const std::size_t prefix = std::string_view("kVoxCellMonitorRadioAccessTechnology").size();
        technologies += (technologies.empty() ? "" : "+") + name.substr(prefix);
    }
    return technologies.empty() ? "none" : technologies;
}

/// When the second round begins: ModemManager is not running again.
double secondRound_s() {
    for (const ModemAccount& each : modemAccounts())
        if (each.at_s > 60 && each.number(kVoxModemPresence) == 2)
            return each.at_s;
    return 0;
}

/// What the messages of a code in the first round go through, without repetitions.
template <class Look>
std::vector<std::string> sequence(std::uint32_t code, Look look) {
    std::vector<std::string> all;
    const double until_s = secondRound_s();
    for (const ModemAccount& each : modemAccounts())
        if (each.code == code && each.at_s < until_s)
            if (const std::string now = look(each); all.empty() || all.back() != now)
                all.push_back(now);
    return all;
}

TEST(ModemScenario, goesThroughEveryRadioTechnology) {
    const std::vector<std::string> technologies = {"none", "GSM",  "UMTS", "LTE",  "LTE+NR", "NR",  "none",
                                                   "LTE",  "none", "LTE",  "none", "LTE",    "none"};
    EXPECT_EQ(sequence(LiveModemCode::cells, servingTechnologies), technologies);
}

TEST(ModemScenario, losesTheModemAndItsManager) {
    const auto presence = [](const ModemAccount& each) {
        return std::to_string(each.number(kVoxModemPresence));
    };
    // No manager, no permission, no modem, present; unplugged, present; no answer
    const std::vector<std::string> presences = {"2", "3", "4", "0", "4", "0", "6"};
    EXPECT_EQ(sequence(LiveModemCode::modem, presence), presences);
}

TEST(ModemScenario, registersAtHomeRoamsAndIsDenied) {
    std::set<std::int64_t> states;
    for (const ModemAccount& each : modemAccounts())
        if (each.code == LiveModemCode::registration && each.number(kVoxModemPresence) == 0)
            states.insert(each.number(kVoxRegistrationState));
    EXPECT_EQ(states, (std::set<std::int64_t>{0, 1, 2, 3, 5}));
}

TEST(ModemScenario, hasALockedSIMAndAFailedModem) {
    std::set<std::int64_t> states;
    for (const ModemAccount& each : modemAccounts()) {
        if (each.number(kVoxModemPresence) != 0)
            continue;
        const std::int64_t state = each.number(kVoxModemState);
        states.insert(state);
        EXPECT_EQ(each.number(kVoxModemLock, 0), state == 2 ? 2 : 0) << each.at_s;
        EXPECT_EQ(each.number(kVoxModemFailedReason, 0), state == -1 ? 2 : 0) << each.at_s;
    }
    EXPECT_EQ(states, (std::set<std::int64_t>{-1, 1, 2, 3, 5, 7, 8, 11}));
}

TEST(ModemScenario, changesTheSIMAndItsNetworkIsAtHomeThere) {
    std::set<std::string> sims;
    for (const ModemAccount& each : modemAccounts())
        if (each.code == LiveModemCode::sim && each[kSimFile_ICCID].asString()) {
            const std::int64_t active = [&] {
                for (const Dictionary* slot : each.rows(kVoxSIMSlots))
                    if (*(*slot)[kVoxSIMSlotIsActive].asBoolean())
                        return *(*slot)[kVoxSIMSlotNumber].asInteger();
                return std::int64_t{0};
            }();
            sims.insert(std::to_string(active) + " " + *each[kVoxSIMIMSI].asString() + " " +
                        *each[kVoxSIMOperatorCode].asString());
        }
    EXPECT_EQ(sims, (std::set<std::string>{"1 001010000000017 00101", "2 001020000000025 00102"}));
}

TEST(ModemScenario, theModemReturnsUnderAnotherNumber) {
    const auto index = [](const ModemAccount& each) { return std::to_string(each.number(kVoxModemIndex)); };
    const std::vector<std::string> indices = {"-100", "0", "-100", "1", "-100"};
    EXPECT_EQ(sequence(LiveModemCode::modem, index), indices);
}

TEST(ModemScenario, cellsAreNotReportedForEveryReason) {
    std::set<std::int64_t> reports;
    std::set<std::int64_t> neighborReports;
    for (const ModemAccount& each : modemAccounts())
        if (each.code == LiveModemCode::cells && each.number(kVoxModemPresence) == 0) {
            reports.insert(each.number(kVoxModemCellReport));
            neighborReports.insert(each.number(kVoxModemNeighborReport));
        }
    EXPECT_EQ(reports, (std::set<std::int64_t>{0, 2, 3, 4}));
    EXPECT_EQ(neighborReports, (std::set<std::int64_t>{-100, 0, 1}));
}

TEST(ModemScenario, everyKindOfUnusualMessageOccurs) {
    int truncated = 0;
    int wrongType = 0;
    int prefixed = 0;
    int unknownCode = 0;
    int unreasonable = 0;
    std::map<std::uint32_t, int> unreadable;
    for (const ScenarioEvent& event : driveOf<ModemScenario>(1, 20min)) {
        const auto message = LogMessage::parse(event.message.bytes());
        if (!message) {
            EXPECT_EQ(event.message.size(), 5U);
            ++truncated;
        } else if (message->type == 2) {
            ++wrongType;
        } else if (message->type == LogMessage::basebandType) {
            EXPECT_EQ(message->logCode(), 0x1375U);
            ++unknownCode;
        } else if (const Value root = modemRoot(*message); root.isNone()) {
            ++unreadable[message->logCode()];
        } else {
            prefixed += message->prefixed;
            unreasonable += (*root.asDictionary())[kVoxModemCellReport].asString() != nullptr;
        }
    }
    for (const int count : {truncated, wrongType, prefixed, unknownCode, unreasonable})
        EXPECT_GE(count, 8);
    EXPECT_EQ(codesOf(unreadable), expectedModemDrive().codes);
}

} // namespace
} // namespace velmora
