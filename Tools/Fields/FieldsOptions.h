// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Fields/RoleSelection.h"
#include "Tools/Text/CSVText.h"

#include <cstdint>
#include <string>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log fields`: the catalogue of what the displays can show.
struct FieldsOptions {
    enum class Format : std::uint8_t { Text, Json, Csv };

    Format format = Format::Text;
    std::string technology; ///< empty for all
    RoleSelection roles;
    CSVGuard guard = CSVGuard::Off; ///< for Csv alone
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addFields(CLI::App& app, FieldsOptions& options);

} // namespace velmora
