// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"
#include "Recording/Files/ByteSource.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// Why reading an input again failed, by no fault of its content; absent while it has not.
struct InputError {
    std::optional<std::string> reason = {};
};

/// An input that has been read once, for its hash, and can be read again.
class HashedInput {
public:
    /// "-" is standard input. What cannot be read twice, as a pipe, is kept in a file without a name in the
    /// directory of temporary files.
    [[nodiscard]] static Result<HashedInput> open(const std::string& path);

    /// 32 hexadecimal digits of XXH3: the same for the same content, whatever its name.
    [[nodiscard]] const std::string& hash() const { return _hash; }
    [[nodiscard]] std::uint64_t size() const { return _size; }
    /// Its bytes from the beginning. `error` must outlive the source.
    [[nodiscard]] Result<std::unique_ptr<ByteSource>> read(InputError& error) const;
    /// Whether more has been written to it since.
    [[nodiscard]] bool hasGrown() const;

private:
    HashedInput(FileDescriptor file, std::string hash, std::uint64_t size)
        : _file(std::move(file)), _hash(std::move(hash)), _size(size) {}

    FileDescriptor _file;
    std::string _hash;
    std::uint64_t _size;
};

} // namespace velmora
