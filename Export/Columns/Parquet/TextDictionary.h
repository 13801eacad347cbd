// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The different texts of a column, in the order in which they were first seen.
class TextDictionary {
public:
    static constexpr std::size_t mostTexts = std::size_t{1} << 14;
    /// Of all its texts, in bytes.
    static constexpr std::size_t mostBytes = std::size_t{256} << 10;

    /// The index of the text, which is added where there is room; absent where there is none.
    [[nodiscard]] std::optional<std::uint16_t> indexOf(std::string_view text);
    [[nodiscard]] std::size_t count() const { return _ends.size(); }
    [[nodiscard]] std::string_view at(std::size_t index) const {
        const std::size_t begin = index == 0 ? 0 : _ends[index - 1];
        return std::string_view(_bytes).substr(begin, _ends[index] - begin);
    }
    /// Bytes of memory.
    [[nodiscard]] std::size_t size() const {
        return _bytes.capacity() + _ends.capacity() * 4 + _slots.capacity() * 2;
    }

private:
    [[nodiscard]] std::size_t slotOf(std::string_view text) const;
    void grow();

    std::string _bytes;
    std::vector<std::uint32_t> _ends;
    std::vector<std::uint16_t> _slots; ///< an index and 1 each; 0 where it is free
    std::uint16_t _last = 0;
};

} // namespace velmora
