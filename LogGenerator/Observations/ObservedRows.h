// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <deque>
#include <span>
#include <vector>

namespace velmora {

/// The numbers of the rows that a message's observations are in. They stay where they are until `clear`,
/// whose storage is used again.
class ObservedRows {
public:
    using Numbers = std::span<const std::uint32_t>;

    void clear() { _usedNumbers = _usedDeepRows = 0; }
    /// A row of that number in a list that is in the row `outer`, which is empty for none.
    [[nodiscard]] Numbers add(Numbers outer, std::uint32_t number) {
        if (!outer.empty())
            return addDeep(outer, number);
        if (_usedNumbers == _numbers.size())
            _numbers.emplace_back();
        std::uint32_t& only = _numbers[_usedNumbers++];
        only = number;
        return {&only, 1};
    }

private:
    [[nodiscard]] Numbers addDeep(Numbers outer, std::uint32_t number);

    std::deque<std::uint32_t> _numbers; ///< of rows in one list
    std::size_t _usedNumbers = 0;
    std::deque<std::vector<std::uint32_t>> _deepRows; ///< of rows in lists of rows
    std::size_t _usedDeepRows = 0;
};

} // namespace velmora
