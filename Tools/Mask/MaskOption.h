// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "Platform/Result.h"

#include <optional>
#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `--mask` and `--key` of a command that decodes: messages are masked before they are decoded.
struct MaskOption {
    std::optional<MaskLevel> level; ///< absent for messages as they are
    std::string keyFile;            ///< empty for a random key that is forgotten
};

/// Adds both. Parsing fills `option`, which must outlive `command`.
void addMaskOption(CLI::App& command, MaskOption& option);

/// How to mask, with the key; absent where nothing is masked.
[[nodiscard]] Result<std::optional<MaskOptions>> maskOptionsOf(const MaskOption& option);

/// The same for a file: what the key has masked there already stays as it is. A file that cannot be read
/// twice is masked again.
[[nodiscard]] MaskOptions maskOptionsFor(const std::string& file, MaskOptions options);

/// What the option's description leaves out, for the command's footer.
inline constexpr const char* maskHelp =
    "--mask masks what identifies the subscriber, --mask=location the network and its areas too, --mask=all\n"
    "positions and times too, as velmora-log mask does; times are then counted from 2000-01-01, in --from\n"
    "and --to too.\n";

} // namespace velmora
