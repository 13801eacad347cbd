// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/TextFormat.h"

#include <cstdio>

namespace velmora {

FormattedText::FormattedText(const TextFormat& format, std::int64_t raw) {
    if (format.hasSpecial && raw == format.specialValue) {
        _view = format.specialText;
        return;
    }
    switch (format.kind) {
    case TextFormat::Kind::Integer: {
        const auto scale = static_cast<std::int64_t>(format.scale);
        _number.format(format.format, raw * scale + static_cast<std::int64_t>(format.offset));
        _view = _number.text();
        break;
    }
    case TextFormat::Kind::Real:
        _number.format(format.format, static_cast<double>(raw) * format.scale + format.offset);
        _view = _number.text();
        break;
    case TextFormat::Kind::Enumeration:
        formatEnumeration(*format.texts, static_cast<std::uint32_t>(raw));
        break;
    case TextFormat::Kind::Flag: _view = raw != 0 ? format.set : format.clear; break;
    case TextFormat::Kind::Hexadecimal: formatHexadecimal(static_cast<std::uint32_t>(raw)); break;
    case TextFormat::Kind::Text: break; // the section supplies the text, never a raw value
    }
}

void FormattedText::formatEnumeration(const EnumTexts& texts, std::uint32_t value) {
    if (const EnumText* row = texts.find(value)) {
        _view = row->text;
    } else if (texts.showsOthers) {
        _number.format(texts.before, static_cast<std::int32_t>(value), texts.after);
        _view = _number.text();
    } else {
        _view = texts.before;
    }
}

void FormattedText::formatHexadecimal(std::uint32_t value) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%06x", value);
    _number.set(text);
    _view = _number.text();
}

} // namespace velmora
