// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Rows/KeptRow.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Memory/Allocations.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <string>
#include <vector>

// A row for each message of a drive that has been seen before allocates nothing, with a column for each
// value.

namespace velmora {
namespace {

class KeptRowMemoryTest : public testing::TestWithParam<DecodedTechnology> {
protected:
    KeptRowMemoryTest() {
        const auto scenario = scenarioKindNamed(GetParam().scenario)->make(1);
        for (Data& message : messages)
            message = scenario->next().message;
    }

    std::vector<Data> messages{10000};
    TechnologyUnderTest tested{GetParam()};
};

TEST_P(KeptRowMemoryTest, RowsAllocateNothing) {
    std::vector<std::string> paths;
    for (const CatalogueField& leaf : tested.decoder().catalogue().fields()) {
        std::string path = leaf.path; // "/GSM/Neighboring Cells/*/RSSI"
        paths.push_back(path);
        if (const std::size_t row = path.find("/*"); row != path.npos)
            paths.push_back(path.replace(row, 2, "/0"));
    }
    const NodeSelection selection(paths);
    selection.limit(tested.decoder());
    KeptRow row(selection, CSVGuard::On, tested.decoder());
    std::size_t characters = 0;
    const auto allocationsOfDrive = [&] {
        std::uint64_t allocations = 0;
        for (const Data& message : messages) {
            const Allocations counted;
            tested.decoder().updateState(tested.state, message);
            characters += row.cells(tested.state).size();
            allocations += counted.count();
        }
        return allocations;
    };
    EXPECT_GT(allocationsOfDrive(), 100u);
    EXPECT_GT(characters, messages.size() * selection.paths().size());
    EXPECT_EQ(allocationsOfDrive(), 0u);
}

// GSM's lists have rows of other labels from record to record, CDMA's values are dictionaries that are made
// anew for each record, and IFX's whole displays are.
INSTANTIATE_TEST_SUITE_P(Technologies, KeptRowMemoryTest,
                         testing::Values(decodedTechnologies[1], decodedTechnologies[2]),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
