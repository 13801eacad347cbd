// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/MessageEffects.h"

#include "LogGenerator/Base.h"

namespace velmora {

void MessageEffects::concerned(Base& section) {
    if (const Value node = section.node(); !node.isNone())
        this->section(section.getSectionName(), node);
}

} // namespace velmora
