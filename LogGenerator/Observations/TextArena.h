// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <deque>
#include <string>
#include <string_view>

namespace velmora {

/// Storage for short texts that are dropped all at once and whose storage is used again.
class TextArena {
public:
    /// An empty text to be filled; it stays where it is until `clear`.
    [[nodiscard]] std::string& add() {
        if (_used == _texts.size())
            _texts.emplace_back();
        std::string& text = _texts[_used++];
        text.clear();
        return text;
    }
    [[nodiscard]] std::string_view copy(std::string_view text) { return add().assign(text); }
    void clear() { _used = 0; }

private:
    std::deque<std::string> _texts;
    std::size_t _used = 0;
};

} // namespace velmora
