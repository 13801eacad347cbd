// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/ViewText.h"

#include "Tools/ListSections/LuaText.h"

#include <limits>

namespace velmora {

namespace {

void put(std::string& text, std::string_view key, double number, double unless) {
    if (number != unless)
        text.append(",").append(key).append("=").append(luaNumber(number));
}

bool isSigned(const Field& field) {
    constexpr std::uint8_t shownWidth = 32; // of integers, whatever the record holds
    if (field.means.sign != Sign::AsShown)
        return field.means.sign == Sign::Signed;
    if (field.format.kind == TextFormat::Kind::Integer && field.place.width == shownWidth)
        return field.format.format.conversion != 'u';
    return field.place.isSigned;
}

void putPlace(std::string& text, const Field& field) {
    const Place& place = field.place;
    if (place.isComputed())
        return;
    text += ",o=" + std::to_string(place.offset) + ",w=" + std::to_string(place.width);
    put(text, "b", place.bit, 0);
    put(text, "s", isSigned(field) ? 1 : 0, 0);
    put(text, "big", place.isBigEndian ? 1 : 0, 0);
}

/// How the raw value becomes the field's: its letter, or a scale and an offset.
void putValue(std::string& text, const Field& field) {
    switch (kindOf(field)) {
    case ObservedKind::Enumeration: text += ",k=\"e\""; break;
    case ObservedKind::Flag: text += ",k=\"f\""; break;
    case ObservedKind::Text:
    case ObservedKind::Binary:
        text += ",k=\"t\"";
        put(text, "digits", field.means.digits, 0);
        break;
    case ObservedKind::Absent: text += ",k=\"-\""; break;
    case ObservedKind::Number: {
        const double scale = physicalScale(field);
        put(text, "a", field.format.scale * scale, 1);
        put(text, "c", field.format.offset * scale + field.means.offset, 0);
        break;
    }
    }
}

} // namespace

std::string ViewText::row(const Field& field, const std::string& more) {
    const List* const list = _lists.empty() ? nullptr : _lists.back();
    std::string numbers;
    for (const CatalogueField* const leaf : _leaves.of(_section, _code, list, field))
        if (const std::size_t number = _fields.add(_technology, *leaf))
            numbers += (numbers.empty() ? "" : ",") + std::to_string(number);
    std::string text = "{l=" + luaString(field.label) + ",f={" + numbers + "}";
    putPlace(text, field);
    putValue(text, field);
    if (field.format.hasSpecial)
        text += ",x=" + std::to_string(field.format.specialValue);
    if (field.means.absent)
        text += ",n=" + luaString(*field.means.absent);
    return text + more + "}";
}

void ViewText::fields(std::span<const Field> fields) {
    if (fields.empty())
        return;
    _text += "{";
    if (_subPacket != 0)
        _text += "sub=" + std::to_string(_subPacket) + ",";
    for (const Field& field : fields)
        _text += row(field) + ",";
    _text += "},";
}

void ViewText::keyed(const Field& field, const KeyedValue& value) {
    std::string more = ",key=" + luaString(value.key);
    put(more, "least", value.least, std::numeric_limits<double>::lowest());
    put(more, "most", value.most, std::numeric_limits<double>::max());
    put(more, "divisor", value.divisor, 1);
    put(more, "low", value.lowBits, 0);
    put(more, "signed", value.isSigned ? 1 : 0, 0);
    _text += "{" + row(field, more) + "},";
}

void ViewText::beginList(const List& list) {
    std::string numbers;
    for (const CatalogueNode* const node : _leaves.listsOf(_section, list))
        numbers +=
            (numbers.empty() ? "" : ",") + std::to_string(_fields.addRows(_technology, _section, *node));
    _text += "{list=" + luaString(list.label) + ",f={" + numbers + "},";
    _lists.push_back(&list);
}

void ViewText::endList() {
    _lists.pop_back();
    _text += "},";
}

} // namespace velmora
