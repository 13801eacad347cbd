// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Telephony/Drives/ScenarioTesting.h"

#include <gmock/gmock.h>

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <optional>
#include <ostream>
#include <set>
#include <string>

/// What the scenarios' shared suites expect of each. The file of a scenario's own tests fills in its line.

namespace velmora {

/// The unusual messages of a drive whose records have tables.
struct ExpectedOddRecords {
    std::chrono::minutes length; ///< of the drive that is searched
    testing::Matcher<std::set<std::uint32_t>> shortCodes = testing::_;
    testing::Matcher<std::size_t> shortCount = testing::_;
    testing::Matcher<std::size_t> missing = testing::_; ///< bytes of each short one
    testing::Matcher<std::set<std::uint32_t>> overrunCodes = testing::_;
    testing::Matcher<std::size_t> overrunCount = testing::_;
    testing::Matcher<std::size_t> overrunsOfEachCode = testing::_;
    testing::Matcher<std::size_t> count = testing::_; ///< of both kinds
};

struct ExpectedDrive {
    std::string name;            ///< of the scenario
    std::chrono::minutes length; ///< of the drive of seed 1 that is looked at
    std::chrono::minutes round;  ///< within which every code comes
    double leastRate;            ///< messages a second
    double mostRate;
    std::set<std::uint32_t> codes;
    RecordCheck good;
    /// A number of a record in which drives differ; of most records none.
    std::function<std::optional<unsigned>(const LogMessage&)> trait;
    const Requirements* requirements = nullptr;
    ExpectedOddRecords odd = {};
};

/// As a failing test prints it: by its name.
inline void PrintTo(const ExpectedDrive& drive, std::ostream* out) {
    *out << drive.name;
}

[[nodiscard]] ExpectedDrive expectedGSMDrive();
[[nodiscard]] ExpectedDrive expectedC2KDrive();
[[nodiscard]] ExpectedDrive expectedLTEDrive();
[[nodiscard]] ExpectedDrive expectedUTRANDrive();
[[nodiscard]] ExpectedDrive expectedModemDrive();

} // namespace velmora
