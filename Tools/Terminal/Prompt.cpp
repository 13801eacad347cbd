// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/Prompt.h"

#include "Platform/PrintableText.h"

namespace velmora {

Prompt::Outcome Prompt::take(const KeyPress& press) {
    switch (press.key) {
    case Key::Character:
        if (_text.size() + press.text.size() <= mostBytes)
            _text += press.text;
        break;
    case Key::Backspace:
        // The bytes of a character after its first begin with the bits 10.
        while (!_text.empty() && (static_cast<unsigned char>(_text.back()) & 0xC0) == 0x80)
            _text.pop_back();
        if (!_text.empty())
            _text.pop_back();
        break;
    case Key::EraseLine: _text.clear(); break;
    case Key::Enter: return Outcome::Finished;
    case Key::Escape:
    case Key::Interrupt: return Outcome::Cancelled;
    default: break;
    }
    return Outcome::GoesOn;
}

std::string Prompt::line() const {
    return _question + printable(_text) + "_";
}

} // namespace velmora
