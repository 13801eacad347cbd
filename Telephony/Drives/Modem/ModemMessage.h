// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/Drives/Modem/ModemPhone.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <cstdint>

namespace velmora::records {

/// A message's dictionary with what each one says of the modem itself.
[[nodiscard]] DictionaryRef modemAccount(const ModemPhone& phone);
/// The message of that code, one of LiveModemCode's. The content is made by the drive, so that writing it
/// cannot fail because of the input.
[[nodiscard]] RecordBuilder modemMessage(std::uint32_t code, const DictionaryRef& account);

} // namespace velmora::records
