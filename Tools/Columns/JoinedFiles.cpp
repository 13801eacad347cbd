// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/JoinedFiles.h"

#include "Tools/Columns/ParquetFile.h"

#include <algorithm>
#include <system_error>

namespace velmora {

std::set<std::string> inputsIn(const FileMetadata& metadata) {
    std::set<std::string> inputs;
    const auto column = std::find_if(metadata.columns.begin(), metadata.columns.end(),
                                     [](const ColumnSchema& each) { return each.name == "file"; });
    if (column == metadata.columns.end())
        return inputs;
    const auto index = static_cast<std::size_t>(column - metadata.columns.begin());
    for (const RowGroupMetadata& group : metadata.groups)
        if (const auto& range = group.chunks[index].statistics.range; range && range->first == range->second)
            inputs.insert(range->first);
    return inputs;
}

bool WrittenInputs::contains(const std::filesystem::path& partition, const std::string& hash) {
    std::error_code error;
    if (std::filesystem::exists(partition / (hash + ".parquet"), error))
        return true;
    const auto [entry, isNew] = _joined.try_emplace(partition);
    if (isNew)
        for (const auto& file : std::filesystem::directory_iterator(partition, error))
            if (file.path().filename().string().starts_with(joinedPrefix))
                if (const Result<ParquetFile> opened = ParquetFile::open(file.path()))
                    entry->second.merge(inputsIn(opened->metadata()));
    return entry->second.contains(hash);
}

} // namespace velmora
