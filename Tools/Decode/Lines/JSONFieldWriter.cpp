// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/JSONFieldWriter.h"

#include "PropertyLists/Value.h"

#include <bit>
#include <stdexcept>

namespace velmora {

namespace {

/// What rows of lists are of.
constexpr char row = 0;

/// As Place::read, in fewer steps: eight bytes that end or begin with the field are one number, wherever the
/// record holds so many.
std::int64_t read(const Place& place, const Record& record) {
    constexpr std::size_t word = sizeof(std::uint64_t);
    const std::size_t end = place.end();
    if (place.isBigEndian || end > record.size())
        return place.read(record);
    std::size_t first = place.offset;
    unsigned above = 64u - place.bit - place.width; // the bits above the field
    if (end >= word) {
        first = end - word;
        above -= static_cast<unsigned>(8 * (place.offset - first));
    } else if (first + word > record.size()) {
        return place.read(record);
    }
    const auto top = numberAt<std::uint64_t>(&record.bytes()[first], std::endian::little) << above;
    const unsigned down = 64u - place.width;
    return place.isSigned ? static_cast<std::int64_t>(top) >> down : static_cast<std::int64_t>(top >> down);
}

} // namespace

void JSONFieldWriter::begin(JSONNode& node, Into into) {
    _into = into;
    _depth = 0;
    _levels[0] = {&node, 0, into == Into::Values, !node.isArray()};
}

void JSONFieldWriter::end() {
    if (level().isOpen && level().isInOrder)
        level().node->truncate(level().next);
}

std::size_t JSONFieldWriter::memberFor(const void* source, std::string_view label) {
    Level& to = level();
    if (!to.isOpen)
        return nowhere;
    if (to.numbered)
        return to.node->memberAt(to.next++, nullptr, _entryKey);
    if (to.node->isArray())
        return to.node->entryAt(to.next++, source);
    if (to.isInOrder)
        return to.node->memberAt(to.next++, source, label);
    return to.node->member(source, label);
}

void JSONFieldWriter::push(const Level& next) {
    if (_depth + 1 == deepest)
        throw std::logic_error("lists nest too deep");
    _levels[++_depth] = next;
}

void JSONFieldWriter::fields(const Record& record, const Layout& layout) {
    Level& to = level();
    if (!to.isOpen || to.numbered || to.node->isArray()) {
        for (const Field& field : layout.fields)
            number(field, field.place.read(record));
        return;
    }
    JSONNode& node = *to.node;
    for (const Field& field : layout.fields) {
        const std::size_t index =
            to.isInOrder ? node.memberAt(to.next++, &field, field.label) : node.member(&field, field.label);
        node.setNumber(index, field, read(field.place, record));
    }
}

void JSONFieldWriter::number(const Field& field, std::int64_t raw) {
    if (const std::size_t to = memberFor(&field, field.label); to != nowhere)
        level().node->setNumber(to, field, raw);
}

void JSONFieldWriter::real(const Field& field, double value) {
    text(field, NumberText(field.format.format, value).text());
}

void JSONFieldWriter::text(const Field& field, std::string_view text) {
    if (const std::size_t to = memberFor(&field, field.label); to != nowhere)
        level().node->setText(to, text);
}

void JSONFieldWriter::supplied(const Field& field, const Value& value) {
    if (const std::size_t to = memberFor(&field, field.label); to != nowhere)
        level().node->setValue(to, value);
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
    if (!to.isOpen || to.node->isArray()) {
        push({});
        return;
    }
    const std::size_t member = memberFor(&list, list.label);
    push({&to.node->setNode(member, !isNumbered), 0, true, true, isNumbered ? &list : nullptr, member});
    if (isNumbered)
        level().node->setText(level().node->memberAt(level().next++, nullptr, "_sorted"), "_sorted");
}

void JSONFieldWriter::beginRow() {
    Level& to = level();
    const bool isShown = to.isOpen && to.node->isArray();
    JSONNode* const node = isShown ? &to.node->setNode(to.node->entryAt(to.next++, &row), false) : nullptr;
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
    const Level ended = level();
    --_depth;
    if (ended.numbered && ended.next == 1 && !ended.numbered->whenEmpty.empty())
        level().node->setText(ended.member, ended.numbered->whenEmpty);
}

} // namespace velmora
