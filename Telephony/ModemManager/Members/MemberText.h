// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

/// How a member of ModemManager's becomes text, lists of texts, or bytes. As with the numbers, each function
/// returns none for a member that is missing, of another type than ModemManager documents, or out of range.
namespace velmora::convert {

/// Text for people: not empty, at most 128 bytes, and nothing in it but what can be shown.
[[nodiscard]] Value text(const Value& member);
/// A list of such texts; none where it would be empty.
[[nodiscard]] Value textList(const Value& member);
/// Decimal digits alone.
[[nodiscard]] Value digits(const Value& member);
/// Hexadecimal digits alone: an IMEI, an MEID or an ESN.
[[nodiscard]] Value equipment(const Value& member);
/// "MCCMNC", five or six digits.
[[nodiscard]] Value network(const Value& member);
/// A list of ("MCCMNC", access technologies) as dictionaries of kVoxSIMOperatorCode and
/// kVoxLinkAccessTechnologies.
[[nodiscard]] Value preferredNetworks(const Value& member);
/// An address of the Internet.
[[nodiscard]] Value internetAddress(const Value& member);
/// (name of an error, text) as one text.
[[nodiscard]] Value error(const Value& member);
/// Bytes, at least one.
[[nodiscard]] Value bytes(const Value& member);

} // namespace velmora::convert
