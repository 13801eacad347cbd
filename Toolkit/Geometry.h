// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// Lengths and places on the screen are in points: the unit that the platform scales to the display's pixels
/// and to the user's taste, x to the right and y downward from the top left corner of its container.
struct Point {
    double x = 0;
    double y = 0;
    friend bool operator==(const Point&, const Point&) = default;
};

/// Width and height in points.
struct Size {
    double width = 0;
    double height = 0;
    friend bool operator==(const Size&, const Size&) = default;
};

/// A rectangle in points, written Rect{x, y, width, height}.
struct Rect {
    double x = 0;
    double y = 0;
    double width = 0;
    double height = 0;
    [[nodiscard]] Point origin() const { return {x, y}; }
    [[nodiscard]] Size size() const { return {width, height}; }
    friend bool operator==(const Rect&, const Rect&) = default;
};

} // namespace velmora
