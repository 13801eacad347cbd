// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/GSM/GSMCellRecords.h"
#include "Telephony/Drives/GSM/RegistrationRecords.h"
#include "Telephony/Drives/GSM/UMTSRecords.h"

#include <string_view>

/// The names of states, as 3GPP TS 24.008 4.1.2 and 4.1.3 and TS 25.331 7.1 have them where they are theirs.
namespace velmora {

[[nodiscard]] std::string_view nameOf(records::RRState state);
[[nodiscard]] std::string_view nameOf(records::RRCState state);
[[nodiscard]] std::string_view nameOf(records::RegistrationState state);
[[nodiscard]] std::string_view nameOf(records::MMState state);
[[nodiscard]] std::string_view nameOf(records::MMSubState state);
[[nodiscard]] std::string_view nameOf(records::GMMState state);
[[nodiscard]] std::string_view nameOf(records::GMMSubState state);

} // namespace velmora
