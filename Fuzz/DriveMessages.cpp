// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/DriveMessages.h"

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <map>
#include <tuple>

namespace velmora {

std::vector<Data> driveMessages(std::string_view scenario, std::chrono::seconds duration, std::size_t each) {
    constexpr std::uint64_t seed = 1;
    const auto drive = scenarioKindNamed(scenario)->make(seed);
    const bool hasRecords = scenario != "ifx";
    std::map<std::tuple<bool, bool, std::uint8_t, std::uint16_t>, std::size_t> met;
    std::vector<Data> messages;
    for (ScenarioEvent event = drive->next(); event.offset < duration; event = drive->next()) {
        const auto header = hasRecords ? LogMessage::parse(event.message.bytes()) : std::nullopt;
        std::size_t& count = header ? met[{true, header->prefixed, header->type, header->code}]
                                    : met[{false, false, std::uint8_t{0}, std::uint16_t{0}}];
        if (count++ < each)
            messages.push_back(event.message);
    }
    return messages;
}

} // namespace velmora
