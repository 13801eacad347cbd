// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Resources.h"

#include <stdexcept>
#include <utility>

namespace velmora {

namespace {

Resources* current = nullptr;

} // namespace

Resources& resources() {
    if (!current)
        throw std::logic_error("the program has set no resources");
    return *current;
}

Resources* setResources(Resources* others) {
    return std::exchange(current, others);
}

} // namespace velmora
