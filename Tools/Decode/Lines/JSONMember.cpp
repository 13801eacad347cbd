// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Lines/JSONMember.h"

#include "Tools/Decode/Lines/JSONNode.h"
#include "Tools/Text/JSONText.h"

namespace velmora {

JSONMember::JSONMember() = default;
JSONMember::~JSONMember() = default;
JSONMember::JSONMember(JSONMember&&) noexcept = default;
JSONMember& JSONMember::operator=(JSONMember&&) noexcept = default;

void JSONMember::become(const void* source, std::string_view label) {
    becomeEntry(source);
    _label = label;
    appendJsonString(_text, label);
    _text.append(':');
    _valueAt = _text.size();
}

void JSONMember::becomeEntry(const void* source) {
    setSource(source);
    _showsNode = false;
    _label.clear();
    _text.clear();
    _text.append(',');
    _valueAt = _text.size();
}

void JSONMember::setSource(const void* source) {
    _source = source;
    _isNumber = false;
}

void JSONMember::beginValue() {
    _text.truncate(_valueAt);
    _isNumber = false;
    _showsNode = false;
}

void JSONMember::formatNumber(const Field& field, std::int64_t raw) {
    setText(FormattedText(field.format, raw).view());
    _raw = raw;
    _isNumber = _source == &field;
}

void JSONMember::setText(std::string_view text) {
    beginValue();
    appendJsonString(_text, text);
}

void JSONMember::setValue(const Value& value) {
    beginValue();
    appendJson(_text, value);
}

JSONNode& JSONMember::setNode(bool isArray) {
    if (!_node || _node->isArray() != isArray)
        _node = std::make_unique<JSONNode>(isArray);
    beginValue();
    _showsNode = true;
    return *_node;
}

void JSONMember::appendNode(TextBuffer& out) const {
    _node->append(out);
}

} // namespace velmora
