// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/KeyFile.h"

#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/Linux/Files/PrivateFile.h"
#include "Tools/Report.h"

#include <filesystem>
#include <string_view>

#include <sys/stat.h>

namespace velmora {

namespace {

constexpr mode_t ownerOnly = S_IRUSR | S_IWUSR;
constexpr std::size_t longestFile = 4096;

} // namespace

Result<MaskKey> readKeyFile(const std::string& path) {
    const Result<Data> content = readPrivateFile(path, longestFile);
    if (!content)
        return Failure{content.reason()};
    const Bytes bytes = content->bytes();
    Result<MaskKey> key =
        MaskKey::read(std::string_view(reinterpret_cast<const char*>(bytes.data()), bytes.size()));
    return key ? key : Failure{path + ": " + key.reason()};
}

Result<MaskKey> keyFor(const std::string& path) {
    return path.empty() ? MaskKey::random() : readKeyFile(path);
}

Result<Done> makeKeyFile(const std::string& path) {
    std::error_code error;
    if (std::filesystem::exists(std::filesystem::symlink_status(path, error)))
        return Failure{path + " exists; a key is never overwritten, since what it masked needs it"};
    const Result<MaskKey> key = MaskKey::random();
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
