// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recorder/OverwriteTarget.h"

#include <system_error>

#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

Result<std::filesystem::path> overwriteTarget(const std::string& path) {
    std::error_code error;
    if (!std::filesystem::is_symlink(std::filesystem::symlink_status(path, error)))
        return std::filesystem::path(path);
    const std::filesystem::path target = std::filesystem::canonical(path, error);
    struct stat status = {};
    if (error || ::stat(target.c_str(), &status) != 0)
        return Failure{path + " is a symbolic link to a file that does not exist"};
    if (!S_ISREG(status.st_mode) || status.st_uid != ::geteuid())
        return Failure{path + " is a symbolic link to " + target.string() +
                       ", wanted a regular file of this user"};
    return target;
}

std::string existingFileMessage(const std::string& path) {
    return path + " is there already; --force overwrites it";
}

} // namespace velmora
