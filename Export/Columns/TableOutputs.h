// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ByteSink.h"

#include <string_view>

namespace velmora {

/// Where the tables of an input go.
class TableOutputs {
public:
    virtual ~TableOutputs() = default;
    /// The file of that table, which is written to the end and stays where it is. Each is asked for once.
    virtual ByteSink& open(std::string_view table, std::string_view technology) = 0;
};

} // namespace velmora
