// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Tests/Telephony/Drives/ModemTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <string>

/// What the messages of the modem's drive hold, and that they agree with each other.

namespace velmora {
namespace {

TEST(ModemMessages, everyOneSaysWhetherThereIsAModem) {
    for (const ModemAccount& each : modemAccounts()) {
        ASSERT_TRUE(each[kVoxModemPresence].asInteger()) << each.at_s;
        const bool isPresent = each.number(kVoxModemPresence) == 0;
        EXPECT_EQ(each[kVoxModemState].asInteger() != nullptr, isPresent) << each.at_s;
        if (isPresent)
            continue;
        // Of a modem that is not there, nothing is known.
        const std::size_t known = each.root.asDictionary()->contains(kVoxModemReason) ? 2 : 1;
        EXPECT_EQ(each.root.asDictionary()->size(), known) << each.at_s;
    }
}

bool isServing(const Dictionary& cell) {
    return *cell[kVoxCellMonitorCellType].asString() == kVoxCellMonitorCellTypeServing;
}

double levelOf(const Dictionary& cell) {
    for (const std::string_view key : {kVoxCellMonitorRSRP, kVoxCellMonitorRSCP, kVoxCellMonitorRSSI})
        if (const double level = numberOf(cell, key); !std::isnan(level))
            return level;
    return std::nan("");
}

TEST(ModemMessages, servingCellsComeFirstAndNeighborsByFallingLevel) {
    int messages = 0;
    for (const ModemAccount& each : modemAccounts()) {
        const auto cells = each.rows(kVoxCellMonitorCells);
        messages += cells.size() > 4;
        for (std::size_t i = 1; i < cells.size(); ++i) {
            EXPECT_GE(isServing(*cells[i - 1]), isServing(*cells[i])) << each.at_s;
            if (!isServing(*cells[i - 1])) {
                EXPECT_GE(levelOf(*cells[i - 1]), levelOf(*cells[i])) << each.at_s;
            }
        }
    }
    EXPECT_GT(messages, 100);
}

TEST(ModemMessages, theCellOfNRBesideLTEHasNoIdentity) {
    int messages = 0;
    for (const ModemAccount& each : modemAccounts()) {
        const auto cells = each.rows(kVoxCellMonitorCells);
        if (cells.size() < 2 || !isServing(*cells[1]))
            continue;
        ++messages;
        EXPECT_TRUE(cells[0]->contains(kVoxCellMonitorEARFCN));
        EXPECT_TRUE(cells[1]->contains(kVoxCellMonitorNRARFCN));
        EXPECT_FALSE(cells[1]->contains(kVoxCellMonitorCellId));
        EXPECT_FALSE(cells[1]->contains(kVoxCellMonitorTAC));
    }
    EXPECT_GT(messages, 20);
}

TEST(ModemMessages, aPlaceHasNoMeasurement) {
    int places = 0;
    for (const ModemAccount& each : modemAccounts())
        for (const Dictionary* cell : each.rows(kVoxCellMonitorCells))
            if (cell->contains(kVoxCellMonitorIsPlace)) {
                ++places;
                EXPECT_TRUE(std::isnan(levelOf(*cell)));
                EXPECT_FALSE(cell->contains(kVoxCellMonitorUARFCN));
                EXPECT_TRUE(cell->contains(kVoxCellMonitorCellId));
            }
    EXPECT_GT(places, 5);
}

TEST(ModemMessages, theLinkHasTheLevelsOfTheServingCells) {
    int compared = 0;
    std::vector<const Dictionary*> cells;
    double at_s = 0;
    for (const ModemAccount& each : modemAccounts()) {
        if (each.code == LiveModemCode::cells) {
            cells = each.rows(kVoxCellMonitorCells);
            at_s = each.at_s;
        }
        const auto levels = each[kVoxLinkNR].asDictionary();
        // Both of the same step, in which the measurement does not change.
        if (!levels || each.at_s - at_s > 0.1)
            continue;
        for (const Dictionary* cell : cells)
            if (isServing(*cell) && cell->contains(kVoxCellMonitorNRARFCN)) {
                EXPECT_EQ(numberOf(*levels, kVoxLinkRSRP), numberOf(*cell, kVoxCellMonitorRSRP)) << each.at_s;
                EXPECT_EQ(numberOf(*levels, kVoxLinkSINR), numberOf(*cell, kVoxCellMonitorSINR)) << each.at_s;
                ++compared;
            }
    }
    EXPECT_GT(compared, 100);
}

/// The earlier answer that a row of traffic counts from; null where there is none.
const Dictionary* answerAt(double at_s, std::int64_t bearer) {
    for (const ModemAccount& each : modemAccounts())
        if (each.code == LiveModemCode::traffic && std::abs(each.at_s - at_s) < 1e-6)
            for (const Dictionary* row : each.rows(kVoxTraffic))
                if (*(*row)[kVoxTrafficBearer].asInteger() == bearer)
                    return row;
    return nullptr;
}

TEST(ModemMessages, ratesAreTheCountersDifferencesOverTheInterval) {
    int rates = 0;
    int firstAnswers = 0;
    for (const ModemAccount& each : modemAccounts())
        for (const Dictionary* row : each.rows(kVoxTraffic)) {
            if (!row->contains(kVoxTrafficDownlinkRate)) {
                EXPECT_FALSE(row->contains(kVoxTrafficInterval));
                ++firstAnswers;
                continue;
            }
            const double interval_s = numberOf(*row, kVoxTrafficInterval);
            const Dictionary* earlier =
                answerAt(each.at_s - interval_s, *(*row)[kVoxTrafficBearer].asInteger());
            ASSERT_TRUE(earlier) << each.at_s;
            for (const auto& [counter, rate] : {std::pair(kVoxTrafficReceived, kVoxTrafficDownlinkRate),
                                                std::pair(kVoxTrafficSent, kVoxTrafficUplinkRate)})
                EXPECT_NEAR(numberOf(*row, rate),
                            8 * (numberOf(*row, counter) - numberOf(*earlier, counter)) / interval_s, 1e-3)
                    << each.at_s;
            EXPECT_GE(numberOf(*row, kVoxTrafficDownlinkRate), 0);
            ++rates;
        }
    EXPECT_GT(rates, 300);
    EXPECT_GT(firstAnswers, 10);
}

TEST(ModemMessages, everyConnectionCountsFromZero) {
    int connections = 0;
    for (const ModemAccount& each : modemAccounts())
        for (const Dictionary* row : each.rows(kVoxTraffic))
            if (numberOf(*row, kVoxTrafficDuration) == 0) {
                EXPECT_LT(numberOf(*row, kVoxTrafficReceived), 50e6);
                ++connections;
            }
    EXPECT_GT(connections, 10);
}

TEST(ModemMessages, trafficIsOfTheContextsThatAreConnected) {
    std::vector<std::int64_t> connected;
    for (const ModemAccount& each : modemAccounts()) {
        if (each.code == LiveModemCode::contexts) {
            connected.clear();
            for (const Dictionary* row : each.rows(kVoxContexts))
                if (*(*row)[kVoxContextIsConnected].asBoolean())
                    connected.push_back(*(*row)[kVoxContextBearer].asInteger());
        }
        if (each.code != LiveModemCode::traffic)
            continue;
        std::vector<std::int64_t> counted;
        for (const Dictionary* row : each.rows(kVoxTraffic))
            counted.push_back(*(*row)[kVoxTrafficBearer].asInteger());
        EXPECT_EQ(counted, connected) << each.at_s;
    }
}

TEST(ModemMessages, addressesAreThoseOfDocuments) {
    int addresses = 0;
    for (const ModemAccount& each : modemAccounts())
        for (const Dictionary* row : each.rows(kVoxContexts))
            for (const std::string_view version : {kVoxContextIPv4, kVoxContextIPv6})
                if (const Dictionary* settings = (*row)[version].asDictionary()) {
                    const std::string& address = *(*settings)[kVoxContextAddress].asString();
                    EXPECT_TRUE(address.starts_with("198.51.100.") || address.starts_with("2001:db8:"))
                        << address;
                    ++addresses;
                }
    EXPECT_GT(addresses, 100);
}

TEST(ModemMessages, networksAreThoseOfTests) {
    for (const ModemAccount& each : modemAccounts()) {
        for (const Dictionary* cell : each.rows(kVoxCellMonitorCells))
            if (cell->contains(kVoxCellMonitorMCC)) {
                EXPECT_EQ(numberOf(*cell, kVoxCellMonitorMCC), 1);
                EXPECT_LE(numberOf(*cell, kVoxCellMonitorMNC), 2);
            }
        if (const std::string* plmn = each[kVoxRegistrationPLMN].asString()) {
            EXPECT_THAT(*plmn, testing::AnyOf("00101", "00102"));
        }
    }
}

TEST(ModemMessages, thePositionIsOnTheRing) {
    int positions = 0;
    for (const ModemAccount& each : modemAccounts())
        if (each[kVoxPositionLatitude].asReal()) {
            ++positions;
            const double metresInDegree = 111'320;
            const double north = (*each[kVoxPositionLatitude].asReal() - 0.005) * metresInDegree;
            const double east = *each[kVoxPositionLongitude].asReal() * metresInDegree;
            EXPECT_NEAR(std::hypot(north / 1100, east / 1800), 1, 1e-6);
        }
    EXPECT_GT(positions, 300);
}

} // namespace
} // namespace velmora
