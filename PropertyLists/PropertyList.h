// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <string>

namespace velmora {

/// The limits of a property-list reader. Input that exceeds one is rejected. The defaults are those of a
/// message from a port or a recording: a few bytes can refer to the same object very often.
struct PropertyListLimits {
    /// Arrays and dictionaries nested in one another, the root being 1.
    std::size_t maximumDepth = 128;
    /// Values, each dictionary key and each repeated reference counted.
    std::size_t maximumObjects = 100'000;
    /// Size of the input.
    std::size_t maximumBytes = std::size_t{256} << 20;
    /// Memory of the values, repeated references counted; an estimate that is not exceeded by much.
    std::size_t maximumMemory = std::size_t{64} << 20;
    /// Whether the log gets an error line with the reason where one of the limits is exceeded: for receivers
    /// that only know good and malformed messages.
    bool logsExcess = false;
    /// Whether a reason may quote texts and names of the input.
    bool quotesInput = true;
};

/// The limits of log messages, whose decoders do not log reasons themselves. What is quoted from them could
/// be a number of the subscriber, and reasons get into logs.
inline constexpr PropertyListLimits messageLimits{.logsExcess = true, .quotesInput = false};

/// Reads a property list of either form: binary where the input begins "bplist", XML otherwise.
///
/// Never reads past the input and never takes more time, memory or stack than the limits allow, whatever the
/// input holds. Integers outside the range of a signed 64-bit number, text that is not valid Unicode, and
/// anything after the root value but white space are refused, and so are dates outside the years 0001 to
/// 9999; fractions of a date's second are dropped. Values that are referenced several times are copied, and
/// counted as often. A duplicate key of a dictionary keeps its first position and its last value. A reason
/// names the offset in the input where it has one.
Result<Value> readPropertyList(Bytes input, const PropertyListLimits& limits = {});

/// The XML form, version 1.0. Fails for what the form cannot represent: no value, a string with a control
/// character that XML does not allow or that is not UTF-8, a date outside the years 0001 to 9999, nesting
/// deeper than the reader's default limit (which a value that contains itself exceeds).
Result<std::string> writeXMLPropertyList(const Value& root);

/// The binary form, version 00. Fails for no value, text that is not UTF-8, a date outside the years 0001 to
/// 9999, and nesting deeper than the reader's default limit.
Result<std::vector<std::uint8_t>> writeBinaryPropertyList(const Value& root);

/// The XML form, or the binary form where a text holds what XML cannot represent: the bytes of either, which
/// give an equal value when they are read. Fails for what the binary form fails for.
Result<std::string> writePropertyList(const Value& root);

/// The reader of the binary form only, regardless of the input's first bytes.
Result<Value> readBinaryPropertyList(Bytes input, const PropertyListLimits& limits);

/// The reader of the XML form only: one value, inside <plist> or bare. The text is UTF-8, whatever encoding
/// the document names. Attributes, comments, processing instructions and the document type are skipped; only
/// XML's five predefined references and character references are supported.
Result<Value> readXMLPropertyList(Bytes input, const PropertyListLimits& limits);

} // namespace velmora
