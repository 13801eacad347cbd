// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// Colours by their use. They follow the user's palette, light or dark, also when it changes while the
/// program runs.
enum class Color {
    automatic, ///< the toolkit's default for the element in its state (a selected row's text, say)
    clear,     ///< transparent
    darkText,  ///< text on the ordinary ground: dark on a light palette, light on a dark one
    secondary, ///< secondary text
    ground,    ///< the ordinary ground
    poor,      ///< how good something is, in texts and bars, always with a word beside the colour
    fair,
    good,
    excellent
};

} // namespace velmora
