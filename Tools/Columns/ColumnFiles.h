// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/TableOutputs.h"
#include "Platform/Clock.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Result.h"

#include <deque>
#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The name of a table's directory for a technology and a day: "TABLE/technology=T/date=D".
[[nodiscard]] std::filesystem::path partitionOf(std::string_view table, std::string_view technology,
                                                const std::string& date);

/// The value of "date" for an input whose first message arrived then: its day in UTC. An input without
/// messages has the one that engines take for null.
[[nodiscard]] std::string dateOf(const std::optional<Time>& first);

/// The files of an input's tables, each under a temporary name until `commit`. Those that are not committed
/// are removed.
class ColumnFiles final : public TableOutputs {
public:
    /// `root`: the directory of all tables. `name`: of the files, without suffix.
    ColumnFiles(std::filesystem::path root, std::string date, std::string name)
        : _root(std::move(root)), _date(std::move(date)), _name(std::move(name)) {}

    ByteSink& open(std::string_view table, std::string_view technology) override;

    /// Writes out what is left and gives all files their names, that of the first technology in "files" last:
    /// once it is there, all are. A file that is there already is left alone.
    Result<Done> commit();
    /// Removes what has not been committed.
    void discard() { _files.clear(); }
    /// Of all files together.
    [[nodiscard]] std::uint64_t bytes() const;

private:
    /// One of the files.
    class File final : public ByteSink {
    public:
        File(std::filesystem::path path, bool isMark) : _path(std::move(path)), _isMark(isMark) {}

        Result<Done> write(Bytes bytes) override;
        Result<Done> commit();
        [[nodiscard]] bool isMark() const { return _isMark; }
        [[nodiscard]] std::uint64_t bytes() const { return _bytes; }

    private:
        Result<Done> flush();
        [[nodiscard]] Failure failed(const std::string& reason) const;

        std::filesystem::path _path;
        bool _isMark; ///< it says that an input's technology is complete
        std::optional<AtomicFile> _file;
        std::vector<std::uint8_t> _buffer;
        std::uint64_t _bytes = 0;
    };

    std::filesystem::path _root;
    std::string _date;
    std::string _name;
    std::deque<File> _files;
};

} // namespace velmora
