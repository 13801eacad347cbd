// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace velmora {

/// How a character appears in text that is safe to print.
enum class CharacterKind : std::uint8_t {
    Shown,   ///< as it is
    Mark,    ///< as it is where it follows another one, up to eight of them
    Control, ///< escaped: it controls a terminal or the text around it
    Hidden,  ///< escaped: it has no glyph, or no character is assigned to it
};
[[nodiscard]] CharacterKind kindOf(char32_t character);

/// Text that is safe to print: what a file or another program says must not be able to control the terminal,
/// to turn the order of what is printed around it, or to hide in it. Line feeds, tabs and carriage returns
/// become "\n", "\t", "\r"; other control characters "\xNN" or "\u{NN}"; so do format characters (Unicode's
/// category Cf: directions, tags, joiners, the byte order mark), separators of lines and paragraphs, fillers
/// and what no character is assigned to; and combining marks, of which a character keeps eight, where they
/// follow none. A byte that is no UTF-8 becomes U+FFFD. Text without any of these is unchanged, and so is
/// text that was made printable before.
[[nodiscard]] std::string printable(std::string_view text);

/// The same for a line of the log: a trailing line feed is left out, others become blanks.
[[nodiscard]] std::string printableLine(std::string_view text);

/// The same for text of several lines, whose line feeds are kept.
[[nodiscard]] std::string printableLines(std::string_view text);

/// Whether the text is nothing but ASCII that is printable as it is.
[[nodiscard]] bool isPlain(std::string_view text);

/// The terminal columns that printable text takes, as Unicode has them: none for combining marks, two for
/// East Asian wide characters and emoji, otherwise one a character.
[[nodiscard]] std::size_t displayWidth(std::string_view text);

/// The longest prefix of printable text that fits into `columns`; a truncated one ends in "…".
[[nodiscard]] std::string clipped(std::string_view text, std::size_t columns);

} // namespace velmora
