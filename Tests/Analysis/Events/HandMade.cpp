// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <cmath>
#include <stdexcept>

namespace velmora {

namespace {

CatalogueNode& nodeAt(Catalogue& catalogue, std::string_view path) {
    CatalogueNode* node = &catalogue.root();
    while (!path.empty()) {
        path.remove_prefix(1); // the slash
        const std::string_view name = path.substr(0, path.find('/'));
        node = &node->child(name);
        path.remove_prefix(name.size());
    }
    return *node;
}

Time timeOf(double seconds) {
    return FakeClock::defaultNow() + std::chrono::nanoseconds(std::llround(seconds * 1e9));
}

} // namespace

Observation& HandMadeMessage::add(std::string_view path, ObservedKind kind) {
    Observation& observation = _observations.emplace_back();
    CatalogueField& leaf = _catalogue.leafAt(nodeAt(_catalogue, path), "");
    observation.leaf = &leaf;
    observation.kind = kind;
    if (path.find("/*") != std::string_view::npos)
        observation.rows = _rows.emplace_back(std::vector<std::uint32_t>{_row.value()});
    return observation;
}

HandMadeMessage& HandMadeMessage::number(std::string_view path, double value) {
    Observation& observation = add(path, ObservedKind::Number);
    observation.number = value;
    observation.given = _texts.emplace_back(std::to_string(std::llround(value)));
    return *this;
}

HandMadeMessage& HandMadeMessage::state(std::string_view path, std::int64_t raw, std::string_view text) {
    Observation& observation = add(path, ObservedKind::Enumeration);
    observation.raw = raw;
    observation.given = _texts.emplace_back(text.empty() ? std::to_string(raw) : std::string(text));
    return *this;
}

HandMadeMessage& HandMadeMessage::text(std::string_view path, std::string_view value) {
    Observation& observation = add(path, ObservedKind::Text);
    observation.words = observation.given = _texts.emplace_back(value);
    return *this;
}

HandMadeMessage& HandMadeMessage::flag(std::string_view path, bool value) {
    Observation& observation = add(path, ObservedKind::Flag);
    observation.raw = value ? 1 : 0;
    observation.given = value ? "Yes" : "No";
    return *this;
}

HandMadeMessage& HandMadeMessage::absent(std::string_view path) {
    add(path, ObservedKind::Absent);
    return *this;
}

HandMadeMessage& HandMadeMessage::row(std::uint32_t number) {
    _row = number;
    return *this;
}

HandMadeMessage& HandMadeMessage::list(std::string_view path, std::uint32_t rows) {
    _lists.push_back({&nodeAt(_catalogue, path), rows});
    return *this;
}

HandMadeMessage& HandMadeMessage::removed(std::string_view path) {
    _removed.push_back(&_catalogue.leafAt(nodeAt(_catalogue, path), ""));
    return *this;
}

HandMadeMessage& HandMadeMessage::damaged(Damage damage, std::optional<std::uint32_t> code) {
    _damage = damage;
    _code = code;
    return *this;
}

HandMadeMessage& HandMadeMessage::arrivedAt(double seconds) {
    _arrival = seconds;
    return *this;
}

Time HandMadeMessage::time() const {
    return timeOf(_seconds);
}

ObservedMessage HandMadeMessage::observed() const {
    return {1,      timeOf(_arrival.value_or(_seconds)), _code, std::nullopt, _observations, _lists, _removed,
            _damage};
}

HandMadeEngine::HandMadeEngine(std::string_view technology, std::initializer_list<RoleOfLeaf> roles)
    : catalogue(technology), engine(catalogue, kept) {
    for (const RoleOfLeaf& each : roles)
        catalogue.leafAt(nodeAt(catalogue, each.path), "").role = each.role;
}

void HandMadeEngine::send(const HandMadeMessage& message) {
    const ObservedMessage observed = message.observed();
    engine.report({{0, ++messages}, message.time(), observed});
}

std::vector<std::string> HandMadeEngine::linesOf(std::string_view kind) const {
    std::vector<std::string> found;
    for (const std::string& line : lines()) {
        const std::size_t blank = line.find(' ');
        const std::size_t end = line.find(": ");
        if (line.substr(blank + 1, end - blank - 1) == kind)
            found.push_back(line.substr(0, blank) + line.substr(end + 1));
    }
    return found;
}

const Event& HandMadeEngine::only(std::string_view kind) const {
    const Event* found = nullptr;
    for (const Event& each : kept.events)
        if (each.kind == kind) {
            if (found)
                throw std::logic_error("more than one " + std::string(kind));
            found = &each;
        }
    if (!found)
        throw std::logic_error("no " + std::string(kind));
    return *found;
}

double numberOf(const Event& event, std::string_view field) {
    const EventField* const found = event.field(field);
    if (!found)
        throw std::logic_error("no " + std::string(field));
    return std::get<double>(found->value);
}

std::string textOf(const Event& event, std::string_view field) {
    const EventField* const found = event.field(field);
    return found ? std::get<std::string>(found->value) : std::string();
}

LTEEngine::LTEEngine()
    : HandMadeEngine("Ostrel_LTE", {{servingPCI, Role::ServingPhysicalCell},
                                    {servingEARFCN, Role::ServingChannel},
                                    {servingIdentity, Role::ServingCell},
                                    {servingTAC, Role::ServingArea},
                                    {idleEARFCN, Role::ServingChannel},
                                    {idlePCI, Role::ServingPhysicalCell},
                                    {idleRSRP, Role::ServingLevel},
                                    {neighbourPCI, Role::NeighbourPhysicalCell},
                                    {neighbourRSRP, Role::NeighbourLevel},
                                    {connectedEARFCN, Role::ServingChannel},
                                    {connectedPCI, Role::ServingPhysicalCell},
                                    {detectedPCI, Role::NeighbourPhysicalCell}}) {}

void LTEEngine::serve(double seconds, int pci, int earfcn) {
    send(at(seconds)
             .number(servingPCI, pci)
             .number(servingEARFCN, earfcn)
             .number(servingIdentity, 1000 + pci)
             .number(servingTAC, 7101));
}

void LTEEngine::measureIdle(double seconds, int pci, double rsrp, int earfcn) {
    send(at(seconds).number(idleEARFCN, earfcn).number(idlePCI, pci).number(idleRSRP, rsrp));
}

void LTEEngine::measureConnected(double seconds, int pci, int earfcn) {
    send(at(seconds).number(connectedEARFCN, earfcn).number(connectedPCI, pci));
}

void LTEEngine::measureNeighbours(double seconds, std::vector<std::pair<int, double>> cells, int earfcn) {
    HandMadeMessage message = at(seconds);
    message.number(neighbourEARFCN, earfcn).list(neighbourList, static_cast<std::uint32_t>(cells.size()));
    std::uint32_t row = 0;
    for (const auto& [pci, rsrp] : cells)
        message.row(row++).number(neighbourPCI, pci).number(neighbourRSRP, rsrp);
    send(message);
}

} // namespace velmora
