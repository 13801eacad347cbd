// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Passes/EventPass.h"

#include "Platform/PrintableText.h"

#include <algorithm>

namespace velmora {

EventPass::EventPass(const BrowsedFile& file, const RuleSet& rules)
    : FilePass(file, Decoding::With), _engine(catalogue(), *this) {
    _engine.add(makeRuleDetector(rules, catalogue()));
    if (const std::optional<Time> first = file.index().first())
        _levels.setRange(*first, *file.index().last());
    beginObserving();
}

void EventPass::observed(const ObservedMessage& message) {
    const MessageNumber number{0, position() + 1};
    _engine.report({number, message.arrival, message});
    if (const Reading* const level = _engine.picture().find(Role::ServingLevel);
        level && level->message == number && level->kind == ObservedKind::Number)
        _levels.add(message.arrival, level->number);
}

void EventPass::happened(const Event& event) {
    if (_events.size() == most)
        return;
    BrowsedEvent listed{event.time,
                        event.end,
                        event.severity,
                        event.kind,
                        printable(event.text),
                        event.evidence.empty() ? position() : event.evidence.front().number - 1};
    // Most come in the order of their times.
    const auto place = std::upper_bound(_events.begin(), _events.end(), event.time,
                                        [](Time time, const BrowsedEvent& each) { return time < each.time; });
    _events.insert(place, std::move(listed));
}

} // namespace velmora
