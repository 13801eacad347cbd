// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedContexts.h"

#include <string>

namespace velmora {

void StatedContexts::state(TruthTime at, const std::set<int>& up) {
    for (const int number : _stated)
        if (!up.contains(number))
            tell(at, "context-down", number);
    for (const int number : up)
        if (!_stated.contains(number))
            tell(at, "context-up", number);
    _stated = up;
}

void StatedContexts::state(TruthTime at, int count) {
    std::set<int> up;
    for (int number = 1; number <= count; ++number)
        up.insert(number);
    state(at, up);
}

void StatedContexts::tell(TruthTime at, std::string_view kind, int number) {
    _sink.happened({at, std::nullopt, kind, false, {{"context", std::to_string(number)}}});
}

} // namespace velmora
