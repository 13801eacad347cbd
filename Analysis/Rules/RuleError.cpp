// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleError.h"

namespace velmora {

std::string RuleError::message() const {
    const std::string place = line == 0 ? "" : ":" + std::to_string(line) + ":" + std::to_string(column);
    return file + place + ": " + text;
}

} // namespace velmora
