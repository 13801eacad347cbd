// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <string>

namespace velmora {

/// What a property list may ask of its reader. Input that goes past a limit is refused whole.
struct PropertyListLimits {
    /// Arrays and dictionaries nested in one another, the root being 1.
    std::size_t maximumDepth = 128;
    /// Values, each dictionary key and each repeated reference counted.
    std::size_t maximumObjects = 1'000'000;
    /// Size of the input.
    std::size_t maximumBytes = std::size_t{256} << 20;
};

/// Reads a property list of either form: binary where the input begins "bplist", XML otherwise.
///
/// Never reads past the input and never takes more time, memory or stack than the limits allow, whatever the
/// input holds. Integers outside the range of a signed 64-bit number, text that is not valid Unicode, and
/// anything after the root value but white space are refused, and so are dates outside the years 0001 to
/// 9999; fractions of a date's second are dropped. Values that stand behind several references become values
/// of their own, and the text and data that they repeat may not add up to more than the input might have. A
/// key that stands twice in a dictionary keeps its first place and its last value. A reason gives the offset
/// in the input wherever it concerns one place.
Result<Value> readPropertyList(Bytes input, const PropertyListLimits& limits = {});

/// The XML form, version 1.0. Fails for what the form cannot carry: no value, a string with a control
/// character that XML does not know or that is not UTF-8, a date outside the years 0001 to 9999, nesting
/// deeper than the reader's default limit (as a value that contains itself has).
Result<std::string> writeXMLPropertyList(const Value& root);

/// The binary form, version 00. Fails for no value, text that is not UTF-8, a date outside the years 0001 to
/// 9999, and nesting deeper than the reader's default limit.
Result<std::vector<std::uint8_t>> writeBinaryPropertyList(const Value& root);

/// The reader of the binary form alone, without a look at what the input begins with.
Result<Value> readBinaryPropertyList(Bytes input, const PropertyListLimits& limits);

/// The reader of the XML form alone: one value, inside <plist> or bare. The text is UTF-8, whatever encoding
/// the document names. Attributes, comments, processing instructions and the document type are passed over;
/// of references only XML's own five and those to characters are known.
Result<Value> readXMLPropertyList(Bytes input, const PropertyListLimits& limits);

} // namespace velmora
