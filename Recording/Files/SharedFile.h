// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/Files/ByteSource.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <span>
#include <string>

namespace velmora {

/// An open file that several readers read, each at a place of its own. It stays the file that was opened when
/// another takes its name. Main thread only.
class SharedFile {
public:
    /// Opens a regular file; the reason does not repeat the path.
    static Result<std::shared_ptr<SharedFile>> open(const std::string& path);
    /// A new file for reading and writing that has no name, so that it is gone with this, also after a crash.
    /// It lies in TMPDIR or else in /var/tmp, which is not kept in memory.
    static Result<std::shared_ptr<SharedFile>> createNameless();
    ~SharedFile();
    SharedFile(const SharedFile&) = delete;
    SharedFile& operator=(const SharedFile&) = delete;

    /// Its size when it was opened, in bytes.
    [[nodiscard]] std::uint64_t size() const { return _size; }
    /// How its content differs from when it was opened, to follow its name: "has grown", "has changed"; empty
    /// where it does not.
    [[nodiscard]] std::string change() const;

    /// Reads at least one byte; 0 only at the end.
    [[nodiscard]] Result<std::size_t> readAt(std::uint64_t offset, std::span<std::uint8_t> buffer) const;
    [[nodiscard]] Result<Done> writeAt(std::uint64_t offset, std::span<const std::uint8_t> bytes) const;

    /// The bytes from the offset on.
    [[nodiscard]] static std::unique_ptr<ByteSource> from(std::shared_ptr<const SharedFile> file,
                                                          std::uint64_t offset);

private:
    explicit SharedFile(int descriptor);

    int _descriptor;
    std::uint64_t _size = 0;
    std::int64_t _modified_ns = 0;
};

} // namespace velmora
