// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

namespace velmora {

/// A key of a terminal.
enum class Key : std::uint8_t {
    Character, ///< any that types one
    Up,
    Down,
    Left,
    Right,
    PageUp,
    PageDown,
    Home,
    End,
    Enter,
    Escape,
    Tab,
    BackTab,
    Backspace,
    EraseLine, ///< Ctrl-U
    Redraw,    ///< Ctrl-L
    Suspend,   ///< Ctrl-Z
    Interrupt, ///< Ctrl-C, where it is no signal
};

struct KeyPress {
    Key key = Key::Character;
    std::string text{}; ///< of a character: its UTF-8

    friend bool operator==(const KeyPress&, const KeyPress&) = default;
};

/// The key by which people scroll: where no text is typed, j, k, b, g, G and the blank move as in other
/// programs. Others stay what they are.
[[nodiscard]] Key scrollKey(const KeyPress& press);

} // namespace velmora
