// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/NumberTexts.h"

#include "Tools/Text/JSONText.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

constexpr unsigned widest = 9; ///< a level or quality of 9 bits: all of its texts fit

std::size_t slotsFor(const Place& place) {
    return std::size_t{1} << (place.isComputed() ? 6u : std::min<unsigned>(place.width, widest));
}

} // namespace

NumberTexts::NumberTexts(const Field& field) : _field(field), _slots(slotsFor(field.place)) {}

std::string_view NumberTexts::format(std::int64_t raw) {
    _formatted.clear();
    appendJsonString(_formatted, FormattedText(_field.format, raw).view());
    const std::string_view text = _formatted.view();
    Slot& slot = _slots[static_cast<std::size_t>(raw) & (_slots.size() - 1)];
    if (text.size() <= slot.text.size() && std::in_range<std::int32_t>(raw)) {
        text.copy(slot.text.data(), text.size());
        slot.length = static_cast<std::uint8_t>(text.size());
        slot.raw = static_cast<std::int32_t>(raw);
    }
    return text;
}

} // namespace velmora
