// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstddef>
#include <cstdint>
#include <string>

namespace velmora::C2K {

/// A list of pilots or fingers as a sub-screen: each shows under its PN offset, in the order of their keys
/// ("%d;%d": index in the record, PN offset), which the marker "_sorted" asks for.
class PilotList {
public:
    PilotList() { _pilots->set("_sorted", "_sorted"); }

    /// `index` counts all of the record's entries, those that are left out as well.
    void add(std::size_t index, std::uint16_t pnOffset, std::string text) {
        _pilots->set(std::to_string(index) + ";" + std::to_string(pnOffset), std::move(text));
    }

    /// Whether no pilot has been added.
    [[nodiscard]] bool empty() const { return _pilots->size() == 1; }

    [[nodiscard]] Value value() const { return _pilots; }
    /// The same, or the text "(none)" for an empty list.
    [[nodiscard]] Value valueOrNone() const { return empty() ? Value("(none)") : value(); }

private:
    DictionaryRef _pilots = makeDictionary();
};

/// "%+.2f dB" of a power ratio; a ratio of 0 shows "-inf dB".
[[nodiscard]] std::string decibels(double ratio);
/// The same for energies in units of 1/512.
[[nodiscard]] inline std::string decibelsOf512ths(std::uint16_t energy) {
    return decibels(energy / 512.0);
}

} // namespace velmora::C2K
