// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/TechnologyEvents.h"

namespace velmora {

TechnologyEvents::TechnologyEvents(const Catalogue& catalogue, const RuleSet& rules, const std::string& file,
                                   ByteSink& sink, PageCompressor& compressor)
    : _table(catalogue.technology(), file, sink, compressor), _engine(catalogue, *this) {
    _engine.add(makeRuleDetector(rules, catalogue));
}

void TechnologyEvents::report(const ObservedMessage& message, std::uint64_t number,
                              const std::optional<DecimalDegrees>& place) {
    if (place)
        _places.add(message.arrival, *place);
    _engine.report({{0, number}, message.arrival, message});
}

Result<Done> TechnologyEvents::finish() {
    _engine.finish();
    return _table.table().finish();
}

void TechnologyEvents::began(const Event& event) {
    if (const std::optional<DecimalDegrees> place = _places.at(event.time))
        _begun[{event.time, event.kind}] = *place;
}

void TechnologyEvents::happened(const Event& event) {
    if (const auto begun = _begun.find({event.time, event.kind}); begun != _begun.end()) {
        _table.add(event, begun->second);
        _begun.erase(begun);
        return;
    }
    _table.add(event, _places.at(event.time));
}

} // namespace velmora
