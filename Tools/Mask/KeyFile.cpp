// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/KeyFile.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Linux/Files/Files.h"
#include "Tools/Report.h"

#include <cerrno>
#include <filesystem>
#include <string_view>

#include <sys/random.h>
#include <sys/stat.h>

namespace velmora {

namespace {

constexpr mode_t ownerOnly = S_IRUSR | S_IWUSR;
constexpr std::size_t longestFile = 4096;

} // namespace

Result<MaskKey> randomKey() {
    MaskKey key;
    if (::getentropy(key.bytes.data(), key.bytes.size()) != 0)
        return Failure{"cannot make a key: " + errnoText(errno)};
    return key;
}

Result<MaskKey> readKeyFile(const std::string& path) {
    struct stat status = {};
    if (::stat(path.c_str(), &status) == 0 && (status.st_mode & (S_IRWXG | S_IRWXO)) != 0)
        return Failure{path + " can be read by other users, wanted a file of its owner alone: chmod 600 " +
                       path};
    const Result<Data> content = readFile(path, longestFile);
    if (!content)
        return Failure{path + ": " + content.reason()};
    const Bytes bytes = content->bytes();
    Result<MaskKey> key =
        MaskKey::read(std::string_view(reinterpret_cast<const char*>(bytes.data()), bytes.size()));
    return key ? key : Failure{path + ": " + key.reason()};
}

Result<Done> makeKeyFile(const std::string& path) {
    std::error_code error;
    if (std::filesystem::exists(std::filesystem::symlink_status(path, error)))
        return Failure{path + " exists; a key is never overwritten, since what it masked needs it"};
    const Result<MaskKey> key = randomKey();
    if (!key)
        return Failure{key.reason()};
    Result<AtomicFile> file = AtomicFile::create(path, ownerOnly);
    if (!file)
        return Failure{path + ": " + file.reason()};
    const std::string text = key->text() + "\n";
    Result<Done> written =
        writeAll(file->descriptor(), Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()));
    if (written)
        written = file->commit(AtomicFile::IfExists::Refuse);
    return written ? written : Failure{path + ": " + written.reason()};
}

} // namespace velmora
