// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"

#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// The telephony service's constant for a technology, given by its short name or by that constant. Fails for
/// an empty or unknown name, and lists the known ones.
[[nodiscard]] Result<std::string> technologyNamed(std::string_view name);

/// A decoder for the technology, given by its short name or by the telephony service's constant. Fails for an
/// empty or unknown name, and lists the known ones.
[[nodiscard]] Result<std::unique_ptr<LogGenerator>> makeDecoder(std::string_view technology,
                                                                const Clock& clock);

} // namespace velmora
