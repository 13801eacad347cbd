// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Mask/MaskOption.h"

#include <string>
#include <vector>

namespace CLI {
class App;
}

namespace velmora {

/// `velmora-log columns`: typed columns of recordings, as Parquet files.
struct ColumnsOptions {
    std::string out;        ///< the directory of the tables; empty where files are joined
    std::string compact;    ///< the directory whose files are joined; empty for none
    std::string technology; ///< of files that name none
    MaskOption mask;
    std::vector<std::string> files;
};

/// Adds the command with its options, help and examples. Parsing fills `options`, which must outlive `app`.
CLI::App* addColumns(CLI::App& app, ColumnsOptions& options);

} // namespace velmora
