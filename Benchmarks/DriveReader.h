// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"
#include "Recording/MessageReader.h"
#include "Telephony/Drives/ScenarioRegistry.h"

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// A drive that is in memory already.
class DriveReader final : public MessageReader {
public:
    DriveReader(const ScenarioKind& kind, std::size_t count) {
        const std::unique_ptr<Scenario> scenario = kind.make(1);
        _technology = shortTechnologyName(scenario->technology());
        for (std::size_t i = 0; i < count; ++i) {
            const ScenarioEvent event = scenario->next();
            _messages.push_back({Time(event.offset), event.message, i + 1, 0});
        }
    }

    void rewind() { _next = 0; }
    [[nodiscard]] std::optional<LoggedMessage> next() override {
        if (_next == _messages.size())
            return std::nullopt;
        return _messages[_next++];
    }
    [[nodiscard]] const std::vector<LoggedMessage>& messages() const { return _messages; }
    [[nodiscard]] const std::string& technology() const override { return _technology; }
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _failure; }

private:
    std::string _technology;
    std::vector<LoggedMessage> _messages;
    std::size_t _next = 0;
    std::optional<Failure> _failure;
};

} // namespace velmora
