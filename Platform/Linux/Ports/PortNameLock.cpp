// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/PortNameLock.h"

#include "Platform/Linux/Errno.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>

#include <cerrno>

namespace velmora {

Result<std::optional<PortNameLock>> PortNameLock::take(const PortDirectory& directory,
                                                       const std::string& name) {
    const std::string file = name + ".lock";
    // An owner that ends removes the file while others may have it open already; what they lock then is no
    // longer what the path names, and they have to look again.
    for (int attempt = 0; attempt < 100; ++attempt) {
        FileDescriptor lock(::openat(directory.descriptor(), file.c_str(),
                                     O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, S_IRUSR | S_IWUSR));
        if (!lock)
            return Failure{file + " cannot be opened: " + errnoText(errno)};
        if (::flock(lock.get(), LOCK_EX | LOCK_NB) != 0) {
            if (errno == EWOULDBLOCK)
                return std::optional<PortNameLock>();
            if (errno == EINTR)
                continue;
            return Failure{file + " cannot be locked: " + errnoText(errno)};
        }
        PortNameLock taken(directory.descriptor(), file, std::move(lock));
        if (taken.holds())
            return std::optional(std::move(taken));
    }
    // Others keep taking and freeing it; to this caller the name is taken.
    return std::optional<PortNameLock>();
}

bool PortNameLock::holds() const {
    struct stat locked = {};
    struct stat named = {};
    return ::fstat(_lock.get(), &locked) == 0 &&
           ::fstatat(_directory, _file.c_str(), &named, AT_SYMLINK_NOFOLLOW) == 0 &&
           locked.st_dev == named.st_dev && locked.st_ino == named.st_ino;
}

PortNameLock::~PortNameLock() {
    // Removed while it is still locked: no other process can have taken the name.
    if (_lock && holds())
        ::unlinkat(_directory, _file.c_str(), 0);
}

} // namespace velmora
