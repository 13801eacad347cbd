// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "PropertyLists/Value.h"
#include "Tests/Support/CapturedLog.h"

#include <cstdint>
#include <initializer_list>
#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

/// What the tests of the CDMA2000 parsers share: a parser with a state and a display of its own, and the
/// records.

namespace velmora {

/// A log line as a failing test prints it.
void PrintTo(const CapturedLog::Line& line, std::ostream* out);

using LogLines = std::vector<CapturedLog::Line>;

/// A value as text, in its order: 'text' a string, {Label 'text'} a dictionary, [...] an array; numbers as
/// such. Any other kind shows as <its name>.
[[nodiscard]] std::string shown(const Value& value);

/// Every value key that a parser publishes.
[[nodiscard]] const std::vector<std::string>& valueKeys();

/// The parsers with a state and a display in which every value is under its value key. The display is
/// empty at first, so that values are in publishing order.
class ParserHarness {
public:
    ParserHarness();

    /// Hands the record to the parser of its code; log lines are kept for `lines`.
    ParserHarness& update(const Data& record);

    [[nodiscard]] std::string display() const { return shown(_display); }
    /// The text under a value key; "(none)" where there is none.
    [[nodiscard]] std::string text(std::string_view valueKey) const;
    /// Puts a text there.
    void show(std::string_view valueKey, std::string_view text) { _display->set(valueKey, text); }

    /// The log lines of the last update.
    [[nodiscard]] const LogLines& lines() const { return _lines; }

    /// Holds an empty "ExtraInfo" at first.
    Dictionary state;

private:
    DictionaryRef _display = makeDictionary();
    DictionaryRef _lookup = makeDictionary();
    LogLines _lines;
};

/// One error line, as `lines` returns it.
[[nodiscard]] LogLines error(std::string text);

/// The record with one byte changed. Precondition: the offset lies inside.
[[nodiscard]] Data withByte(const Data& record, std::size_t offset, std::uint8_t value);
/// The first bytes of the record in a buffer of just that size, so that a read past their end is detected.
[[nodiscard]] Data prefixOf(const Data& record, std::size_t length);

/// A little-endian field of a record.
struct FieldAt {
    std::size_t offset;
    std::size_t width; ///< in bytes
    std::uint64_t value;
};
/// The record with fields changed. Precondition: they lie inside.
[[nodiscard]] Data withFields(const Data& record, std::initializer_list<FieldAt> fields);
/// A record of `length` bytes (at least 13) whose payload is zero but for the fields.
[[nodiscard]] Data recordWith(std::uint16_t code, std::size_t length,
                              std::initializer_list<FieldAt> fields = {});

/// One value of an enumeration under test.
struct ExpectedText {
    unsigned value;
    std::string_view text;
};

/// Puts every byte value at `offset` of the record and expects its text under the value key: the table's, or
/// `before`, the value and `after` for one that the table leaves out.
void expectEnumeration(const Data& record, std::size_t offset, std::string_view valueKey,
                       std::initializer_list<ExpectedText> table, std::string_view before,
                       std::string_view after);

extern const std::initializer_list<ExpectedText> expectedBandClasses;

} // namespace velmora
