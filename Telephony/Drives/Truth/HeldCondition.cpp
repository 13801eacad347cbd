// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/HeldCondition.h"

namespace velmora {
namespace {

constexpr TruthTime longestUnmeasured = std::chrono::seconds(10);

} // namespace

void HeldCondition::measure(TruthTime at, bool isSo, bool isEnd) {
    confirmLoss(at);
    _unmeasured.reset();
    if (_isLasting) {
        if (!isEnd)
            _ending.reset();
        else if (!_ending)
            _ending = at;
    } else if (!isSo) {
        _since.reset();
    } else if (!_since) {
        _since = at;
    }
}

void HeldCondition::lose(TruthTime at) {
    if (!_unmeasured)
        _unmeasured = at;
}

void HeldCondition::confirm(TruthTime at) {
    confirmLoss(at);
    if (_unmeasured)
        return;
    if (!_isLasting && _since && at - *_since >= _holdFor)
        _isLasting = true;
    if (_isLasting && _ending && at - *_ending >= _keep) {
        tell(_ending);
        _since.reset();
    }
}

void HeldCondition::confirmLoss(TruthTime at) {
    if (!_unmeasured || at - *_unmeasured < longestUnmeasured)
        return;
    if (_isLasting)
        tell(std::nullopt);
    _since.reset();
}

void HeldCondition::finish() {
    if (_isLasting)
        tell(_ending); // which has only not held for long enough
}

void HeldCondition::tell(std::optional<TruthTime> end) {
    _sink.happened({*_since, end, _kind, false, {}});
    _isLasting = false;
    _ending.reset();
}

} // namespace velmora
