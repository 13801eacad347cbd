// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/JSONNode.h"

#include "PropertyLists/Value.h"
#include "Tools/Text/JSONText.h"

#include <algorithm>
#include <cstring>

namespace velmora {

void JSONNode::read(const Value& node) {
    truncate(0);
    if (const Dictionary* const dictionary = node.asDictionary())
        for (const auto& [label, value] : *dictionary) {
            const std::string_view text = label;
            add(nullptr, &text);
            setValue(_count - 1, value);
        }
    if (const Array* const array = node.asArray())
        for (const Value& value : *array) {
            add(nullptr, nullptr);
            setValue(_count - 1, value);
        }
}

JSONMember& JSONNode::add(const void* source, const std::string_view* label) {
    if (_count == _members.size())
        _members.emplace_back();
    JSONMember& made = _members[_count++];
    setSource(made, source);
    made.showsNode = false;
    made.label = label ? *label : std::string_view();
    made.begin = static_cast<std::uint32_t>(_text.size());
    _text.append(',');
    if (label) {
        appendJsonString(_text, *label);
        _text.append(':');
    }
    made.value = made.end = static_cast<std::uint32_t>(_text.size());
    return made;
}

void JSONNode::setSource(JSONMember& member, const void* source) {
    member.source = source;
    member.isNumber = false;
    member.texts = nullptr;
}

std::size_t JSONNode::find(const void* source, std::string_view label) {
    std::size_t index = 0;
    while (index < _count && _members[index].label != label)
        ++index;
    if (index == _count)
        add(source, &label);
    else if (_members[index].source != source)
        setSource(_members[index], source);
    _next = index + 1;
    return index;
}

void JSONNode::replace(std::size_t index, const void* source, std::string_view label) {
    if (index < _count && _members[index].label == label) {
        setSource(_members[index], source);
        return;
    }
    truncate(index);
    add(source, &label);
}

void JSONNode::replaceEntry(std::size_t index, const void* source) {
    if (index < _count)
        setSource(_members[index], source);
    else
        add(source, nullptr);
}

void JSONNode::remove(std::string_view label) {
    std::size_t index = 0;
    while (index < _count && _members[index].label != label)
        ++index;
    if (index == _count)
        return;
    // What follows moves up; the member's storage is used again.
    put(_members[index], {});
    showNode(_members[index], false);
    const std::uint32_t begin = _members[index].begin;
    const std::uint32_t length = _members[index].end - begin;
    std::memmove(_text.at(begin), _text.at(begin + length), _text.size() - begin - length);
    _text.truncate(_text.size() - length);
    const auto at = _members.begin() + static_cast<std::ptrdiff_t>(index);
    const auto end = _members.begin() + static_cast<std::ptrdiff_t>(_count);
    for (auto member = at + 1; member != end; ++member) {
        member->begin -= length;
        member->value -= length;
        member->end -= length;
    }
    std::rotate(at, at + 1, end);
    --_count;
    _next = 0;
}

void JSONNode::cut(std::size_t count) {
    _text.truncate(_members[count].begin);
    while (_count > count)
        showNode(_members[--_count], false);
}

void JSONNode::writeNumber(JSONMember& to, const Field& field, std::int64_t raw) {
    const bool isSource = to.source == &field;
    if (!isSource || !to.texts)
        to.texts = &_texts.of(field);
    put(to, to.texts->text(raw));
    to.raw = raw;
    to.isNumber = isSource;
}

void JSONNode::resize(JSONMember& to, std::size_t length) {
    const std::size_t before = to.end - to.value;
    const std::size_t after = _text.size() - to.end;
    if (length > before)
        static_cast<void>(_text.room(length - before));
    std::memmove(_text.at(to.value + length), _text.at(to.end), after);
    if (length > before)
        _text.advance(length - before);
    else
        _text.truncate(_text.size() - (before - length));
    const auto change = static_cast<std::uint32_t>(length - before); // modulo 2^32
    to.end += change;
    for (JSONMember* next = &to + 1; next != _members.data() + _count; ++next) {
        next->begin += change;
        next->value += change;
        next->end += change;
    }
}

void JSONNode::put(JSONMember& to, std::string_view json) {
    to.isNumber = false;
    if (to.showsNode)
        showNode(to, false);
    const std::size_t before = to.end - to.value;
    if (json.size() != before)
        resize(to, json.size());
    json.copy(_text.at(to.value), json.size()); // which may be empty, without characters
}

void JSONNode::setText(std::size_t index, std::string_view text) {
    TextBuffer& json = _texts.emptyBuffer();
    appendJsonString(json, text);
    put(_members[index], json.view());
}

void JSONNode::setValue(std::size_t index, const Value& value) {
    TextBuffer& json = _texts.emptyBuffer();
    appendJson(json, value);
    put(_members[index], json.view());
}

void JSONNode::showNode(JSONMember& member, bool shows) {
    if (member.showsNode == shows)
        return;
    member.showsNode = shows;
    _nodes += shows ? 1 : std::size_t{0} - 1;
}

JSONNode& JSONNode::setNode(std::size_t index, bool isArray) {
    JSONMember& to = _members[index];
    if (!to.showsNode) {
        put(to, {});
        showNode(to, true);
    }
    if (!to.node || to.node->isArray() != isArray)
        to.node = std::make_unique<JSONNode>(isArray, _texts);
    return *to.node;
}

void JSONNode::appendWithNodes(TextBuffer& out) const {
    const std::string_view all = _text.view();
    std::size_t done = 0;
    for (std::size_t i = 0; i < _count; ++i)
        if (const JSONMember& member = _members[i]; member.showsNode) {
            out.append(all.substr(done, member.end - done));
            done = member.end;
            member.node->append(out);
        }
    out.append(all.substr(done));
}

} // namespace velmora
