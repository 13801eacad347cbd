// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedState.h"

namespace velmora {

void StatedState::update(TruthTime at, std::string_view state, bool isStated) {
    if (state != _now) {
        if (_isPending && _stated && _now != *_stated)
            tell(_since, _now, true);
        _now = state;
        _since = at;
        _isPending = true;
    }
    if (!isStated || !_isPending)
        return;
    if (_stated && *_stated != _now)
        tell(at, _now, _isMisstated);
    _stated = _now;
    _isPending = _isMisstated = false;
}

void StatedState::misstate(TruthTime at, std::string_view state) {
    if (!_stated || *_stated == state)
        return;
    tell(at, state, true);
    _stated = state;
    _isPending = _isMisstated = true;
}

void StatedState::tell(TruthTime at, std::string_view to, bool isHidden) {
    _sink.happened(
        {at,
         std::nullopt,
         _kind,
         isHidden,
         {{"machine", std::string(_machine)}, {"from", _stated.value_or("")}, {"to", std::string(to)}}});
}

} // namespace velmora
