// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "Tests/Support/CapturedLog.h"

#include <cstdint>
#include <functional>
#include <initializer_list>
#include <iosfwd>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

/// What the tests of sections share: a section with a node of its own, that node as text, and the records.

namespace velmora {

/// A log line as a failing test prints it.
void PrintTo(const CapturedLog::Line& line, std::ostream* out);

using LogLines = std::vector<CapturedLog::Line>;

/// A value as text, in its order: 'text' a string, {Label 'text', List ['a', 'b']} a dictionary, [...] an
/// array. Any other kind shows as <its name>.
[[nodiscard]] std::string shown(const Value& value);

/// A section and the node that it writes into.
class SectionHarness {
public:
    SectionHarness(std::unique_ptr<Base> section, Value node);

    /// Gives the section the record under the code in the record's header; log lines are kept for `lines`.
    SectionHarness& update(const Data& record);
    /// The same under another code.
    SectionHarness& update(const Data& record, std::uint32_t logCode);

    /// The node as `shown` returns it.
    [[nodiscard]] std::string node() const { return shown(value()); }
    /// The text under a label of a dictionary node; "(none)" where there is none.
    [[nodiscard]] std::string text(std::string_view label) const;
    [[nodiscard]] const Value& value() const {
        _section->writeNode();
        return _node;
    }

    /// The log lines of the last update.
    [[nodiscard]] const LogLines& lines() const { return _lines; }
    /// Those of error priority.
    [[nodiscard]] std::vector<std::string> errors() const;

private:
    std::unique_ptr<Base> _section;
    Value _node;
    LogLines _lines;
};

/// A section with an empty dictionary.
template <class Section>
SectionHarness inDictionary() {
    return SectionHarness(std::make_unique<Section>(), makeDictionary());
}
/// A section with an array that holds the row 'earlier'.
template <class Section>
SectionHarness inArray() {
    return SectionHarness(std::make_unique<Section>(), std::make_shared<Array>(Array{"earlier"}));
}

/// The code under which a record is routed.
[[nodiscard]] std::uint32_t logCodeOf(const Data& record);

/// The record with one byte changed. Precondition: the offset lies inside.
[[nodiscard]] Data withByte(const Data& record, std::size_t offset, std::uint8_t value);
/// The first bytes of the record in a buffer of just that size, so that a read past their end is detected.
[[nodiscard]] Data prefixOf(const Data& record, std::size_t length);
/// A record of `length` bytes whose payload is zero but for the bytes given by offset.
struct ByteAt {
    std::size_t offset;
    std::uint8_t value;
};
[[nodiscard]] Data recordWith(std::uint16_t code, std::size_t length,
                              std::initializer_list<ByteAt> bytes = {});

/// One value of an enumeration under test.
struct ExpectedText {
    unsigned value;
    std::string_view text;
};

/// Puts every byte value at `offset` of the record and expects its text under `label`: the table's, or
/// `fallback` for a value that the table leaves out.
void expectEnumeration(const std::function<SectionHarness()>& make, const Data& record, std::size_t offset,
                       std::string_view label, std::initializer_list<ExpectedText> table,
                       std::string_view fallback);

/// Expects a byte's text for zero and, for every other value, the one for what is not zero.
void expectFlag(const std::function<SectionHarness()>& make, const Data& record, std::size_t offset,
                std::string_view label, std::string_view set, std::string_view clear);

/// Feeds every prefix of the record to a new section. Those below the minimum are to leave the node as it was
/// and the log with the trace word alone; the others are to show `expected(length)`.
void expectPrefixes(const std::function<SectionHarness()>& make, const Data& record, std::size_t minimum,
                    std::string_view trace, const std::function<std::string(std::size_t)>& expected);
/// The same where what is shown is the same for every length.
void expectPrefixes(const std::function<SectionHarness()>& make, const Data& record, std::size_t minimum,
                    std::string_view trace, const std::string& expected);

/// A cell dictionary of the cell information array: technology and type by the last word of their constant
/// ("GSM", "Serving"), then numbers by the last word of their key ("LAC"). An empty technology or type leaves
/// that key out.
[[nodiscard]] Value cell(std::string_view technology, std::string_view type,
                         std::initializer_list<Dictionary::Entry> numbers = {});
/// The record of a cell information array.
[[nodiscard]] Data cellInfo(std::initializer_list<Value> cells);
/// A record of the cell information array's code whose payload is no property list.
[[nodiscard]] Data unreadableCellInfo();

} // namespace velmora
