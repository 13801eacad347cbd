// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <ostream>
#include <vector>

#include <rapidcheck.h>

/// Generators of messages. What they make shrinks to fewer and shorter messages.

namespace velmora {

/// A message with the time of its arrival.
struct GivenMessage {
    Time time;
    Data message;

    friend bool operator==(const GivenMessage&, const GivenMessage&) = default;
};

void showValue(const GivenMessage& given, std::ostream& out);

/// Any bytes, from none to some hundred.
[[nodiscard]] rc::Gen<Data> anyBytes();
/// A record of one of these log codes with any payload, a time stamp of the hour that `inTime` begins with,
/// and a length field that is its length: what a file without framing needs to find its end.
[[nodiscard]] rc::Gen<Data> recordOfCodes(std::vector<std::uint32_t> codes);
/// A record of any code: of the baseband's stream or the extra one, with a prefix or without.
[[nodiscard]] rc::Gen<Data> anyRecord();
/// A property list as the serialized-object technology sends it: a dictionary of texts, of lists and of
/// dictionaries.
[[nodiscard]] rc::Gen<Data> anyTextTree();

/// Messages in the order of their times, from 2026-11-16 05:00:00 UTC on, up to some seconds apart.
[[nodiscard]] rc::Gen<std::vector<GivenMessage>> inTime(rc::Gen<Data> message);

} // namespace velmora
