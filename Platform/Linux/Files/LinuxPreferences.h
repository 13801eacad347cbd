// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Preferences.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <filesystem>
#include <map>
#include <string>

namespace velmora {

/// Preferences that are property lists, one a domain, in the user's configuration directory
/// (DIRECTORY/com.velmora.HomeScreen.plist). A list keeps its form, its other keys, its permissions, and its
/// target where it is a symbolic link; one that cannot be read is not changed.
///
/// A change is announced on the session's message bus, where there is one, by the signal
/// `PreferencesChanged(string domain, string key)` of the interface "com.velmora.Preferences" from the object
/// "/com/velmora/Preferences".
class LinuxPreferences final : public Preferences {
public:
    /// An empty `directory` means $XDG_CONFIG_HOME (~/.config), an empty `busAddress` the session's bus.
    explicit LinuxPreferences(std::filesystem::path directory = {}, std::string busAddress = {});

    [[nodiscard]] bool boolean(std::string_view domain, std::string_view key) const override;
    void setBoolean(std::string_view domain, std::string_view key, bool value) override;
    void synchronize(std::string_view domain) override;
    void announceChange(std::string_view domain, std::string_view key) override;

private:
    [[nodiscard]] std::filesystem::path pathOf(std::string_view domain) const;
    [[nodiscard]] Result<Done> write(const std::filesystem::path& path, const Dictionary& changes) const;

    std::filesystem::path _directory;
    std::string _busAddress;
    /// Values that are set but not written yet, by domain.
    std::map<std::string, Dictionary, std::less<>> _changes;
};

} // namespace velmora
