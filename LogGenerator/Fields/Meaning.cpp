// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Meaning.h"

namespace velmora {

std::string_view nameOf(Identity identity) {
    switch (identity) {
    case Identity::None: break;
    case Identity::Subscriber: return "subscriber";
    case Identity::Equipment: return "equipment";
    case Identity::Address: return "address";
    case Identity::Location: return "location";
    }
    return {};
}

} // namespace velmora
