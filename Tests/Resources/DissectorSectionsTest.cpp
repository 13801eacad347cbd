// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/PcapngFile.h"
#include "Tests/Resources/Dissection.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

/// Which sections the dissector names, and what it calls records.

namespace velmora {
namespace {

using testing::ElementsAre;

TEST(DissectorSections, followTheNameOfTheInterface) {
    NEEDS_PROGRAM("tshark");
    const TemporaryDirectory directory;
    const std::string path = directory / "a.pcapng";
    const Data messages[] = {
        record(0x5137, ""),              // GSM's alone
        record(0xB180, ""),              // LTE's alone
        extraRecord(0, makeDictionary()) // of all that have sections
    };
    const auto sections = [&](std::string_view technology) {
        writeCapture(path, technology, messages);
        return dissectedFields(path, {"velmora.sections"});
    };
    const char* const gsm = "GPRS Information;GSM Serving Cell;Neighboring Cells;GSM RR Info";
    const char* const lte = "Neighbor Measurements;Neighbor Cells List";
    EXPECT_THAT(sections("Ostrel_GSM"), ElementsAre(gsm, "", "SIM Info"));
    EXPECT_THAT(sections("Ostrel_LTE"), ElementsAre("", lte, "SIM Info"));
    EXPECT_THAT(sections("Ostrel_CDMA"), ElementsAre("", "", ""));
    EXPECT_THAT(sections("Modem"), ElementsAre("", "", "SIM;SIM Slots"));
    // Without a technology's name those of all, each name once.
    EXPECT_THAT(sections(""), ElementsAre(gsm, lte, "SIM Info;SIM;SIM Slots"));
    EXPECT_THAT(sections("eth0"), ElementsAre(gsm, lte, "SIM Info;SIM;SIM Slots"));
}

TEST(DissectorSections, giveWayToNamesOfRecordsInCDMA) {
    NEEDS_PROGRAM("tshark");
    const TemporaryDirectory directory;
    const std::string path = directory / "a.pcapng";
    const Data messages[] = {
        record(0x108A, ""), // the lowest of CDMA's codes
        record(0x134F, ""), // the highest
        record(0x5137, "")  // GSM's alone
    };
    const auto names = [&](std::string_view technology) {
        writeCapture(path, technology, messages);
        return dissectedFields(path, {"velmora.record"});
    };
    EXPECT_THAT(names("Ostrel_CDMA"), ElementsAre("Finger C/I", "System identification", ""));
    EXPECT_THAT(names(""), ElementsAre("Finger C/I", "System identification", ""));
    EXPECT_THAT(names("Ostrel_GSM"), ElementsAre("", "", ""));
}

} // namespace
} // namespace velmora
