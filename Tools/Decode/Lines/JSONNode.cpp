// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/JSONNode.h"

#include "PropertyLists/Value.h"

#include <algorithm>

namespace velmora {

void JSONNode::read(const Value& node) {
    _count = 0;
    if (const Dictionary* const dictionary = node.asDictionary())
        for (const auto& [label, value] : *dictionary) {
            JSONMember& made = add();
            made.become(nullptr, label);
            made.setValue(value);
        }
    if (const Array* const array = node.asArray())
        for (const Value& value : *array) {
            JSONMember& made = add();
            made.becomeEntry(nullptr);
            made.setValue(value);
        }
}

JSONMember& JSONNode::add() {
    if (_count == _members.size())
        _members.emplace_back();
    return _members[_count++];
}

JSONMember& JSONNode::find(const void* source, std::string_view label) {
    for (std::size_t i = 0; i < _count; ++i)
        if (_members[i].label() == label) {
            _next = i + 1;
            if (_members[i].source() != source)
                _members[i].setSource(source);
            return _members[i];
        }
    JSONMember& made = add();
    _next = _count;
    made.become(source, label);
    return made;
}

JSONMember& JSONNode::replace(std::size_t index, const void* source, std::string_view label) {
    if (index < _count && _members[index].label() == label) {
        _members[index].setSource(source);
        return _members[index];
    }
    _count = index;
    JSONMember& made = add();
    made.become(source, label);
    return made;
}

JSONMember& JSONNode::replaceEntry(std::size_t index, const void* source) {
    if (index == _count)
        ++_count;
    if (index == _members.size())
        _members.emplace_back();
    if (_members[index].source() != source || !source)
        _members[index].becomeEntry(source);
    return _members[index];
}

void JSONNode::remove(std::string_view label) {
    const auto begin = _members.begin();
    const auto end = begin + static_cast<std::ptrdiff_t>(_count);
    const auto found =
        std::find_if(begin, end, [label](const JSONMember& member) { return member.label() == label; });
    if (found == end)
        return;
    std::rotate(found, found + 1, end); // its storage is used again
    --_count;
    _next = 0;
}

void JSONNode::truncate(std::size_t count) {
    _count = std::min(_count, count);
}

} // namespace velmora
