// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The files that come with the application, such as display templates. All code uses `resources()`, the
/// process's only set; tests and programs replace it with `setResources`.
class Resources {
public:
    virtual ~Resources() = default;
    /// The content of the resource `name`.`type` ("Ostrel_GSM", "plist"); the reason names the directories
    /// searched.
    [[nodiscard]] virtual Result<Data> read(std::string_view name, std::string_view type) const = 0;
    /// The names, without directory and extension, of all resources of a type, sorted, each once.
    [[nodiscard]] virtual std::vector<std::string> list(std::string_view type) const = 0;
    /// The application's version string; absent when it is not known.
    [[nodiscard]] virtual std::optional<std::string> bundleVersion() const = 0;
    /// When the program was built, in the form "Sep 11 2019 18:54:57".
    [[nodiscard]] virtual std::string buildStamp() const = 0;
};

/// The process's resources. Precondition: some have been set.
[[nodiscard]] Resources& resources();

/// Replaces the resources; the caller keeps them alive. Returns the earlier ones (null at first).
Resources* setResources(Resources* others);

} // namespace velmora
