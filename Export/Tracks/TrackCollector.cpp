// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Tracks/TrackCollector.h"

#include <optional>
#include <utility>

namespace velmora {

TrackCollector::TrackCollector(MessageReader& reader) : _reader(reader) {
    reader.setSentences([this](const PositionSentence& sentence) {
        if (const std::optional<Fix> fix = _assembler.add(sentence))
            _fixes.push_back(*fix);
    });
}

TrackCollector::~TrackCollector() {
    _reader.setSentences({});
}

Track TrackCollector::takeTrack(std::chrono::nanoseconds maximumGap) {
    if (const std::optional<Fix> last = _assembler.finish())
        _fixes.push_back(*last);
    return Track::ofFixes(std::exchange(_fixes, {}), maximumGap);
}

} // namespace velmora
