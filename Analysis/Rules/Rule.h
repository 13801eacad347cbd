// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"

#include <string>

namespace velmora {

/// A rule that has been read from a file and checked.
struct Rule {
    std::string name; ///< the kind of its events
    std::string file;
    int layer = 0;
    Severity severity = Severity::Warning;
    std::string text; ///< with placeholders in braces
    bool lasts = true;
};

} // namespace velmora
