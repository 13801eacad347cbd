// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/RoleInputs.h"

#include <algorithm>
#include <string_view>

namespace velmora {

namespace {

using Kind = RuleInput::Kind;

std::string_view stateOf(const RadioPicture& picture, Kind kind) {
    if (kind == Kind::RadioTechnology)
        return picture.technology() ? nameOf(*picture.technology()) : std::string_view();
    return picture.mode() ? nameOf(*picture.mode()) : std::string_view();
}

/// Whether the serving cell is of another radio technology now, whose value was reported earlier.
bool isOther(const Reading& reading, const InputCell& cell) {
    return reading.kind != cell.kind || reading.number != cell.number || reading.text != cell.text;
}

} // namespace

RoleInputs::RoleInputs(const InputStore& inputs) {
    for (std::uint32_t i = 0; i < inputs.slots().size(); ++i) {
        const RuleInput& input = inputs.slot(i).input;
        if (input.kind == Kind::Role)
            _roles.push_back(i);
        else if (input.kind == Kind::RadioTechnology || input.kind == Kind::RadioMode)
            _states.push_back(i);
        else if (input.isNeighbour())
            _hasNeighbours = true;
    }
}

void RoleInputs::update(const RadioPicture& picture, InputStore& inputs) {
    for (const std::uint32_t slot : _roles) {
        const std::vector<InputCell>& cells = inputs.slot(slot).cells;
        const bool isKnown = !cells.empty() && cells.front().isKnown();
        const Reading* const reading = picture.find(inputs.slot(slot).input.role);
        if (!reading) {
            if (isKnown)
                inputs.remove(slot);
        } else if (!isKnown || reading->message == inputs.message() || isOther(*reading, cells.front())) {
            inputs.set(slot, {reading->kind, reading->number, reading->text});
        }
    }
    for (const std::uint32_t slot : _states) {
        const std::string_view state = stateOf(picture, inputs.slot(slot).input.kind);
        const std::vector<InputCell>& cells = inputs.slot(slot).cells;
        const bool isKnown = !cells.empty() && cells.front().isKnown();
        if (state.empty() ? isKnown : !isKnown || cells.front().text != state)
            inputs.set(slot, state.empty() ? ReportedValue() : ReportedValue{ObservedKind::Text, 0, state});
    }
    if (!_hasNeighbours)
        return;
    const std::span<const Neighbour> all = picture.neighbours();
    const bool isReported = std::any_of(all.begin(), all.end(), [&inputs](const Neighbour& each) {
        return each.message == inputs.message();
    });
    if (!isReported && all.size() == _neighbours)
        return;
    _neighbours = all.size();
    // Levels of different radio technologies cannot be compared.
    _sameTechnology.clear();
    std::copy_if(
        all.begin(), all.end(), std::back_inserter(_sameTechnology), [&picture](const Neighbour& each) {
            return !each.technology || !picture.technology() || each.technology == picture.technology();
        });
    inputs.setNeighbours(_sameTechnology);
}

} // namespace velmora
