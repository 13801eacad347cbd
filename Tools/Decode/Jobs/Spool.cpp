// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/Spool.h"

#include "Tools/Output.h"

#include <cerrno>
#include <cstdlib>

#include <fcntl.h>
#include <unistd.h>

namespace velmora {

Spool::Spool() {
    const char* const directory = std::getenv("TMPDIR");
    _file = FileDescriptor(
        ::open(directory && *directory ? directory : "/tmp", O_TMPFILE | O_RDWR | O_CLOEXEC, 0600));
}

bool Spool::append(std::string_view text) {
    std::string_view rest = text;
    auto at = static_cast<off_t>(_size);
    while (!rest.empty()) {
        const ssize_t count = ::pwrite(_file.get(), rest.data(), rest.size(), at);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        rest.remove_prefix(static_cast<std::size_t>(count));
        at += count;
    }
    _size += text.size();
    return true;
}

bool Spool::moveTo(Output& output, std::vector<char>& buffer) {
    for (std::uint64_t at = 0; at < _size && output.isOpen();) {
        const ssize_t count = ::pread(_file.get(), buffer.data(), buffer.size(), static_cast<off_t>(at));
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return false;
        output.put(std::string_view(buffer.data(), static_cast<std::size_t>(count)));
        at += static_cast<std::uint64_t>(count);
    }
    _file.reset();
    _size = 0;
    return true;
}

} // namespace velmora
