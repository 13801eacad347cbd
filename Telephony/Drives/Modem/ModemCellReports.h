// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Modem/ModemPhone.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <optional>

/// The reports of cells and of the link to them.
namespace velmora::modemReports {

[[nodiscard]] std::optional<RecordBuilder> cells(ModemReportContext& context);
[[nodiscard]] std::optional<RecordBuilder> link(ModemReportContext& context);
/// A cell message whose values are of other kinds than they must be, or out of their ranges.
[[nodiscard]] RecordBuilder unreasonableCells(const ModemPhone& phone);

} // namespace velmora::modemReports
