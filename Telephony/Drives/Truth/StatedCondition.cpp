// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedCondition.h"

namespace velmora {

void StatedCondition::update(TruthTime at, bool isSo, bool isStated) {
    if (isSo && !_since && isStated) {
        _since = at;
        _unstatedSince.reset();
    } else if (isSo && !_since && !_unstatedSince) {
        _unstatedSince = at;
    } else if (!isSo && _unstatedSince) {
        _sink.happened({*_unstatedSince, at, _kind, true, {}});
        _unstatedSince.reset();
    } else if (!isSo && _since && isStated) {
        _sink.happened({*_since, at, _kind, false, {}});
        _since.reset();
    }
}

void StatedCondition::finish() {
    if (_since)
        _sink.happened({*_since, std::nullopt, _kind, false, {}});
    _since.reset();
}

} // namespace velmora
