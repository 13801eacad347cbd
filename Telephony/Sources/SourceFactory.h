// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/MainQueue.h"
#include "Platform/Result.h"
#include "Telephony/Sources/LogSource.h"
#include "Telephony/Sources/SourceString.h"

#include <filesystem>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// Creates the chosen source. Fails for a file that cannot be played. Queue and clock must outlive it.
/// `directory` is for what has to survive a crash of the service, not of the machine; empty for nothing.
Result<std::unique_ptr<LogSource>> makeSource(const SourceChoice& choice, MainQueue& queue,
                                              const Clock& clock,
                                              const std::filesystem::path& directory = {});

/// The help text about the sources, with an example of each.
[[nodiscard]] std::string sourceHelp(std::string_view program);

} // namespace velmora
