// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/Files.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Linux/Files/FileDescriptor.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

Result<Data> readFile(const std::filesystem::path& path, std::size_t maximumBytes) {
    FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
    if (!file)
        return Failure{"cannot be opened: " + errnoText(errno)};
    // The reported size may be wrong: read until the end, at most one byte more than allowed.
    std::vector<std::uint8_t> content;
    std::size_t size = 0;
    for (;;) {
        constexpr std::size_t step = std::size_t{64} << 10;
        content.resize(size + std::min(std::max(step, size), maximumBytes - size) + 1);
        const auto count = ::read(file.get(), content.data() + size, content.size() - size);
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return Failure{"cannot be read: " + errnoText(errno)};
        if (count == 0)
            break;
        size += static_cast<std::size_t>(count);
        if (size > maximumBytes)
            return Failure{"more than " + std::to_string(maximumBytes) + " bytes"};
    }
    content.resize(size);
    content.shrink_to_fit();
    return Data(std::move(content));
}

Result<Done> writeAll(int descriptor, Bytes content) {
    while (!content.empty()) {
        const auto count = ::write(descriptor, content.data(), content.size());
        if (count >= 0)
            content = content.subspan(static_cast<std::size_t>(count));
        else if (errno != EINTR)
            return Failure{"cannot be written: " + errnoText(errno)};
    }
    return Done();
}

Result<Done> writeFile(const std::filesystem::path& path, Bytes content) {
    FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, S_IRUSR | S_IWUSR));
    if (!file)
        return Failure{"cannot be opened for writing: " + errnoText(errno)};
    return writeAll(file.get(), content);
}

std::error_code makePrivateDirectory(const std::filesystem::path& path) {
    std::filesystem::path made;
    for (const std::filesystem::path& part : path) {
        made /= part;
        std::error_code ignored; // what is not a directory shows when one is made in it
        if (std::filesystem::is_directory(made, ignored))
            continue;
        if (::mkdir(made.c_str(), S_IRWXU) != 0 && errno != EEXIST)
            return {errno, std::generic_category()};
    }
    std::error_code error;
    if (!std::filesystem::is_directory(path, error) && !error)
        error = std::make_error_code(std::errc::not_a_directory);
    return error;
}

Result<Done> replaceFile(const std::filesystem::path& path, Bytes content) {
    Result<AtomicFile> file = AtomicFile::create(path, S_IRUSR | S_IWUSR);
    if (!file)
        return Failure{file.reason()};
    if (auto written = writeAll(file->descriptor(), content); !written)
        return written;
    return file->commit(AtomicFile::IfExists::Replace);
}

} // namespace velmora
