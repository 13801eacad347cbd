// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventWriter.h"

namespace velmora {

std::string_view nameOf(EventState state) {
    return state == EventState::Begins ? "begins" : "complete";
}

} // namespace velmora
