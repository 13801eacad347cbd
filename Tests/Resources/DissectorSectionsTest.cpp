// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Resources/DissectorSections.h"

#include "Tests/Recording/PcapngFile.h"
#include "Tests/Resources/Dissection.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/ShippedResources.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

/// The dissector's table of log codes and sections against the decoders.

namespace velmora {
namespace {

using testing::ElementsAre;

/// The lines of a table in the dissector's source.
std::string tableNamed(const std::string& name) {
    const Data source = shippedResource("wireshark/velmora.lua.in");
    const std::string text(source.bytes().begin(), source.bytes().end());
    const std::string head = "local " + name + " = {\n";
    const std::size_t begin = text.find(head);
    if (begin == std::string::npos)
        return "no table " + name;
    const std::size_t from = begin + head.size();
    return text.substr(from, text.find("\n}\n", from) + 1 - from);
}

TEST(DissectorSections, areThoseOfTheDecoders) {
    EXPECT_EQ(tableNamed("sections"), dissectorSections()) << "it has to be:\n" << dissectorSections();
}

TEST(DissectorSections, orRecordsAreThoseOfTheDecoderWithoutSections) {
    EXPECT_EQ(tableNamed("records"), dissectorRecords()) << "it has to be:\n" << dissectorRecords();
}

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
    // Without a technology's name those of all, each name once.
    EXPECT_THAT(sections(""), ElementsAre(gsm, lte, "SIM Info"));
    EXPECT_THAT(sections("eth0"), ElementsAre(gsm, lte, "SIM Info"));
}

} // namespace
} // namespace velmora
