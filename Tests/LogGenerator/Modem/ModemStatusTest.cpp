// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/ModemFixture.h"

#include <gtest/gtest.h>

// The first row of the sections, which says why there is nothing else.

namespace velmora {
namespace {

struct StatusCase {
    const char* name;
    std::vector<Dictionary::Entry> entries;
    const char* servingCell;
    const char* link;
};

class ModemStatusTest : public ModemFixture, public testing::WithParamInterface<StatusCase> {};

TEST_P(ModemStatusTest, IsTheFirstRow) {
    const DictionaryRef message = makeDictionary();
    for (const Dictionary::Entry& entry : GetParam().entries)
        message->set(entry.key, entry.value);
    update(modemMessage(LiveModemCode::cells, message));
    update(modemMessage(LiveModemCode::link, message));
    EXPECT_EQ(text("Serving Cell", "State"), GetParam().servingCell);
    EXPECT_EQ(text("Link", "State"), GetParam().link);
}

const StatusCase states[] = {
    {"NoBus", {{"kVoxModemPresence", 1}}, "No system bus", "No system bus"},
    {"NoManager", {{"kVoxModemPresence", 2}}, "ModemManager is not running", "ModemManager is not running"},
    {"NoPermission",
     {{"kVoxModemPresence", 3}},
     "No permission to see the modems",
     "No permission to see the modems"},
    {"NoModem", {{"kVoxModemPresence", 4}}, "No modem", "No modem"},
    {"NotTheOne",
     {{"kVoxModemPresence", 5}},
     "The chosen modem is not there",
     "The chosen modem is not there"},
    {"NoAnswer", {{"kVoxModemPresence", 6}}, "ModemManager does not answer", "ModemManager does not answer"},
    {"NewPresence", {{"kVoxModemPresence", 7}, {"kVoxModemState", 8}}, "No modem (7)", "No modem (7)"},
    {"SIMMissing",
     {{"kVoxModemPresence", 0}, {"kVoxModemState", -1}, {"kVoxModemFailedReason", 2}},
     "Failed: SIM missing",
     "Failed: SIM missing"},
    {"NewFailure",
     {{"kVoxModemState", -1}, {"kVoxModemFailedReason", 77}},
     "Failed: unknown reason (77)",
     "Failed: unknown reason (77)"},
    {"Failed", {{"kVoxModemState", -1}}, "Failed", "Failed"},
    {"Locked",
     {{"kVoxModemState", 2}, {"kVoxModemLock", 2}},
     "Locked: SIM PIN required",
     "Locked: SIM PIN required"},
    {"NoLock",
     {{"kVoxModemState", 3}, {"kVoxModemLock", 1}, {"kVoxModemCellReport", 4}},
     "Cells not reported yet",
     "Disabled"},
    {"Unsupported",
     {{"kVoxModemState", 8}, {"kVoxModemCellReport", 1}},
     "Cells not reported: not supported by this modem",
     "Registered"},
    {"CellsNotPermitted",
     {{"kVoxModemState", 8}, {"kVoxModemCellReport", 2}},
     "Cells not reported: no permission (Documentation/live-modem.md has the bus policy)",
     "Registered"},
    {"CellsFailing",
     {{"kVoxModemState", 11}, {"kVoxModemCellReport", 3}},
     "Cells not reported: the query fails",
     "Connected"},
    {"NoCoverage",
     {{"kVoxModemState", 7}, {"kVoxModemCellReport", 0}},
     "Searching, no serving cell",
     "Searching"},
    {"Connecting",
     {{"kVoxModemState", 10}},
     "Connecting to packet data, no serving cell",
     "Connecting to packet data"},
    {"NewState", {{"kVoxModemState", 12}}, "Unknown (12), no serving cell", "Unknown (12)"},
    {"Nothing", {}, "Unknown, no serving cell", "Unknown"},
    {"WrongKinds",
     {{"kVoxModemPresence", "4"}, {"kVoxModemState", true}, {"kVoxModemLock", 2.5}},
     "Unknown, no serving cell",
     "Unknown"},
};
INSTANTIATE_TEST_SUITE_P(States, ModemStatusTest, testing::ValuesIn(states),
                         [](const auto& tested) { return tested.param.name; });

TEST_F(ModemFixture, TheReasonFollowsTheState) {
    EXPECT_EQ(after("Position", {modemMessage(LiveModemCode::position,
                                              {{"kVoxModemPresence", 3},
                                               {"kVoxModemReason", "org.freedesktop.DBus.Error.AccessDenied"},
                                               {"kVoxPositionLatitude", 1.5}})}),
              "{State 'No permission to see the modems', Reason 'org.freedesktop.DBus.Error.AccessDenied'}");
}

} // namespace
} // namespace velmora
