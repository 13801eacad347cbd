// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/ValueVisitor.h"

namespace velmora::C2K {

void ValueVisitor::put(std::string_view valueKey, std::string_view text) {
    if (_list)
        _entries->slotAt(_entries->size(), _entryKey).setText(text);
    else
        publishText(valueKey, text);
}

void ValueVisitor::fields(const Record& record, const Layout& layout) {
    for (const Field& field : layout.fields)
        number(field, field.place.read(record));
}

void ValueVisitor::number(const Field& field, std::int64_t raw) {
    put(field.label, FormattedText(field.format, raw).view());
}

void ValueVisitor::real(const Field& field, double value) {
    put(field.label, NumberText(field.format.format, value).text());
}

void ValueVisitor::text(const Field& field, std::string_view text) {
    put(field.label, text);
}

void ValueVisitor::supplied(const Field& field, const Value& value) {
    publish(field.label, value);
}

void ValueVisitor::beginList(const List& list) {
    _list = &list;
    _entries = makeDictionary();
    _entries->set("_sorted", "_sorted");
}

void ValueVisitor::entryNumber(std::size_t index, std::uint16_t number) {
    _entryKey = std::to_string(index) + ";" + std::to_string(number);
}

void ValueVisitor::endList() {
    const List& list = *_list;
    _list = nullptr;
    if (_entries->size() == 1 && !list.whenEmpty.empty())
        publishText(list.label, list.whenEmpty);
    else
        publish(list.label, _entries);
}

} // namespace velmora::C2K
