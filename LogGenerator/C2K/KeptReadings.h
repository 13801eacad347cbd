// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/KeptRecords.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

namespace velmora::C2K {

/// The latest reading of each parser, part by part since not every reading has all, until it is written into
/// the display that the lookup leads to (see KeptRecords). Main thread only.
class KeptReadings {
public:
    KeptReadings();

    /// The lookup to write by from now on; null where nothing is shown anywhere. What has been kept for
    /// another one is written there before.
    void use(const DictionaryRef& lookup);
    /// Readings of a parser that shows nothing need not be kept. By default all are.
    void setKept(const LogCodeParser& parser, bool isKept) { _isKept[indexOf(parser)] = isKept; }
    /// How many readings of the parser have been kept, by its index; the number itself stays where it is.
    [[nodiscard]] const std::uint64_t& changes(std::size_t parser) const { return _changes[parser]; }
    /// Keeps a reading of that parser, unless there is no lookup.
    void keep(const LogCodeParser& parser, const Reading& reading);
    /// Writes what has been kept, in the order of arrival.
    void write();

private:
    KeptRecords _records;                        ///< one a part of each parser's readings, in their order
    std::vector<std::optional<double>> _numbers; ///< of these readings
    std::vector<bool> _isKept;                   ///< by parser, as the next
    std::vector<std::uint64_t> _changes;
    std::weak_ptr<const Dictionary> _lookup;
    const Dictionary* _used = nullptr; ///< the lookup, to be compared only
};

} // namespace velmora::C2K
