// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"

#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// The telephony service's constant for a technology, given by its short name or by that constant. Fails for
/// an empty or unknown name, and lists the known ones.
[[nodiscard]] Result<std::string> technologyNamed(std::string_view name);

/// The short name of the technology that a user means by the text, in any case: a form without the maker
/// ("LTE"), the short name or the telephony service's constant. A name that is right as it is comes back
/// unchanged. Absent for other texts.
[[nodiscard]] std::optional<std::string> technologyMeantBy(std::string_view text);

/// What users may write: "IFX, GSM (Ostrel_GSM), ...".
[[nodiscard]] std::string technologyForms();

/// A decoder for the technology, given by its short name or by the telephony service's constant. Fails for an
/// empty or unknown name, and lists the known ones.
[[nodiscard]] Result<std::unique_ptr<LogGenerator>> makeDecoder(std::string_view technology,
                                                                const Clock& clock);

} // namespace velmora
