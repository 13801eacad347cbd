// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Which value a state had when, for a band under the charts. Of very many changes the shortest states become
/// one that is called "several".
class StateBand {
public:
    static constexpr std::size_t usualMost = 12288;
    static constexpr std::size_t mostValues = 1024;
    /// Values of steps.
    static constexpr std::uint32_t unknown = 0;
    static constexpr std::uint32_t several = 1; ///< changes too quick to show, or too many values

    struct Step {
        Time since;
        std::uint32_t value;
    };

    /// `most`: at least 4.
    explicit StateBand(std::string bandName, std::size_t most = usualMost)
        : _name(std::move(bandName)), _most(most) {}

    /// From that time on it has that value; absent where it is not known.
    void set(Time time, std::optional<std::string_view> value);
    void end(Time time) { set(time, std::nullopt); }
    /// What the value of that name is called on the page, once there are no more changes.
    void rename(std::string_view value, std::string name);

    [[nodiscard]] const std::string& name() const { return _name; }
    /// The value is that of the step until the next one. The last one is unknown once `end` was called.
    [[nodiscard]] const std::vector<Step>& steps() const { return _steps; }
    /// By a step's value.
    [[nodiscard]] const std::vector<std::string>& values() const { return _values; }
    [[nodiscard]] bool isEmpty() const { return _values.size() <= 2; }

private:
    [[nodiscard]] std::uint32_t numberOf(std::string_view value);
    void coarsen();
    void joinShort();

    std::string _name;
    std::size_t _most;
    std::vector<std::string> _values{"", "several"};
    std::map<std::string, std::uint32_t, std::less<>> _numbers;
    std::vector<Step> _steps;
    /// States that are shorter are not shown one by one, once there are too many.
    std::chrono::nanoseconds _shortest = std::chrono::milliseconds(250);
};

} // namespace velmora
