// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/EventsTable.h"

#include "Tests/Export/Columns/MemorySink.h"

#include <gtest/gtest.h>

#include <map>

namespace velmora {
namespace {

class EventsTableTest : public testing::Test {
protected:
    /// The least value of each column that has one, as it is stored: of a single row, the value.
    std::map<std::string, std::string> row(const Event& event,
                                           const std::optional<DecimalDegrees>& place = {}) {
        EventsTable table("Ostrel_LTE", "f00", _sink, _compressor);
        table.add(event, place);
        EXPECT_TRUE(table.table().finish());
        const Result<FileMetadata> metadata = _sink.metadata();
        std::map<std::string, std::string> values;
        for (std::size_t i = 0; i < metadata->columns.size(); ++i)
            if (const auto& range = metadata->groups.at(0).chunks[i].statistics.range)
                values[metadata->columns[i].name] = range->first;
        return values;
    }
    static std::string integer(std::int64_t value) {
        return {reinterpret_cast<const char*>(&value), sizeof value};
    }
    static std::string number(double value) { return {reinterpret_cast<const char*>(&value), sizeof value}; }

    MemorySink _sink;
    PageCompressor _compressor;
};

TEST_F(EventsTableTest, hasWhatEveryEventHas) {
    Event event;
    event.time = Time(std::chrono::nanoseconds(1000));
    event.end = Time(std::chrono::nanoseconds(3000));
    event.lasts = true;
    event.kind = "out-of-service";
    event.severity = Severity::Critical;
    event.text = "no service";
    event.evidence = {{0, 7}, {0, 9}};
    const auto values = row(event, DecimalDegrees{-335006519, 1799991637});
    EXPECT_EQ(values, (std::map<std::string, std::string>{{"file", "f00"},
                                                          {"time", integer(1000)},
                                                          {"end_time", integer(3000)},
                                                          {"message", integer(7)},
                                                          {"last_message", integer(9)},
                                                          {"kind_text", "out-of-service"},
                                                          {"severity_text", "critical"},
                                                          {"severity_raw", integer(2)},
                                                          {"event_text", "no service"},
                                                          {"latitude", integer(-335006519)},
                                                          {"longitude", integer(1799991637)}}));
}

TEST_F(EventsTableTest, hasColumnsForTheFieldsOfDetectors) {
    Event event;
    event.fields = {{"from", "PCI 62", Unit::None},
                    {"from.physical-cell", 62.0, Unit::None},
                    {"duration", 1.5, Unit::Second},
                    {"value", -110.5, Unit::DBm}};
    const auto values = row(event);
    EXPECT_EQ(values.at("from_text"), "PCI 62");
    EXPECT_EQ(values.at("from_physical_cell"), number(62));
    EXPECT_EQ(values.at("duration_s"), number(1.5));
    EXPECT_EQ(values.at("value_number"), number(-110.5));
    EXPECT_EQ(values.at("value_unit"), "dBm");
    EXPECT_FALSE(values.contains("other_fields_text"));
    EXPECT_FALSE(values.contains("message")); // no message made it
}

TEST_F(EventsTableTest, keepsWhatRulesSayBesides) {
    Event event;
    event.fields = {
        {"serving.level", -101.25, Unit::DBm}, {"value", true, Unit::None}, {"cause", 3.0, Unit::None}};
    const auto values = row(event);
    EXPECT_EQ(values.at("other_fields_text"), "serving.level=-101.25; cause=3");
    EXPECT_EQ(values.at("value_text"), "true");
}

} // namespace
} // namespace velmora
