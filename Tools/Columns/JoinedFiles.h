// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/FileMetadata.h"

#include <filesystem>
#include <map>
#include <set>
#include <string>
#include <string_view>

namespace velmora {

/// What the names of files begin with that `columns --compact` has made of others.
inline constexpr std::string_view joinedPrefix = "joined-";

/// The inputs whose rows the file holds, by their hashes: each of its row groups is of one.
[[nodiscard]] std::set<std::string> inputsIn(const FileMetadata& metadata);

/// Which inputs a directory's files are of. Each directory is read once.
class WrittenInputs {
public:
    /// `partition`: a directory of the table "files".
    [[nodiscard]] bool contains(const std::filesystem::path& partition, const std::string& hash);

private:
    std::map<std::filesystem::path, std::set<std::string>> _joined;
};

} // namespace velmora
