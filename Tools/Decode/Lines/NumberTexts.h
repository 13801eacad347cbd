// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"
#include "Tools/Text/TextBuffer.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

namespace velmora {

/// The texts of a field's numbers as JSON, with quotes and escapes, ready to be copied: those of the numbers
/// that came lately, which are all of most fields.
class NumberTexts {
public:
    explicit NumberTexts(const Field& field);

    /// Valid until the next call.
    [[nodiscard]] std::string_view text(std::int64_t raw) {
        const Slot& slot = _slots[static_cast<std::size_t>(raw) & (_slots.size() - 1)];
        return slot.length != 0 && slot.raw == raw ? std::string_view(slot.text.data(), slot.length)
                                                   : format(raw);
    }

private:
    /// Half of a cache line: the texts of a table's levels are to stay in the nearest cache.
    struct alignas(32) Slot {
        std::int32_t raw = 0;
        std::uint8_t length = 0; ///< 0 where there is none
        std::array<char, 27> text;
    };

    [[nodiscard]] std::string_view format(std::int64_t raw);

    const Field& _field;
    std::vector<Slot> _slots; ///< a power of two; each has one of the numbers that end so
    TextBuffer _formatted{64};
};

} // namespace velmora
