// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"
#include "Tools/Text/TextBuffer.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

class JSONNode;
class Value;

/// One member of a JSONNode: the text of its label and value with the comma before, which stays while the
/// value does, or its label and a node of its own. An entry of an array has no label.
class JSONMember {
public:
    JSONMember();
    ~JSONMember();
    JSONMember(JSONMember&&) noexcept;
    JSONMember& operator=(JSONMember&&) noexcept;
    JSONMember(const JSONMember&) = delete;
    JSONMember& operator=(const JSONMember&) = delete;

    /// Makes this the member of that field or list, a constant; null for any other.
    void become(const void* source, std::string_view label);
    void becomeEntry(const void* source);
    /// The same member, which this field or list shows from now on.
    void setSource(const void* source);

    [[nodiscard]] const void* source() const { return _source; }
    [[nodiscard]] const std::string& label() const { return _label; }

    /// The value as the field's format shows it. Nothing is done where it shows it already.
    void setNumber(const Field& field, std::int64_t raw) {
        if (!_isNumber || raw != _raw || _source != &field)
            formatNumber(field, raw);
    }
    void setText(std::string_view text);
    void setValue(const Value& value);
    /// A node of that kind is the value: the one that was there before, with what it holds, where there was
    /// one.
    [[nodiscard]] JSONNode& setNode(bool isArray);

    void append(TextBuffer& out) const {
        out.append(_text.view());
        if (_showsNode)
            appendNode(out);
    }

private:
    static constexpr std::size_t usualLength = 96;

    void formatNumber(const Field& field, std::int64_t raw);
    void beginValue();
    void appendNode(TextBuffer& out) const;

    TextBuffer _text{usualLength}; ///< all of it, or what precedes the node
    std::size_t _valueAt = 0;
    const void* _source = nullptr;
    std::int64_t _raw = 0;
    bool _isNumber = false; ///< the text is that of `_raw`, as the source shows it
    bool _showsNode = false;
    std::string _label;
    std::unique_ptr<JSONNode> _node;
};

} // namespace velmora
