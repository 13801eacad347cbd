// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <string_view>

namespace velmora {

/// The position message, made of an answer of GetLocation: what the receiver's dictionary says or, without
/// that, its NMEA sentences.
[[nodiscard]] DictionaryRef positionReportOf(const Value& location, const Modem& modem,
                                             std::string_view reason);

/// Whether the modem's satellite receiver is in use, which is up to others.
[[nodiscard]] bool hasPosition(const Modem& modem);

/// The members of the receiver's dictionary, as NMEA 0183 sentences say them: of GGA or, without a fix there,
/// of RMC. Sentences with a wrong checksum, and those without a fix, say nothing.
[[nodiscard]] Dictionary positionOfSentences(std::string_view sentences);

} // namespace velmora
