// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/DisplayWriter.h"

#include <stdexcept>
#include <utility>

namespace velmora {

namespace {

bool isReusableRow(const Value& value) {
    const Dictionary* const row = value.asDictionary();
    return row && value.isOnlyReference() && !row->isFrozen();
}

Array& listIn(Value& slot) {
    if (!slot.asArray() || !slot.isOnlyReference() || slot.asArray()->isFrozen())
        slot = makeArray();
    return *slot.asArray();
}

} // namespace

Dictionary& DisplayWriter::rowIn(Value& slot) {
    if (isReusableRow(slot))
        return *slot.asDictionary();
    if (_spare.empty()) {
        slot = makeDictionary();
    } else {
        slot = std::move(_spare.back());
        _spare.pop_back();
    }
    return *slot.asDictionary();
}

void DisplayWriter::push(const Level& next) {
    if (_depth + 1 == deepest)
        throw std::logic_error("lists nest too deep");
    _levels[++_depth] = next;
}

void DisplayWriter::put(std::string_view label, std::string_view text) {
    Level& to = level();
    if (to.isRow)
        to.dictionary->slotAt(to.next++, label).setText(text);
    else if (to.dictionary)
        to.dictionary->setText(label, text);
    else if (to.list)
        to.list->slot(to.next++).setText(text);
}

void DisplayWriter::fields(const Record& record, const Layout& layout) {
    const auto write = [&](const Field& field) {
        put(field.label, FormattedText(field.format, field.place.read(record)).view());
    };
    if (isChosen()) {
        for (const std::uint16_t index : _wanted->of(layout))
            write(layout.fields[index]);
    } else if (level().dictionary || level().list) {
        for (const Field& field : layout.fields)
            write(field);
    }
}

void DisplayWriter::number(const Field& field, std::int64_t raw) {
    if (!ignores(field.label))
        put(field.label, FormattedText(field.format, raw).view());
}

void DisplayWriter::real(const Field& field, double value) {
    if (!ignores(field.label))
        put(field.label, NumberText(field.format.format, value).text());
}

void DisplayWriter::text(const Field& field, std::string_view text) {
    if (!ignores(field.label))
        put(field.label, text);
}

void DisplayWriter::supplied(const Field& field, const Value& value) {
    if (ignores(field.label))
        return;
    Level& to = level();
    if (const std::string* string = value.asString())
        put(field.label, *string);
    else if (to.isRow)
        to.dictionary->slotAt(to.next++, field.label) = value;
    else if (to.dictionary)
        to.dictionary->set(field.label, value);
    else if (to.list)
        to.list->slot(to.next++) = value;
}

void DisplayWriter::removed(std::string_view label) {
    if (Dictionary* const node = level().dictionary)
        node->remove(label);
}

void DisplayWriter::beginWhole() {
    // Written like a row, so that the order is that of the account, whatever there was before.
    level().isRow = level().dictionary != nullptr;
    level().next = 0;
}

void DisplayWriter::endWhole() {
    if (level().isRow)
        level().dictionary->truncate(level().next);
    level().isRow = false;
}

void DisplayWriter::beginList(const List& list) {
    Level& to = level();
    Array* target = nullptr;
    if (list.label.empty()) {
        target = _depth == 0 ? _ownList : nullptr;
    } else if (ignores(list.label)) {
        target = nullptr;
    } else if (to.isRow) {
        target = &listIn(to.dictionary->slotAt(to.next++, list.label));
    } else if (to.dictionary) {
        target = &listIn(to.dictionary->slot(list.label));
    }
    push({nullptr, target, 0, false});
}

void DisplayWriter::beginRow() {
    Level& to = level();
    Dictionary* const row = to.list ? &rowIn(to.list->slot(to.next++)) : nullptr;
    push({row, nullptr, 0, row != nullptr});
}

void DisplayWriter::endRow() {
    if (Dictionary* const row = level().dictionary)
        row->truncate(level().next);
    --_depth;
}

void DisplayWriter::entryNumber(std::size_t, std::uint16_t) {}

void DisplayWriter::endList() {
    if (Array* const list = level().list) {
        for (std::size_t i = level().next; i < list->size(); ++i)
            if (isReusableRow((*list)[i]))
                _spare.push_back(std::move(list->slot(i)));
        list->truncate(level().next);
    }
    --_depth;
}

} // namespace velmora
