// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/Compaction.h"

#include "Export/Columns/Parquet/Parquet.h"
#include "Export/Columns/Parquet/ParquetJoin.h"
#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Files/Files.h"
#include "Tools/Columns/ContentHash.h"
#include "Tools/Columns/JoinedFiles.h"
#include "Tools/Columns/ParquetFile.h"

#include <algorithm>
#include <cerrno>
#include <map>
#include <optional>

#include <fcntl.h>
#include <unistd.h>

namespace velmora {

namespace {

class DescriptorSink final : public ByteSink {
public:
    explicit DescriptorSink(int descriptor) : _descriptor(descriptor) {}
    Result<Done> write(Bytes bytes) override { return writeAll(_descriptor, bytes); }

private:
    int _descriptor;
};

bool isJoined(const std::filesystem::path& path) {
    return path.filename().string().starts_with(joinedPrefix);
}

/// A temporary name, which a process that was killed has left.
bool isTemporary(const std::filesystem::path& path) {
    const std::string name = path.filename().string();
    return name.starts_with('.') && name.find(".parquet.") != std::string::npos;
}

/// A new name is on the disk before the old ones are removed from there.
Result<Done> syncDirectory(const std::filesystem::path& path) {
    const FileDescriptor directory(::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (!directory || ::fsync(directory.get()) != 0)
        return Failure{"cannot be synced: " + errnoText(errno)};
    return Done();
}

} // namespace

void Compaction::fail(const std::filesystem::path& path, const std::string& reason) {
    _isGood = false;
    _report(path.string() + ": " + reason);
}

void Compaction::remove(const std::filesystem::path& path) {
    std::error_code error;
    if (std::filesystem::remove(path, error))
        ++_removed;
    else
        fail(path, "cannot be removed: " + error.message());
}

/// The small files, in the order of their names, without those that are in a joined file already.
std::vector<Compaction::Part> Compaction::findParts() {
    std::vector<Part> parts;
    std::set<std::string> joined;
    std::error_code error;
    for (const auto& file : std::filesystem::directory_iterator(_directory, error)) {
        if (file.is_regular_file(error) && isTemporary(file.path())) {
            std::filesystem::remove(file.path(), error);
            continue;
        }
        if (!file.is_regular_file(error) || file.path().extension() != ".parquet" ||
            file.path().filename().string().starts_with('.'))
            continue;
        const Result<ParquetFile> opened = ParquetFile::open(file.path());
        if (!opened) {
            fail(file.path(), opened.reason());
            continue;
        }
        FileMetadata metadata = opened->metadata();
        if (isJoined(file.path()))
            joined.merge(inputsIn(metadata));
        const std::uint64_t chunks = metadata.groups.size() * metadata.columns.size();
        metadata.groups.clear();
        if (file.file_size(error) < smallFile)
            parts.push_back({file.path(), serialized(metadata), chunks});
    }
    std::erase_if(parts, [&](const Part& part) {
        if (isJoined(part.path) || !joined.contains(part.path.stem().string()))
            return false;
        remove(part.path);
        return true;
    });
    std::sort(parts.begin(), parts.end(), [](const Part& a, const Part& b) { return a.path < b.path; });
    return parts;
}

bool Compaction::run() {
    std::map<std::string, std::vector<Part>> bySchema;
    for (Part& part : findParts())
        bySchema[part.schema].push_back(std::move(part));
    for (auto& [schema, parts] : bySchema)
        while (parts.size() > 1)
            parts.erase(parts.begin(), parts.begin() + static_cast<std::ptrdiff_t>(joinFirst(parts)));
    return _isGood;
}

std::size_t Compaction::joinFirst(const std::vector<Part>& parts) {
    std::uint64_t chunks = 0;
    std::size_t count = 0;
    for (; count < parts.size() && (count == 0 || chunks + parts[count].chunks <= mostChunks); ++count)
        chunks += parts[count].chunks;
    if (count < 2)
        return count;
    const std::vector<Part> some(parts.begin(), parts.begin() + static_cast<std::ptrdiff_t>(count));
    if (const Result<Done> done = join(some); !done) {
        _isGood = false;
        _report(done.reason());
    }
    return count;
}

Result<Done> Compaction::join(const std::vector<Part>& parts) {
    ContentHash names;
    for (const Part& part : parts)
        names.add(parquet::bytesOf(part.path.filename().string() + "\n"));
    const std::filesystem::path path = _directory / (std::string(joinedPrefix) + names.digits() + ".parquet");
    const auto failed = [&path](const std::string& reason) { return Failure{path.string() + ": " + reason}; };
    Result<AtomicFile> file = AtomicFile::create(path, 0666, ".");
    if (!file)
        return failed(file.reason());
    DescriptorSink sink(file->descriptor());
    ParquetJoin joined(sink);
    for (const Part& part : parts) {
        const Result<ParquetFile> opened = ParquetFile::open(part.path);
        if (!opened)
            return Failure{part.path.string() + ": " + opened.reason()};
        if (const Result<Done> added = joined.add(opened->metadata(), opened->begin(), opened->end()); !added)
            return Failure{part.path.string() + ": " + added.reason()};
        if (const Result<Done> copied = opened->readPages([&](Bytes bytes) { return joined.copy(bytes); });
            !copied)
            return Failure{part.path.string() + ": " + copied.reason()};
    }
    if (const Result<Done> finished = joined.finish(); !finished)
        return failed(finished.reason());
    if (const Result<Done> committed = file->commit(AtomicFile::IfExists::Refuse); !committed)
        return failed(committed.reason());
    if (const Result<Done> synced = syncDirectory(_directory); !synced)
        return failed(synced.reason());
    ++_made;
    for (const Part& part : parts)
        remove(part.path);
    return Done();
}

} // namespace velmora
