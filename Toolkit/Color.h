// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// What a thing is coloured with. Colours are named for their use and follow the user's palette, light or
/// dark, also when it changes while the program runs.
enum class Color {
    automatic, ///< what the toolkit gives a thing of its kind in its place (a selected row's text, say)
    clear,     ///< nothing: what lies below shows
    darkText,  ///< text on the ordinary ground: dark on a light palette, light on a dark one
    secondary, ///< text that stands back
    ground     ///< the ordinary ground
};

} // namespace velmora
