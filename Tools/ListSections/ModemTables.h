// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

/// What the dissector reads the messages of a live modem by, beside the rows that its sections describe: the
/// texts of states and of masks, which rows belong to cells of which radio technology, and the bands and
/// frequencies of channel numbers. All of it is asked of the decoder. The entries of a Lua table, see
/// Resources/wireshark/modem.lua.
[[nodiscard]] std::string modemTables();

} // namespace velmora
