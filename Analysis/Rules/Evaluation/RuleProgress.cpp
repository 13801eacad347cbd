// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/RuleProgress.h"

namespace velmora {

RuleProgress::Outcome RuleProgress::step(Time now, const RuleValue& when, const RuleValue& ends,
                                         bool isConfirming, Wakeup& wakeup) {
    return _isActive ? stepActive(now, ends, wakeup) : stepIdle(now, when, ends, isConfirming, wakeup);
}

void RuleProgress::reset() {
    _isActive = false;
    _begin.reset();
    _confirmed.reset();
    _end.reset();
    _unknown.reset();
}

bool RuleProgress::isLost(Time now, bool isKnown, Wakeup& wakeup) {
    if (_unknown && now - *_unknown >= Rule::longestUnknown)
        return true;
    if (isKnown) {
        _unknown.reset();
        return false;
    }
    if (!_unknown)
        _unknown = now;
    wakeup.by(*_unknown + Rule::longestUnknown);
    return false;
}

RuleProgress::Outcome RuleProgress::stepIdle(Time now, const RuleValue& when, const RuleValue& ends,
                                             bool isConfirming, Wakeup& wakeup) {
    // An event that would end as it begins does not begin.
    if (when.isFalse() || ends.isTrue()) {
        reset();
        return Outcome::Nothing;
    }
    if (_begin && isLost(now, when.isKnown(), wakeup))
        reset();
    if (!when.isTrue())
        return Outcome::Nothing;
    if (!_begin) {
        _begin = now;
        return Outcome::Starts;
    }
    if (isConfirming && now > *_begin)
        _confirmed = now;
    if (now - *_begin < _rule.holdFor) {
        wakeup.by(*_begin + _rule.holdFor);
        return Outcome::Nothing;
    }
    // What was measured once, or only at first, stays known for some seconds and does not show what lasts.
    const bool isMeasured = _confirmed && *_confirmed + Rule::longestUnmeasured >= *_begin + _rule.holdFor;
    if (!isMeasured && _rule.holdFor > Time::duration::zero())
        return Outcome::Nothing; // until a report
    _isActive = true;
    _end.reset();
    return Outcome::Begins;
}

RuleProgress::Outcome RuleProgress::stepActive(Time now, const RuleValue& ends, Wakeup& wakeup) {
    if (isLost(now, ends.isKnown(), wakeup)) {
        _end.reset();
        return Outcome::Lost;
    }
    if (ends.isFalse())
        _end.reset();
    if (!ends.isTrue())
        return Outcome::Nothing;
    if (!_end)
        _end = now;
    if (now - *_end >= _rule.keep)
        return Outcome::Ends;
    wakeup.by(*_end + _rule.keep);
    return Outcome::Nothing;
}

} // namespace velmora
