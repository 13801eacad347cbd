// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/LinuxFileSystem.h"

#include "Platform/Linux/Files/EnvironmentPath.h"
#include "Platform/Linux/Files/Files.h"

#include <cstdint>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

std::filesystem::path under(const std::filesystem::path& sysroot, const std::filesystem::path& absolute) {
    return sysroot.empty() ? absolute : sysroot / absolute.relative_path();
}

std::filesystem::path withoutLastSlash(const std::filesystem::path& directory) {
    return directory.has_filename() || !directory.has_relative_path() ? directory : directory.parent_path();
}

} // namespace

LinuxFileSystem::LinuxFileSystem(Options options)
    : _sysroot(std::move(options.sysroot)), _isStandard(options.logDirectory.empty()) {
    _logDirectory = _isStandard ? under(_sysroot, userDirectory("XDG_STATE_HOME", ".local/state") / "velmora")
                                : withoutLastSlash(options.logDirectory);
}

Result<Done> LinuxFileSystem::makeStandardLogDirectory() const {
    if (!_isStandard)
        return Done();
    if (const std::error_code error = makePrivateDirectory(_logDirectory); error)
        return Failure{_logDirectory.string() + ": cannot be made: " + error.message()};
    return Done();
}

bool LinuxFileSystem::exists(std::string_view absolutePath) const {
    std::error_code error;
    return std::filesystem::exists(under(_sysroot, absolutePath), error);
}

Result<Done> LinuxFileSystem::writeDirectly(const std::string& path, std::string_view content) {
    const auto* bytes = reinterpret_cast<const std::uint8_t*>(content.data());
    return writeFile(path, Bytes(bytes, content.size()));
}

} // namespace velmora
