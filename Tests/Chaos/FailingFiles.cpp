// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Failing calls on files. Counted are reads and writes of regular files and of standard input and output.
// Those of sockets and of the event loop's own descriptors are not: what becomes of a connection is tried by
// killing the other end. Nor are those of standard error, where the program has to report the failure.

#include "FailingCalls.h"

#include <cerrno>
#include <cstdarg>
#include <cstddef>
#include <cstdio>
#include <cstdlib>

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/uio.h>
#include <unistd.h>

namespace velmora::failing {

namespace {

bool isTried(int descriptor) {
    if (descriptor == STDIN_FILENO || descriptor == STDOUT_FILENO)
        return true;
    struct stat status = {};
    const int before = errno;
    const bool isRegular = ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode);
    errno = before;
    return isRegular && descriptor != STDERR_FILENO;
}

bool failsFor(Kind kind, int descriptor) {
    return isCounted(kind) && isTried(descriptor) && fails(kind);
}

mode_t modeOf(int flags, std::va_list arguments) {
    return (flags & O_CREAT) != 0 || (flags & O_TMPFILE) == O_TMPFILE
               ? static_cast<mode_t>(va_arg(arguments, unsigned))
               : 0;
}

} // namespace

} // namespace velmora::failing

using velmora::failing::fails;
using velmora::failing::failsFor;
using velmora::failing::Kind;
using velmora::failing::modeOf;
using velmora::failing::next;

extern "C" {

// The C library's names again; those that it gives their parameters say little.
// NOLINTBEGIN(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

ssize_t read(int descriptor, void* buffer, std::size_t size) {
    return failsFor(Kind::Read, descriptor) ? -1 : next(&read, "read")(descriptor, buffer, size);
}

ssize_t __read_chk(int descriptor, void* buffer, std::size_t size, std::size_t) {
    return read(descriptor, buffer, size);
}

ssize_t pread(int descriptor, void* buffer, std::size_t size, off_t offset) {
    return failsFor(Kind::Read, descriptor) ? -1 : next(&pread, "pread")(descriptor, buffer, size, offset);
}

ssize_t pread64(int descriptor, void* buffer, std::size_t size, off64_t offset) {
    return pread(descriptor, buffer, size, offset);
}

ssize_t __pread_chk(int descriptor, void* buffer, std::size_t size, off_t offset, std::size_t) {
    return pread(descriptor, buffer, size, offset);
}

ssize_t write(int descriptor, const void* bytes, std::size_t size) {
    return failsFor(Kind::Write, descriptor) ? -1 : next(&write, "write")(descriptor, bytes, size);
}

ssize_t writev(int descriptor, const iovec* parts, int count) {
    return failsFor(Kind::Write, descriptor) ? -1 : next(&writev, "writev")(descriptor, parts, count);
}

ssize_t pwrite(int descriptor, const void* bytes, std::size_t size, off_t offset) {
    return failsFor(Kind::Write, descriptor) ? -1 : next(&pwrite, "pwrite")(descriptor, bytes, size, offset);
}

ssize_t pwrite64(int descriptor, const void* bytes, std::size_t size, off64_t offset) {
    return pwrite(descriptor, bytes, size, offset);
}

int fsync(int descriptor) {
    return fails(Kind::Sync) ? -1 : next(&fsync, "fsync")(descriptor);
}

int fdatasync(int descriptor) {
    return fails(Kind::Sync) ? -1 : next(&fdatasync, "fdatasync")(descriptor);
}

int rename(const char* from, const char* to) noexcept {
    return fails(Kind::Rename) ? -1 : next(&rename, "rename")(from, to);
}

int renameat2(int fromDirectory, const char* from, int toDirectory, const char* to, unsigned flags) noexcept {
    return fails(Kind::Rename) ? -1
                               : next(&renameat2, "renameat2")(fromDirectory, from, toDirectory, to, flags);
}

int open(const char* path, int flags, ...) {
    std::va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return fails(Kind::Open) ? -1 : next(&open, "open")(path, flags, mode);
}

int open64(const char* path, int flags, ...) {
    std::va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return open(path, flags, mode);
}

int __open_2(const char* path, int flags) {
    return open(path, flags);
}

int __open64_2(const char* path, int flags) {
    return open(path, flags);
}

int mkostemp(char* pattern, int flags) {
    return fails(Kind::Open) ? -1 : next(&mkostemp, "mkostemp")(pattern, flags);
}

int mkostemp64(char* pattern, int flags) {
    return mkostemp(pattern, flags);
}

// NOLINTEND(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

} // extern "C"
