// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/Contexts.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// What a leaf is of a context: a part of the table, by number.
constexpr std::uint8_t key = 0;
constexpr std::uint8_t connected = 1;
constexpr std::uint8_t firstAddress = 2;

/// The label of a leaf of the list's rows; empty for any other leaf.
std::string_view labelIn(std::string_view path, std::string_view list) {
    if (!path.starts_with(list) || !path.substr(list.size()).starts_with("/*/"))
        return {};
    return path.substr(list.size() + 3);
}

/// Whether the node has that path. Makes no text of its path.
bool isAt(const CatalogueNode& node, std::string_view path) {
    const CatalogueNode* each = &node;
    for (; each->parent(); each = each->parent()) {
        const std::string& name = each->name();
        if (!path.ends_with(name) || path.size() == name.size() || path[path.size() - name.size() - 1] != '/')
            return false;
        path.remove_suffix(name.size() + 1);
    }
    return path.empty();
}

} // namespace

ContextsDetector::Context& ContextsDetector::at(std::uint32_t row) {
    const auto end = _new.begin() + static_cast<std::ptrdiff_t>(_count);
    const auto found =
        std::find_if(_new.begin(), end, [row](const Context& each) { return each.row == row; });
    if (found != end)
        return *found;
    if (_count == _new.size())
        _new.emplace_back();
    Context& context = _new[_count++];
    context.row = row;
    context.key.clear();
    context.address.clear();
    context.isConnected = _table.connected.empty();
    context.isSinceKnown = false;
    return context;
}

std::size_t ContextsDetector::parts() const {
    return firstAddress + _table.addresses.size();
}

bool ContextsDetector::isOfPart(std::string_view path, std::size_t part) const {
    return std::any_of(_table.lists.begin(), _table.lists.end(), [&](std::string_view list) {
        const std::string_view label = labelIn(path, list);
        if (label.empty())
            return false;
        if (part == key || part == connected)
            return label == (part == key ? _table.key : _table.connected);
        return label == _table.addresses[part - firstAddress];
    });
}

bool ContextsDetector::wants(const CatalogueField& leaf) const {
    for (std::size_t part = 0; part < parts(); ++part)
        if (isOfPart(leaf.path, part))
            return true;
    return false;
}

void ContextsDetector::read(const Observation& observation) {
    const auto isOf = [this](std::string_view path, std::size_t part) { return isOfPart(path, part); };
    for (const std::uint8_t part : _leaves.of(*observation.leaf, parts(), isOf)) {
        if (observation.rows.empty() || observation.kind == ObservedKind::Absent || _count > most)
            continue;
        Context& context = at(observation.rows.front());
        if (part == key) {
            context.key.assign(_texts.of(observation));
        } else if (part == connected) {
            context.isConnected = observation.raw != 0;
        } else {
            if (!context.address.empty())
                context.address += ' ';
            context.address.append(_texts.of(observation));
        }
    }
}

bool ContextsDetector::hasList(const ObservedMessage& message) const {
    const auto isOne = [this](const ObservedList& list) {
        return std::any_of(_table.lists.begin(), _table.lists.end(),
                           [&list](std::string_view path) { return isAt(*list.list, path); });
    };
    return _table.isInEveryMessage || std::any_of(message.lists.begin(), message.lists.end(), isOne);
}

void ContextsDetector::readList(const ObservedMessage& message) {
    _count = 0;
    for (const Observation& each : message.observations)
        read(each);
    for (std::size_t i = 0; i < _count;)
        if (_new[i].key.empty() || !_new[i].isConnected)
            std::swap(_new[i], _new[--_count]);
        else
            ++i;
}

void ContextsDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    if (!hasList(report.observed))
        return;
    readList(report.observed);
    _hasRead = true;
    if (_isKnown) {
        compare(report, picture, sink);
        return;
    }
    _isKnown = true;
    _active.assign(_new.begin(), _new.begin() + static_cast<std::ptrdiff_t>(_count));
    for (Context& each : _active)
        each.message = report.message;
}

void ContextsDetector::compare(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    const auto begin = _new.begin();
    const auto end = begin + static_cast<std::ptrdiff_t>(_count);
    const auto sameKey = [](const Context& context) {
        return [&context](const Context& each) { return each.key == context.key; };
    };
    for (const Context& each : _active)
        if (std::none_of(begin, end, sameKey(each)))
            happened(EventKind::ContextDown, each, report, picture, sink);
    std::erase_if(_active, [&](const Context& each) { return std::none_of(begin, end, sameKey(each)); });
    for (auto each = begin; each != end; ++each) {
        const auto known = std::find_if(_active.begin(), _active.end(), sameKey(*each));
        if (known == _active.end()) {
            Context& context = _active.emplace_back(*each);
            context.since = report.time;
            context.isSinceKnown = true;
            context.message = report.message;
            happened(EventKind::ContextUp, context, report, picture, sink);
        } else if (known->address != each->address) {
            Event event = newEvent(EventKind::AddressChange, report, picture);
            addField(event, "context", known->key);
            addChange(event, known->address, each->address);
            event.text.insert(0, "context " + known->key + ": ");
            addEvidence(event, known->message);
            sink.happened(event);
            known->address = each->address;
        }
    }
}

void ContextsDetector::happened(EventKind kind, const Context& context, const MessageReport& report,
                                const RadioPicture& picture, EventSink& sink) const {
    Event event = newEvent(kind, report, picture);
    event.text = "context " + context.key;
    if (!context.address.empty())
        event.text += ": " + context.address;
    addField(event, "context", context.key);
    addField(event, "address", context.address);
    if (kind == EventKind::ContextDown && context.isSinceKnown)
        addDuration(event, context.since, report.time);
    addEvidence(event, context.message);
    sink.happened(event);
}

void ContextsDetector::interrupt(Time, EventSink&) {
    _isKnown = false;
    _active.clear();
}

} // namespace velmora
