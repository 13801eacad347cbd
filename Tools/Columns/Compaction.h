// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/FileMetadata.h"
#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <functional>
#include <set>
#include <string>
#include <vector>

namespace velmora {

/// Joins the small files of one directory, which are of one table, technology and day. A joined file gets its
/// name before those that it is made of are removed; where that was interrupted, the next call removes them.
/// So does it with the temporary files of processes that were killed.
class Compaction {
public:
    /// Files from that size on, in bytes, are left alone.
    static constexpr std::uint64_t smallFile = std::uint64_t{32} << 20;
    /// A joined file has at most about so many chunks of columns: its metadata is read at once.
    static constexpr std::uint64_t mostChunks = 40'000;

    /// `report` gets the errors, each with the name of its file.
    Compaction(std::filesystem::path directory, std::function<void(const std::string&)> report)
        : _directory(std::move(directory)), _report(std::move(report)) {}

    /// Whether nothing went wrong.
    [[nodiscard]] bool run();

    /// How many files became how many.
    [[nodiscard]] std::size_t removed() const { return _removed; }
    [[nodiscard]] std::size_t made() const { return _made; }

private:
    struct Part {
        std::filesystem::path path;
        std::string schema; ///< the metadata without row groups: files that differ in it are not joined
        std::uint64_t chunks;
    };

    [[nodiscard]] std::vector<Part> findParts();
    /// Joins as many as fit, from the first on; returns how many.
    std::size_t joinFirst(const std::vector<Part>& parts);
    [[nodiscard]] Result<Done> join(const std::vector<Part>& parts);
    void remove(const std::filesystem::path& path);
    void fail(const std::filesystem::path& path, const std::string& reason);

    std::filesystem::path _directory;
    std::function<void(const std::string&)> _report;
    bool _isGood = true;
    std::size_t _removed = 0;
    std::size_t _made = 0;
};

} // namespace velmora
