// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/ReportEvents.h"

#include "Analysis/Events/EventKind.h"

#include <algorithm>

namespace velmora {

namespace {

const std::string* fieldText(const Event& event, std::string_view name) {
    const EventField* const field = event.field(name);
    return field ? std::get_if<std::string>(&field->value) : nullptr;
}

} // namespace

void ReportEvents::happened(const Event& event) {
    const auto severity = static_cast<std::size_t>(event.severity);
    ++_kinds[event.kind];
    if (++_counts[severity] > most[severity]) {
        ++_omitted;
        return;
    }
    Item& item = _items.emplace_back();
    item.time = event.time;
    item.end = event.lasts ? event.end : std::nullopt;
    item.lasts = event.lasts;
    item.severity = event.severity;
    item.kind = numberOf(event.kind);
    item.technology = numberOf(event.technology);
    item.text = numberOf(shownText(event));
    item.evidence = event.evidence;
}

std::uint32_t ReportEvents::numberOf(std::string_view name) {
    if (const auto found = _numbers.find(name); found != _numbers.end())
        return found->second;
    const auto number = static_cast<std::uint32_t>(_names.size());
    _names.emplace_back(name);
    _numbers.emplace(name, number);
    return number;
}

std::string ReportEvents::shownText(const Event& event) const {
    if (_hasIdentities)
        return event.text;
    const EventKindRow* const row = eventKindNamed(event.kind);
    if (!row || row->isOfRule) {
        const auto replaced = _ruleTexts.find(event.kind);
        return replaced == _ruleTexts.end() ? event.text : replaced->second;
    }
    const std::string* const context = fieldText(event, "context");
    switch (row->kind) {
    case EventKind::ContextUp:
    case EventKind::ContextDown: return context ? "context " + *context : "context";
    case EventKind::AddressChange: return context ? "context " + *context + ": another address" : "address";
    case EventKind::SIMChange: return "another SIM";
    default: return event.text;
    }
}

void ReportEvents::finish() {
    const auto isEarlier = [this](const Item& a, const Item& b) {
        return a.time != b.time ? a.time < b.time : _names[a.kind] < _names[b.kind];
    };
    std::stable_sort(_items.begin(), _items.end(), isEarlier);
}

} // namespace velmora
