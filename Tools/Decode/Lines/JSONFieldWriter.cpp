// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/JSONFieldWriter.h"

#include "PropertyLists/Value.h"

#include <stdexcept>

namespace velmora {

namespace {

/// What rows of lists are of.
constexpr char row = 0;

} // namespace

JSONFieldWriter::JSONFieldWriter(JSONNode& node, Into into) : _into(into) {
    _levels[0] = {&node, 0, into == Into::Values, !node.isArray()};
}

void JSONFieldWriter::end() {
    if (level().isInOrder)
        level().node->truncate(level().next);
}

JSONMember* JSONFieldWriter::memberFor(const void* source, std::string_view label) {
    Level& to = level();
    if (!to.isOpen)
        return nullptr;
    if (to.numbered)
        return &to.node->memberAt(to.next++, nullptr, _entryKey);
    if (to.node->isArray())
        return &to.node->entryAt(to.next++, source);
    if (to.isInOrder)
        return &to.node->memberAt(to.next++, source, label);
    return &to.node->member(source, label);
}

void JSONFieldWriter::push(const Level& next) {
    if (_depth + 1 == deepest)
        throw std::logic_error("lists nest too deep");
    _levels[++_depth] = next;
}

void JSONFieldWriter::fields(const Record& record, const Layout& layout) {
    for (const Field& field : layout.fields)
        number(field, field.place.read(record));
}

void JSONFieldWriter::number(const Field& field, std::int64_t raw) {
    if (JSONMember* const to = memberFor(&field, field.label))
        to->setNumber(field, raw);
}

void JSONFieldWriter::real(const Field& field, double value) {
    text(field, NumberText(field.format.format, value).text());
}

void JSONFieldWriter::text(const Field& field, std::string_view text) {
    if (JSONMember* const to = memberFor(&field, field.label))
        to->setText(text);
}

void JSONFieldWriter::supplied(const Field& field, const Value& value) {
    if (JSONMember* const to = memberFor(&field, field.label))
        to->setValue(value);
}

void JSONFieldWriter::removed(std::string_view label) {
    if (_into == Into::Section && level().isOpen && !level().node->isArray())
        level().node->remove(label);
}

void JSONFieldWriter::beginWhole() {
    level().isInOrder = level().isOpen;
    level().next = 0;
}

void JSONFieldWriter::endWhole() {
    end();
    level().isInOrder = false;
}

void JSONFieldWriter::beginList(const List& list) {
    Level& to = level();
    if (list.label.empty()) {
        const bool isOwn = _depth == 0 && to.node->isArray();
        push({isOwn ? to.node : nullptr, 0, isOwn, isOwn});
        return;
    }
    const bool isNumbered = _into == Into::Values && list.entries == List::Entries::Numbered;
    JSONMember* const member = to.isOpen && !to.node->isArray() ? memberFor(&list, list.label) : nullptr;
    if (!member) {
        push({});
        return;
    }
    push({&member->setNode(!isNumbered), 0, true, true, isNumbered ? &list : nullptr, member});
    if (isNumbered)
        level().node->memberAt(level().next++, nullptr, "_sorted").setText("_sorted");
}

void JSONFieldWriter::beginRow() {
    Level& to = level();
    const bool isShown = to.isOpen && to.node->isArray();
    JSONNode* const node = isShown ? &to.node->entryAt(to.next++, &row).setNode(false) : nullptr;
    push({node, 0, isShown, isShown});
}

void JSONFieldWriter::endRow() {
    end();
    --_depth;
}

void JSONFieldWriter::entryNumber(std::size_t index, std::uint16_t number) {
    if (!level().numbered)
        return;
    _entryKey = std::to_string(index);
    _entryKey += ';';
    _entryKey += std::to_string(number);
}

void JSONFieldWriter::endList() {
    end();
    if (const List* const list = level().numbered; list && level().next == 1 && !list->whenEmpty.empty())
        level().member->setText(list->whenEmpty);
    --_depth;
}

} // namespace velmora
