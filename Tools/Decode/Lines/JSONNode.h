// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"
#include "Tools/Decode/Lines/JSONMember.h"
#include "Tools/Decode/Lines/JSONTexts.h"
#include "Tools/Text/TextBuffer.h"

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

namespace velmora {

class Value;

/// A dictionary or array of a display as JSON: what the node is that a DisplayWriter writes, with the same
/// order of labels, but that its values are the text of a line. Of a record that follows another, only what
/// has changed is written, and nothing is allocated once there has been one as long.
///
/// Members are referred to by index, until one is removed.
class JSONNode {
public:
    /// `texts` is shared with other nodes and outlives this.
    JSONNode(bool isArray, JSONTexts& texts) : _isArray(isArray), _texts(texts) {}

    [[nodiscard]] bool isArray() const { return _isArray; }
    /// Makes this the JSON of a node, which must be of the kind.
    void read(const Value& node);

    /// The member of that label, a new one at the end where there is none: see Dictionary::slot. `source` is
    /// the constant that names it.
    [[nodiscard]] std::size_t member(const void* source, std::string_view label) {
        if (_next < _count && _members[_next].source == source)
            return _next++;
        return find(source, label);
    }
    /// The member at that index, which has this label then: see Dictionary::slotAt. `source` may be null,
    /// where the label is no constant.
    [[nodiscard]] std::size_t memberAt(std::size_t index, const void* source, std::string_view label) {
        if (!source || index >= _count || _members[index].source != source)
            replace(index, source, label);
        return index;
    }
    /// The entry of an array at that index.
    [[nodiscard]] std::size_t entryAt(std::size_t index, const void* source) {
        if (index >= _count || _members[index].source != source)
            replaceEntry(index, source);
        return index;
    }
    void remove(std::string_view label);
    void truncate(std::size_t count) {
        if (count < _count)
            cut(count);
    }

    /// The member's value as the field's format shows it. Nothing is done where it shows it already.
    void setNumber(std::size_t index, const Field& field, std::int64_t raw) {
        JSONMember& to = _members[index];
        if (!to.isNumber || to.raw != raw || to.source != &field)
            writeNumber(to, field, raw);
    }
    void setText(std::size_t index, std::string_view text);
    void setValue(std::size_t index, const Value& value);
    /// A node of that kind is the value: the one that was there before, with what it holds, where there was
    /// one.
    [[nodiscard]] JSONNode& setNode(std::size_t index, bool isArray);

    void append(TextBuffer& out) const {
        if (_count == 0) {
            out.append(std::string_view(_isArray ? "[]" : "{}"));
            return;
        }
        const std::size_t begin = out.size();
        if (_nodes == 0)
            out.append(_text.view());
        else
            appendWithNodes(out);
        *out.at(begin) = _isArray ? '[' : '{'; // in place of a comma
        out.append(_isArray ? ']' : '}');
    }

private:
    [[nodiscard]] std::size_t find(const void* source, std::string_view label);
    void replace(std::size_t index, const void* source, std::string_view label);
    void replaceEntry(std::size_t index, const void* source);
    void cut(std::size_t count);
    /// A new member at the end, with this label, or none, and without a value.
    JSONMember& add(const void* source, const std::string_view* label);
    void setSource(JSONMember& member, const void* source);

    void writeNumber(JSONMember& to, const Field& field, std::int64_t raw);
    /// Makes that the text of the member's value.
    void put(JSONMember& to, std::string_view json);
    /// Makes the text of its value so long, and moves what follows.
    void resize(JSONMember& to, std::size_t length);
    void showNode(JSONMember& member, bool shows);
    void appendWithNodes(TextBuffer& out) const;

    bool _isArray;
    JSONTexts& _texts;
    TextBuffer _text{256};  ///< of all members, one after another, without the nodes that they show
    std::size_t _nodes = 0; ///< how many members show one
    std::size_t _count = 0;
    std::size_t _next = 0;            ///< after the one that was found last: fields are named in their order
    std::vector<JSONMember> _members; ///< those from `_count` on are kept for later ones
};

} // namespace velmora
