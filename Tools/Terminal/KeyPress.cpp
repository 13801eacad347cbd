// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/KeyPress.h"

#include <string_view>

namespace velmora {

Key scrollKey(const KeyPress& press) {
    struct Letter {
        std::string_view text;
        Key key;
    };
    static constexpr Letter letters[] = {
        {"k", Key::Up},       {"j", Key::Down}, {"b", Key::PageUp},
        {" ", Key::PageDown}, {"g", Key::Home}, {"G", Key::End},
    };
    if (press.key == Key::Character)
        for (const Letter& letter : letters)
            if (press.text == letter.text)
                return letter.key;
    return press.key;
}

} // namespace velmora
