// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Platform/Result.h"
#include "Telephony/Sources/LogSource.h"
#include "Telephony/Sources/SourceString.h"

#include <filesystem>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// What a source may need beside queue and clock; all of it may be absent.
struct SourceSurroundings {
    /// A file whose damage takes long to read is left once it returns true.
    std::function<bool()> isStopping{};
    /// For what has to survive a crash of the service, not of the machine.
    std::filesystem::path directory{};
};

/// Creates the chosen source. Fails for a file that cannot be played. Queue and clock must outlive it.
Result<std::unique_ptr<LogSource>> makeSource(const SourceChoice& choice, MainQueue& queue,
                                              const Clock& clock, const SourceSurroundings& around = {});

/// The help text about the sources, with an example of each.
[[nodiscard]] std::string sourceHelp(std::string_view program);

} // namespace velmora
