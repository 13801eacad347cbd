// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/KeptRecords.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogMessages/Record.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora::C2K {

/// What a parser takes from a record that it accepts: the bytes that it reads its values from later, and a
/// number for what depends on earlier records.
struct Reading {
    Record record = Record(Bytes());
    std::optional<double> number = std::nullopt;
    KeptRecords::Parts parts = 1; ///< the groups of values that the reading publishes, a bit each
    bool isIncomplete = false;    ///< the record ends before something that it must have

    static constexpr std::size_t mostParts = 2;
};

/// Turns the records of one log code into values, which have value keys ("kChannel") instead of labels. A
/// parser keeps nothing itself: values that accumulate from record to record are in the state dictionary,
/// which outlives decoders.
class LogCodeParser {
public:
    virtual ~LogCodeParser() = default;
    LogCodeParser(const LogCodeParser&) = delete;
    LogCodeParser& operator=(const LogCodeParser&) = delete;

    [[nodiscard]] virtual std::uint16_t logCode() const = 0;
    /// What such records are called.
    [[nodiscard]] virtual std::string_view name() const = 0;
    /// Takes one record, prefix removed, of whatever length, on arrival: checks it, logs its
    /// errors, and updates the running values. None for a record that publishes nothing; one that is rejected
    /// leaves the state as it is. The reading refers to the record's bytes.
    [[nodiscard]] virtual std::optional<Reading> accept(const Record& record, Dictionary& state) const = 0;
    /// Names the values of such a reading to the visitor, in publishing order; those of its parts alone.
    virtual void decode(const Reading& reading, FieldVisitor& visitor) const = 0;
    /// Describes everything that `decode` may name.
    virtual void describe(ContentVisitor& visitor) const = 0;

protected:
    LogCodeParser() = default;

    /// The length as the log lines show it.
    [[nodiscard]] static unsigned lengthOf(const Record& record) {
        return static_cast<unsigned>(record.size());
    }
};

} // namespace velmora::C2K
