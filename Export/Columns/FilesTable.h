// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/PageCompressor.h"
#include "Export/Columns/TableOutputs.h"
#include "Platform/Result.h"

namespace velmora {

struct InputFile;
class TechnologyTables;

/// Writes the table "files", which has one row for each technology of an input.
Result<Done> writeFilesTable(const InputFile& file, const TechnologyTables& technology, TableOutputs& outputs,
                             PageCompressor& compressor);

} // namespace velmora
