// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// The sign at the edge of a row: none, that it opens something, or that it is checked.
enum class TableCellAccessory { none, disclosureIndicator, checkMark };

} // namespace velmora
