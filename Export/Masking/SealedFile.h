// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskSeal.h"
#include "Recording/Files/ChunkedInput.h"

#include <optional>

namespace velmora {

/// Reads a file of log messages to its end and returns its seal, if it has one and its messages are the ones
/// that it was made for.
[[nodiscard]] std::optional<MaskSeal> readSeal(ChunkedInput input);

/// The same digest that `readSeal` compares; absent where the file cannot be read without a loss.
[[nodiscard]] std::optional<std::string> digestOfFile(ChunkedInput input);

} // namespace velmora
