// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/PrivateFile.h"

#include "Platform/Linux/Files/Files.h"

#include <sys/stat.h>

namespace velmora {

Result<Data> readPrivateFile(const std::string& path, std::size_t longest) {
    struct stat status = {};
    if (::stat(path.c_str(), &status) == 0 && (status.st_mode & (S_IRWXG | S_IRWXO)) != 0)
        return Failure{path + " can be read by other users, wanted a file of its owner alone: chmod 600 " +
                       path};
    Result<Data> content = readFile(path, longest);
    return content ? std::move(content) : Failure{path + ": " + content.reason()};
}

} // namespace velmora
