// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <optional>
#include <string_view>

namespace velmora {

/// A sentence of NMEA 0183 whose checksum is right, split into its fields. Does not own its text.
class NMEASentence {
public:
    /// Sentences have 82 characters, but receivers of several systems send longer ones.
    static constexpr std::size_t maximumLength = 1024;
    static constexpr std::size_t maximumFields = 64;

    /// None where the text is no sentence: another beginning, characters that are not printable, no checksum
    /// or a wrong one, too many fields. White space around it does not count.
    [[nodiscard]] static std::optional<NMEASentence> parse(std::string_view text);

    /// Its kind, whichever system reports it: "GGA" of "GPGGA" and "GNGGA"; empty for a maker's own sentence.
    [[nodiscard]] std::string_view kind() const { return _kind; }
    /// A field after the address, from 0; empty where the sentence has fewer.
    [[nodiscard]] std::string_view field(std::size_t index) const {
        return index < _count ? _fields[index] : std::string_view();
    }

private:
    std::string_view _kind;
    std::array<std::string_view, maximumFields> _fields;
    std::size_t _count = 0;
};

/// The checksum of what lies between "$" and "*".
[[nodiscard]] unsigned nmeaChecksum(std::string_view content);

} // namespace velmora
