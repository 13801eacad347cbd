// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"
#include "PropertyLists/Value.h"

#include <gmock/gmock.h>

#include <cstddef>
#include <cstdlib>
#include <functional>
#include <map>
#include <ostream>
#include <set>
#include <string>
#include <utility>
#include <vector>

/// What the drives come to on the screens, one technology a file; the suite of this folder plays each drive
/// through its decoder with the template that is shipped.

namespace velmora {

/// The texts that a label had in the course of a drive, and the lengths of a list.
using Texts = std::set<std::string>;
using Lengths = std::set<std::size_t>;

/// By path: "/Serving Cell/RRC Info/State". The entries of a list have the path of the list.
using TextsByPath = std::map<std::string, testing::Matcher<const Texts&>>;
using LengthsByPath = std::map<std::string, testing::Matcher<const Lengths&>>;

MATCHER_P3(IsNumber, least, most, unit,
           "is from " + testing::PrintToString(least) + " to " + testing::PrintToString(most) + unit) {
    char* end = nullptr;
    const double number = std::strtod(arg.c_str(), &end);
    return end != arg.c_str() && number >= least && number <= most && std::string(end) == unit;
}

/// More than one text, each of which the expression matches.
inline testing::Matcher<const Texts&> changing(const std::string& expression) {
    return testing::AllOf(testing::SizeIs(testing::Ge(2U)), testing::Each(testing::MatchesRegex(expression)));
}
/// More than one number, all in that range and followed by the unit.
inline testing::Matcher<const Texts&> numbers(double least, double most, const std::string& unit = "") {
    return testing::AllOf(testing::SizeIs(testing::Ge(2U)), testing::Each(IsNumber(least, most, unit)));
}
/// All of these texts and no others.
inline testing::Matcher<const Texts&> exactly(const Texts& texts) {
    return testing::Eq(texts);
}
/// Lists of up to so many entries, and once of just as many.
inline testing::Matcher<const Lengths&> upTo(std::size_t most) {
    return testing::AllOf(testing::Contains(most), testing::Each(testing::Le(most)));
}

/// A kind of log line.
struct ExpectedReport {
    std::string expression;
    testing::Matcher<int> count;
};

struct ExpectedDisplay {
    std::string scenario;
    std::string templateName; ///< of the resource
    TextsByPath texts;
    LengthsByPath lengths;
    /// Expects what holds between the values of a display.
    std::function<void(const Dictionary& display)> relations = [](const Dictionary&) {};
    int logLevel = LogPriority::Error; ///< lines that are more urgent, or as urgent, are reports
    std::vector<ExpectedReport> reports;
    /// Whether a message gets a report, where the message alone decides that.
    std::function<bool(const Data& message)> isReported = nullptr;
};

/// As a failing test prints it: by its name.
inline void PrintTo(const ExpectedDisplay& display, std::ostream* out) {
    *out << display.scenario;
}

[[nodiscard]] ExpectedDisplay expectedC2KDisplay();
[[nodiscard]] ExpectedDisplay expectedLTEDisplay();
[[nodiscard]] ExpectedDisplay expectedUTRANDisplay();

/// Adds what the extra stream's SIM and packet-data contexts come to in every drive.
inline void addServiceTexts(ExpectedDisplay& display, const std::string& contexts) {
    // The test network 001/01 (3GPP TS 36.508 4.4.2) and addresses for documentation (RFC 5737, RFC 3849).
    display.texts.merge(TextsByPath{
        {"/SIM Info/EF-ICCID", exactly({"8900101000000000017"})},
        {"/SIM Info/EF-MSISDN", exactly({"+1 555 0100"})},
        {"/SIM Info/EF-3GPP MAIL BOX DIALING NUMBER", exactly({"+1 555 0199"})},
        {"/SIM Info/EF-HPPLMN SEARCH PERIOD", exactly({"60 min"})},
        {"/SIM Info/EF-LOCI", changing("001-0[12], LAC [0-9]+, updated")},
        {"/SIM Info/EF-GPRS/PS-LOCI", changing("001-0[12], LAC [0-9]+, RAC [0-9]+, updated")},
        {"/SIM Info/EF-ACCESS CONTROL CLASS", exactly({"0x0080 (class 7)"})},
        {"/SIM Info/EF-ADMINISTRATIVE DATA", exactly({"00 00 00 02"})},
        {"/SIM Info/EF-FPLMN", exactly({"999-99"})},
        {"/SIM Info/EF-ACTING HPLMN", exactly({"001-01"})},
        {"/SIM Info/EF-RAT MODE", exactly({"Automatic"})},
        {"/SIM Info/EF-PLMN NETWORK NAME", exactly({"Test Network"})},
        {"/SIM Info/EF-OPERATOR PLMN LIST", exactly({"001-01, LAC 0-65534, PNN 1"})},
        {"/SIM Info/EF-OPLMNAcT", exactly({"001-02 (UTRAN, GSM)"})},
        {contexts + "/Context ID", exactly({"1", "2"})},
        {contexts + "/NSAPI", exactly({"5", "6"})},
        {contexts + "/APN", exactly({"internet.test", "mms.test"})},
        {contexts + "/PDP Type", exactly({"IPv4", "IPv6"})},
        {contexts + "/PDP Address", exactly({"192.0.2.17", "2001:db8::17"})},
        {contexts + "/Primary DNS", exactly({"192.0.2.1", "2001:db8::1"})},
        {contexts + "/QoS Traffic Class", exactly({"Interactive", "Background"})},
        {contexts + "/Maximum Bit Rate Uplink", exactly({"384 kbit/s"})},
        {contexts + "/Maximum Bit Rate Downlink", exactly({"7168 kbit/s"})},
    });
    display.lengths.emplace(contexts, testing::Eq(Lengths{0, 1, 2}));
}

} // namespace velmora
