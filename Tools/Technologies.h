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

/// The telephony service's constant for a technology, named in short or by that constant. Fails with the
/// names that there are where it is none of them, or is empty.
[[nodiscard]] Result<std::string> technologyNamed(std::string_view name);

/// A decoder for the technology, named in short or by the telephony service's constant. Fails with the names
/// that there are where it is none of them, or is empty.
[[nodiscard]] Result<std::unique_ptr<LogGenerator>> makeDecoder(std::string_view technology,
                                                                const Clock& clock);

} // namespace velmora
