// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/MessageReader.h"
#include "Tools/Messages/MessageSelection.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// How many refreshes decoding the selected messages of a file takes, of which nothing has been read: those
/// of its technology, or of the one of that index.
[[nodiscard]] std::uint64_t countRefreshes(MessageReader& reader, const MessageSelection& messages,
                                           std::optional<std::uint32_t> technology);

} // namespace velmora
