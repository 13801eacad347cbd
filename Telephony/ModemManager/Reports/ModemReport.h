// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/ModemManager/ModemObjects.h"

#include <string>
#include <string_view>
#include <vector>

/// The messages that follow from what ModemManager publishes of a modem, its SIMs and its bearers. The member
/// table decides what is in them.
namespace velmora {

/// An object that belongs to the modem: a SIM or a bearer.
struct ModemPart {
    std::string path;         ///< empty for a slot without a SIM
    DictionaryRef properties; ///< null while they are not known
};

[[nodiscard]] DictionaryRef registrationReportOf(const Modem& modem);
[[nodiscard]] DictionaryRef linkReportOf(const Modem& modem);
/// `manager` are the properties of ModemManager itself.
[[nodiscard]] DictionaryRef modemReportOf(const Modem& modem, const Value& manager);
/// `sim` is the modem's active SIM, `inSlots` the SIM of each slot; the reason says why they are not known.
[[nodiscard]] DictionaryRef simReportOf(const Modem& modem, const ModemPart& sim,
                                        const std::vector<ModemPart>& inSlots, std::string_view reason);
/// One context for each bearer. Of a bearer that is not known there is its number.
[[nodiscard]] DictionaryRef contextReportOf(const Modem& modem, const std::vector<ModemPart>& bearers,
                                            std::string_view reason);

/// The number at the end of an object's path; none where there is none.
[[nodiscard]] Value numberOfPath(std::string_view path);

} // namespace velmora
