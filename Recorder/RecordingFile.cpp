// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recorder/RecordingFile.h"

#include "Platform/Linux/Errno.h"
#include "Recorder/OverwriteTarget.h"

#include <cerrno>
#include <chrono>
#include <filesystem>
#include <thread>

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// A recorder that finds a file locks it before it refuses it, and so has the lock for a moment.
constexpr int lockAttempts = 5;
constexpr auto lockPause = 20ms;
constexpr int lastNumber = 9999;

Failure cannotCreate(const std::string& path, int error) {
    return Failure{"cannot create " + path + ": " + errnoText(error)};
}

FileDescriptor create(const std::string& path) {
    return FileDescriptor(
        ::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, RecordingFile::newFileMode));
}

bool isSame(const struct stat& a, const struct stat& b) {
    return a.st_dev == b.st_dev && a.st_ino == b.st_ino;
}

} // namespace

bool isRegularFile(int descriptor) {
    struct stat status = {};
    return ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode);
}

bool lockRecording(int descriptor) {
    for (int attempt = 1;; ++attempt) {
        if (::flock(descriptor, LOCK_EX | LOCK_NB) == 0 || errno != EWOULDBLOCK)
            return true;
        if (attempt == lockAttempts)
            return false;
        std::this_thread::sleep_for(lockPause);
    }
}

Result<RecordingFile> RecordingFile::open(const std::string& path, bool force) {
    RecordingFile file{path, create(path), true};
    if (!file.descriptor && errno == EEXIST)
        file = {path, FileDescriptor(::open(path.c_str(), O_WRONLY | O_CLOEXEC)), false};
    const int error = errno;
    if (!file.descriptor || (!file.isCreated && file.isRegular()))
        if (const Result<std::filesystem::path> target = overwriteTarget(path); !target)
            return Failure{target.reason()};
    if (!file.descriptor)
        return cannotCreate(path, error);
    if (!file.isRegular())
        return file;
    if (!lockRecording(file.descriptor.get()))
        return Failure{path + " is being recorded to by another program"};
    if (!file.isCreated && !force)
        return Failure{existingFileMessage(path)};
    return file;
}

Result<RecordingFile> RecordingFile::createBeside(const std::string& path) {
    const std::filesystem::path given(path);
    for (int number = 2; number <= lastNumber; ++number) {
        std::filesystem::path name = given;
        name.replace_filename(given.stem().string() + "-" + std::to_string(number) +
                              given.extension().string());
        RecordingFile file{name.string(), create(name.string()), true};
        if (!file.descriptor && errno == EEXIST)
            continue;
        if (!file.descriptor)
            return cannotCreate(file.path, errno);
        if (lockRecording(file.descriptor.get()))
            return file;
    }
    return cannotCreate(path, EEXIST);
}

bool RecordingFile::isEmpty() const {
    struct stat status = {};
    return ::fstat(descriptor.get(), &status) == 0 && status.st_size == 0;
}

void RecordingFile::removeIfEmpty() const {
    struct stat file = {};
    struct stat named = {};
    if (isCreated && ::fstat(descriptor.get(), &file) == 0 && ::stat(path.c_str(), &named) == 0 &&
        S_ISREG(named.st_mode) && named.st_size == 0 && isSame(file, named))
        ::unlink(path.c_str());
}

} // namespace velmora
