// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Benchmarks/HandWritten/ValueForm.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>

namespace velmora {

/// The texts of a field of so many bits, made once, ready to be copied.
template <unsigned bits>
class ValueTexts {
public:
    explicit ValueTexts(const ValueForm& form) {
        for (unsigned raw = 0; raw < _texts.size(); ++raw)
            _texts[raw].length =
                static_cast<std::uint8_t>(form.append(_texts[raw].characters, raw) - _texts[raw].characters);
    }

    /// Appends the text of the field's raw value; `to` has room for 15 characters. Returns the text's end.
    char* append(char* to, unsigned raw) const {
        const Text& text = _texts[raw];
        std::memcpy(to, text.characters, sizeof text.characters);
        return to + text.length;
    }

private:
    struct Text {
        char characters[15];
        std::uint8_t length;
    };
    std::array<Text, std::size_t{1} << bits> _texts{};
};

/// The same without texts that are made before: each is written when it is needed.
template <unsigned>
class WrittenValues {
public:
    explicit WrittenValues(const ValueForm& form) : _form(form) {}

    char* append(char* to, unsigned raw) const { return _form.append(to, raw); }

private:
    ValueForm _form;
};

} // namespace velmora
