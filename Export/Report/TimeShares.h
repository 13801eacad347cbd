// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClass.h"
#include "Analysis/Picture/RadioTechnology.h"
#include "Export/Report/MessageRange.h"

#include <array>
#include <chrono>
#include <cstddef>
#include <optional>

namespace velmora {

/// How long the phone was served by which radio technology, and how well.
class TimeShares {
public:
    static constexpr std::size_t classes = levelClasses.size();
    /// The index of what is not known, of technologies and of classes.
    static constexpr std::size_t noTechnology = radioTechnologies;
    static constexpr std::size_t noClass = classes;

    void add(std::optional<RadioTechnology> technology, std::optional<LevelClass> levelClass,
             std::chrono::nanoseconds time, const MessageRange& messages) {
        const std::size_t row = technology ? static_cast<std::size_t>(*technology) : noTechnology;
        Share& share = _shares[row][levelClass ? static_cast<std::size_t>(*levelClass) : noClass];
        share.time += time;
        share.messages.add(messages);
    }

    [[nodiscard]] std::chrono::nanoseconds time(std::size_t technology, std::size_t levelClass) const {
        return _shares[technology][levelClass].time;
    }
    /// The first and the last messages of that time.
    [[nodiscard]] const MessageRange& messages(std::size_t technology, std::size_t levelClass) const {
        return _shares[technology][levelClass].messages;
    }
    [[nodiscard]] std::chrono::nanoseconds ofTechnology(std::size_t technology) const {
        std::chrono::nanoseconds sum{0};
        for (const Share& each : _shares[technology])
            sum += each.time;
        return sum;
    }
    [[nodiscard]] std::chrono::nanoseconds total() const {
        std::chrono::nanoseconds sum{0};
        for (std::size_t i = 0; i < _shares.size(); ++i)
            sum += ofTechnology(i);
        return sum;
    }

private:
    struct Share {
        std::chrono::nanoseconds time{0};
        MessageRange messages;
    };
    std::array<std::array<Share, classes + 1>, radioTechnologies + 1> _shares{};
};

} // namespace velmora
