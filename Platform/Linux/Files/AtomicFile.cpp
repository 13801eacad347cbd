// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/AtomicFile.h"

#include "Platform/Linux/Errno.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <utility>

namespace velmora {

namespace {

mode_t maskOfProcess() {
    const mode_t mask = ::umask(0); // there is no other way to ask
    ::umask(mask);
    return mask;
}

bool rename(const std::string& from, const std::filesystem::path& to, AtomicFile::IfExists choice) {
    if (choice == AtomicFile::IfExists::Replace)
        return ::rename(from.c_str(), to.c_str()) == 0;
    if (::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0)
        return true;
    // Not every file system can refuse by itself.
    if (errno != EINVAL && errno != ENOSYS)
        return false;
    struct stat status = {};
    if (::lstat(to.c_str(), &status) == 0) {
        errno = EEXIST;
        return false;
    }
    return ::rename(from.c_str(), to.c_str()) == 0;
}

} // namespace

Result<AtomicFile> AtomicFile::create(const std::filesystem::path& target, mode_t mode,
                                      const std::string& prefix) {
    // Once the file exists nothing here may throw until the object owns it: the file would be left over.
    std::string path = target.parent_path() / (prefix + target.filename().string() + ".XXXXXX");
    AtomicFile file(target, {}, {});
    file._file = FileDescriptor(::mkostemp(path.data(), O_CLOEXEC));
    if (!file._file)
        return Failure{"cannot be opened for writing: " + errnoText(errno)};
    file._path = std::move(path);
    struct stat earlier = {};
    const bool existed = ::stat(target.c_str(), &earlier) == 0;
    if (::fchmod(file.descriptor(), existed ? earlier.st_mode & 07777 : mode & ~maskOfProcess()) != 0)
        return Failure{"cannot be given its permissions: " + errnoText(errno)};
    return file;
}

AtomicFile::AtomicFile(std::filesystem::path target, std::string path, FileDescriptor file)
    : _target(std::move(target)), _path(std::move(path)), _file(std::move(file)) {}

AtomicFile::AtomicFile(AtomicFile&& other) noexcept
    : _target(std::move(other._target)), _path(std::exchange(other._path, {})),
      _file(std::move(other._file)) {}

Result<Done> AtomicFile::commit(IfExists choice) {
    // The content is on the disk before the name leads to it.
    if (::fsync(_file.get()) != 0 || !rename(_path, _target, choice)) {
        const Failure failure{"cannot be replaced: " + errnoText(errno)};
        discard();
        return failure;
    }
    _path.clear();
    _file.reset();
    return Done();
}

void AtomicFile::discard() {
    if (!_path.empty())
        ::unlink(std::exchange(_path, {}).c_str());
    _file.reset();
}

} // namespace velmora
