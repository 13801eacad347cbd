// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/Files/FileErrors.h"
#include "Analysis/Rules/Files/TOMLNode.h"
#include "Analysis/Rules/Rule.h"

#include <vector>

namespace velmora {

/// The parts of an event's text: "{serving.level}" is the value of an expression, "{{" and "}}" are braces.
[[nodiscard]] std::vector<RuleTextPart> readRuleText(const TOMLNode& text, const InputNames& names,
                                                     FileErrors& errors);

} // namespace velmora
