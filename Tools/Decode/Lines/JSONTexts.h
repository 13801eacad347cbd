// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Lines/NumberTexts.h"
#include "Tools/Text/TextBuffer.h"

#include <unordered_map>

namespace velmora {

/// What the JSON of all nodes shares: the texts of each field's numbers, and room for a value's text.
class JSONTexts {
public:
    [[nodiscard]] NumberTexts& of(const Field& field) {
        return _numbers.try_emplace(&field, field).first->second;
    }
    /// Empty, for one text at a time.
    [[nodiscard]] TextBuffer& emptyBuffer() {
        _buffer.clear();
        return _buffer;
    }

private:
    std::unordered_map<const Field*, NumberTexts> _numbers;
    TextBuffer _buffer;
};

} // namespace velmora
