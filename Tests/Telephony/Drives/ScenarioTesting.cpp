// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/Drives/ScenarioTesting.h"

#include "PropertyLists/PropertyList.h"

#include <gtest/gtest.h>

#include <utility>

namespace velmora {

Drive driveOf(Scenario& scenario, std::chrono::nanoseconds duration) {
    Drive events;
    for (ScenarioEvent event = scenario.next(); event.offset < duration; event = scenario.next())
        events.push_back(std::move(event));
    return events;
}

unsigned u16(Bytes record, std::size_t offset) {
    return record[offset] | static_cast<unsigned>(record[offset + 1]) << 8;
}

std::int64_t u32(Bytes record, std::size_t offset) {
    return u16(record, offset) | static_cast<std::int64_t>(u16(record, offset + 2)) << 16;
}

int s8(Bytes record, std::size_t offset) {
    return static_cast<std::int8_t>(record[offset]);
}

RecordCheck meets(const Requirements& requirements) {
    return [&requirements](const LogMessage& header) {
        const auto found = requirements.find(header.logCode());
        if (header.type == 2 || found == requirements.end() || header.record.size() < found->second.minimum)
            return false;
        return !found->second.needed || header.record.size() >= found->second.needed(header.record);
    };
}

void eachRecord(const Drive& drive, std::uint32_t code, const RecordCheck& good,
                const std::function<void(Bytes)>& look) {
    int seen = 0;
    for (const ScenarioEvent& event : drive) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || header->logCode() != code || !good(*header))
            continue;
        ++seen;
        look(header->record);
    }
    EXPECT_GT(seen, 0) << "good records of code 0x" << std::hex << code;
}

RecordCensus censusOf(const Drive& drive, const Requirements& requirements) {
    const RecordCheck good = meets(requirements);
    RecordCensus census;
    for (const ScenarioEvent& event : drive) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || header->type == 2)
            continue;
        EXPECT_EQ(header->length(), header->record.size() - 1);
        const auto found = requirements.find(header->logCode());
        if (found == requirements.end())
            continue;
        auto& group = header->record.size() < found->second.minimum ? census.belowMinimum
                      : good(*header)                               ? census.good
                                                                    : census.overrun;
        group[found->first].push_back(header->record);
    }
    return census;
}

void expectExtraLists(const Drive& drive, const std::function<void(unsigned code, const Value& list)>& look) {
    std::map<unsigned, std::set<bool>> binary;
    for (const ScenarioEvent& event : drive) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || header->type != 0xFF)
            continue;
        const Bytes payload = header->record.subspan(13);
        const auto list = readPropertyList(payload);
        ASSERT_TRUE(list) << list.reason();
        binary[header->code].insert(payload[0] == 'b');
        ASSERT_EQ(nameOf(list->kind()), header->code == 0 ? "dictionary" : "array");
        look(header->code, *list);
    }
    const std::set<bool> both = {false, true};
    EXPECT_EQ(binary, (std::map<unsigned, std::set<bool>>{{0, both}, {1, both}, {2, both}}));
}

} // namespace velmora
