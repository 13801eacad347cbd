// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Geometry.h"

#include <string>
#include <string_view>

namespace velmora {

/// A font by family, size and weight. Sizes are in points, so that text keeps its proportion to the frames
/// around it; the user's text scaling applies on top. A value; may be made before the application.
class Font {
public:
    /// The user's interface font in that size.
    [[nodiscard]] static Font systemFontOfSize(double size);
    [[nodiscard]] static Font boldSystemFontOfSize(double size);
    /// The family of that name, or the platform's best match where it is not installed.
    [[nodiscard]] static Font named(std::string family, double size);

    /// Empty for the user's interface font.
    [[nodiscard]] const std::string& family() const { return _family; }
    [[nodiscard]] double size() const { return _size; }
    [[nodiscard]] bool isBold() const { return _isBold; }

    friend bool operator==(const Font&, const Font&) = default;

private:
    Font(std::string family, double size, bool isBold);

    std::string _family;
    double _size;
    bool _isBold;
};

/// The size of the text (UTF-8) on one line: its advance width and the font's line height, in points. Line
/// breaks count as blanks. Needs the application.
[[nodiscard]] Size sizeOfText(std::string_view text, const Font& font);

} // namespace velmora
