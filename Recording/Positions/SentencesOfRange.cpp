// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/SentencesOfRange.h"

#include <utility>

namespace velmora {

void SentencesOfRange::add(const PositionSentence& sentence, Block block) {
    if (const std::uint64_t ended = _assembler.epochs();
        const std::optional<Fix> fix = _assembler.add(sentence))
        endFix(fix);
    else if (_assembler.epochs() != ended)
        endFix(std::nullopt);
    switch (_sideOf(sentence.time)) {
    case RangeSide::Before:
        if (!_isBegun)
            _present.push_back(std::move(block));
        break;
    case RangeSide::Within:
        beginRange();
        _reachesIn = true;
        _keep(std::move(block));
        break;
    case RangeSide::After:
        if (_isBegun && !_isComplete)
            _present.push_back(std::move(block));
        break;
    }
}

void SentencesOfRange::endSection() {
    endFix(_assembler.finish());
    _fixBefore.clear(); // its interface is that section's
}

void SentencesOfRange::beginRange() {
    if (std::exchange(_isBegun, true))
        return;
    // Where the fix that begins before the range goes on within it, that is the one before.
    const std::optional<Time> pending = _assembler.pending();
    if (!pending || _sideOf(*pending) != RangeSide::Before)
        for (Block& block : _fixBefore)
            _keep(std::move(block));
    for (Block& block : _present)
        _keep(std::move(block));
    _fixBefore.clear();
    _present.clear();
}

void SentencesOfRange::endFix(const std::optional<Fix>& fix) {
    std::vector<Block> ended = std::exchange(_present, {});
    const bool reachesIn = std::exchange(_reachesIn, false);
    if (!_isBegun) {
        if (fix)
            _fixBefore = std::move(ended);
        return;
    }
    if (fix || reachesIn)
        for (Block& block : ended)
            _keep(std::move(block));
    if (fix && _sideOf(fix->time) == RangeSide::After)
        _isComplete = true;
}

} // namespace velmora
