// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// Asks for digits of one width (the OpenType feature tnum), so that a value that changes does not move what
/// is beside it. Qt can from 6.7 on; before that, digits are as the font has them by default, which in most
/// interface fonts is of one width too.
template <class FontType>
void useTabularDigits(FontType& font) {
    if constexpr (requires { font.setFeature(typename FontType::Tag("tnum"), 1); })
        font.setFeature(typename FontType::Tag("tnum"), 1);
}

} // namespace velmora
