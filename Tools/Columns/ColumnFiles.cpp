// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/ColumnFiles.h"

#include "Platform/DateText.h"
#include "Platform/Linux/Files/Files.h"

#include <system_error>

namespace velmora {

namespace {

constexpr std::size_t bufferSize = std::size_t{64} << 10;

} // namespace

std::filesystem::path partitionOf(std::string_view table, std::string_view technology,
                                  const std::string& date) {
    return std::filesystem::path(table) / ("technology=" + std::string(technology)) / ("date=" + date);
}

std::string dateOf(const std::optional<Time>& first) {
    return first ? dayText(std::chrono::floor<std::chrono::days>(*first)) : "__HIVE_DEFAULT_PARTITION__";
}

ByteSink& ColumnFiles::open(std::string_view table, std::string_view technology) {
    return _files.emplace_back(_root / partitionOf(table, technology, _date) / (_name + ".parquet"),
                               table == "files");
}

Result<Done> ColumnFiles::commit() {
    for (File& file : _files)
        if (!file.isMark())
            if (Result<Done> committed = file.commit(); !committed)
                return committed;
    for (auto file = _files.rbegin(); file != _files.rend(); ++file)
        if (file->isMark())
            if (Result<Done> committed = file->commit(); !committed)
                return committed;
    return Done();
}

std::uint64_t ColumnFiles::bytes() const {
    std::uint64_t sum = 0;
    for (const File& file : _files)
        sum += file.bytes();
    return sum;
}

Failure ColumnFiles::File::failed(const std::string& reason) const {
    return Failure{_path.string() + ": " + reason};
}

Result<Done> ColumnFiles::File::write(Bytes bytes) {
    _bytes += bytes.size();
    _buffer.insert(_buffer.end(), bytes.begin(), bytes.end());
    return _buffer.size() < bufferSize ? Result<Done>(Done()) : flush();
}

Result<Done> ColumnFiles::File::flush() {
    if (!_file) {
        std::error_code error;
        std::filesystem::create_directories(_path.parent_path(), error);
        if (error)
            return failed("its directory cannot be made: " + error.message());
        // Engines skip names that begin with a dot.
        Result<AtomicFile> file = AtomicFile::create(_path, 0666, ".");
        if (!file)
            return failed(file.reason());
        _file.emplace(*std::move(file));
    }
    if (const Result<Done> written = writeAll(_file->descriptor(), _buffer); !written)
        return failed(written.reason());
    _buffer = {};
    return Done();
}

Result<Done> ColumnFiles::File::commit() {
    if (Result<Done> flushed = flush(); !flushed)
        return flushed;
    const Result<Done> committed = _file->commit(AtomicFile::IfExists::Refuse);
    _file.reset();
    std::error_code error;
    // Another process may have written the same.
    if (!committed && !std::filesystem::exists(_path, error))
        return failed(committed.reason());
    return Done();
}

} // namespace velmora
