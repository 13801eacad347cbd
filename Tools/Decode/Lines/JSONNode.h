// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Lines/JSONMember.h"

#include <cstddef>
#include <string_view>
#include <vector>

namespace velmora {

/// A dictionary or array of a display as JSON: what the node is that a DisplayWriter writes, with the same
/// order of labels, but that its values are the text of a line. Of a record that follows another, only what
/// has changed is written, and nothing is allocated once there has been one as long.
class JSONNode {
public:
    explicit JSONNode(bool isArray) : _isArray(isArray) {}

    [[nodiscard]] bool isArray() const { return _isArray; }
    /// Makes this the JSON of a node, which must be of the kind.
    void read(const Value& node);

    /// The member of that label, a new one at the end where there is none: see Dictionary::slot. `source` is
    /// the constant that names it. Valid until the next call, as each that follows.
    [[nodiscard]] JSONMember& member(const void* source, std::string_view label) {
        if (_next < _count && _members[_next].source() == source)
            return _members[_next++];
        return find(source, label);
    }
    /// The member at that index, which has this label then: see Dictionary::slotAt. `source` may be null,
    /// where the label is no constant.
    [[nodiscard]] JSONMember& memberAt(std::size_t index, const void* source, std::string_view label) {
        if (source && index < _count && _members[index].source() == source)
            return _members[index];
        return replace(index, source, label);
    }
    /// The entry of an array at that index.
    [[nodiscard]] JSONMember& entryAt(std::size_t index, const void* source) {
        if (index < _count && _members[index].source() == source)
            return _members[index];
        return replaceEntry(index, source);
    }
    void remove(std::string_view label);
    void truncate(std::size_t count);

    void append(TextBuffer& out) const {
        const std::size_t begin = out.size();
        for (std::size_t i = 0; i < _count; ++i)
            _members[i].append(out);
        if (_count == 0)
            out.append(' ');
        out.replace(begin, _isArray ? '[' : '{'); // in place of a comma
        out.append(_isArray ? ']' : '}');
    }

private:
    [[nodiscard]] JSONMember& find(const void* source, std::string_view label);
    [[nodiscard]] JSONMember& replace(std::size_t index, const void* source, std::string_view label);
    [[nodiscard]] JSONMember& replaceEntry(std::size_t index, const void* source);
    /// The member after the last, of which nothing is known yet.
    [[nodiscard]] JSONMember& add();

    bool _isArray;
    std::size_t _count = 0;
    std::size_t _next = 0;            ///< after the one that was found last: fields are named in their order
    std::vector<JSONMember> _members; ///< those from `_count` on are kept for later ones
};

} // namespace velmora
