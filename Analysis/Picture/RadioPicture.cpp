// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>

namespace velmora {

namespace {

std::optional<double> numberOf(const Reading* reading) {
    return reading ? std::optional(reading->number) : std::nullopt;
}

} // namespace

RadioPicture::RadioPicture(const Catalogue& catalogue)
    : _catalogue(catalogue), _table(technologyTable(catalogue.technology())), _uses(catalogue) {
    for (RadioSide i = 0; i < radioTechnologies; ++i)
        _sides[i].technology = static_cast<RadioTechnology>(i);
}

const LeafUse& RadioPicture::useOf(const CatalogueField& leaf) {
    return _uses.at(leaf, [this](const CatalogueField& each) {
        const LeafUse use = velmora::useOf(each, _table);
        if (use.list && isServing(use.role))
            _servingLists.push_back({use.list, use.side, use.role});
        if (use.isOfSide)
            addReported(use.side);
        return use;
    });
}

void RadioPicture::addReported(RadioSide side) {
    const auto place = std::lower_bound(_reported.begin(), _reported.end(), side);
    if (place == _reported.end() || *place != side)
        _reported.insert(place, side);
}

void RadioPicture::update(const MessageReport& report) {
    _change.reset();
    if (report.observed.damage != Damage::None)
        return;
    forgetOld(report.time);
    gather(report);
    change(report);
    forgetWithdrawn(report.observed);
    keep(report);
    forgetReplaced(report);
    findCurrent();
    if (_neighbours.endMessage(report.time))
        findStrongest();
}

void RadioPicture::gather(const MessageReport& report) {
    for (const RadioSide each : _reported)
        _sides[each].beginMessage();
    _named.reset();
    _neighbours.beginMessage();
    _toKeep.clear();
    for (const Observation& each : report.observed.observations) {
        const LeafUse& use = useOf(*each.leaf);
        if (!use.isUsed)
            continue;
        if (use.isOfNeighbour)
            _neighbours.add(each, use, report, _table);
        if (use.role != Role::None && !isNeighbour(use.role))
            _toKeep.push_back(&each);
        else if (!use.isOfSide && !use.namesTechnology)
            continue;
        if ((use.modes || use.evidence) && _sides[use.side].takeMode(each, use, report.time))
            forgetCells(use.side);
        if (each.kind == ObservedKind::Absent)
            continue;
        if (use.namesTechnology)
            _named = technologyOf(each.raw, _table);
        if (!isServing(use.role))
            continue;
        _sides[use.side].gather(each, use, _table);
    }
}

void RadioPicture::forgetCell(RadioSide side) {
    _sides[side].forgetCell();
    _sides[commonSide].readings.forgetServing(); // its network and area
}

void RadioPicture::forgetCells(RadioSide side) {
    for (RadioSide i = 0; i < radioSides; ++i)
        if (i == side || side == commonSide)
            forgetCell(i);
}

void RadioPicture::forgetOld(Time now) {
    for (const RadioSide i : _reported) {
        RadioSideState& side = _sides[i];
        if (side.isReported && now - side.reported > servingLifetime)
            forgetCell(i);
        if (side.mode && !_table.evidence.empty() && now - side.modeReported > servingLifetime)
            side.setMode({}, false);
    }
}

void RadioPicture::forgetWithdrawn(const ObservedMessage& message) {
    for (const ObservedList& each : message.lists)
        _neighbours.replaced(*each.list);
    for (const CatalogueField* const leaf : message.removed) {
        const LeafUse& use = useOf(*leaf);
        if (use.list && (isNeighbour(use.role) || use.part != NeighbourPart::None))
            _neighbours.replaced(*use.list);
        _sides[use.side].readings.forgetLeaf(use.role, *leaf);
        if (use.modes)
            _sides[use.side].setMode({}, false);
    }
}

CellIdentity RadioPicture::identity(RadioSide side) const {
    CellIdentity cell = _sides[side].identity();
    if (side == commonSide)
        cell.technology = _technology;
    return cell;
}

void RadioPicture::change(const MessageReport& report) {
    for (const RadioSide i : _reported) {
        RadioSideState& side = _sides[i];
        if (!side.found.isKnown() || !side.reportsCell(_table))
            continue;
        side.found.technology = i == commonSide ? _named : side.technology;
        const bool isOtherSide = !_table.isHybrid && i != _current;
        const RadioSide before = isOtherSide ? _current : i;
        RadioSideState& old = _sides[before];
        const CellIdentity known = identity(before);
        if (known.isKnown() && areSameCell(known, side.found) == false) {
            // A message that reports both shows the mode in which the phone came to the cell.
            const bool isModeKnown = old.modeBefore.has_value() && !side.isModeReported;
            _change = ServingChange{known,
                                    side.found,
                                    isModeKnown ? old.modeBefore : side.mode,
                                    isModeKnown ? old.wasMovedByNetwork : side.isMovedByNetwork,
                                    numberOf(old.readings.find(Role::ServingLevel)),
                                    old.message,
                                    old.before,
                                    old.since,
                                    old.firstOfCell};
            forgetCell(before);
            _neighbours.forgetAll();
            if (isOtherSide)
                old.setMode({}, false);
        }
        if (isOtherSide && _change && side.modeBefore == side.mode)
            side.setMode({}, false); // of an earlier time on this technology
        if (_change && !side.since) {
            side.before = _change->from;
            side.since = report.time;
            side.firstOfCell = report.message;
        }
        if (!_table.isHybrid) {
            _current = i;
            _technology = side.found.technology;
        }
        side.isReported = true;
    }
    for (const RadioSide i : _reported) {
        RadioSideState& each = _sides[i];
        if (each.isServing && each.isReported && each.reportsCell(_table)) {
            each.reported = report.time;
            each.message = report.message;
        }
    }
}

void RadioPicture::keep(const MessageReport& report) {
    for (const Observation* const kept : _toKeep) {
        const Observation& each = *kept;
        const LeafUse& use = useOf(*each.leaf);
        RadioSideState& side = _sides[use.side];
        const std::uint32_t row = each.rows.empty() ? 0 : each.rows.back();
        if (each.kind == ObservedKind::Absent || isZeroForNone(each, use, _table))
            side.readings.forgetLeaf(use.role, *each.leaf);
        else if (isServing(use.role) && !side.reportsCell(_table))
            continue;
        else if (!use.list || row == (use.list == side.list ? side.row : 0))
            side.readings.keep(use.role, each, report, _text);
    }
}

void RadioPicture::forgetReplaced(const MessageReport& report) {
    for (const ObservedList& list : report.observed.lists)
        for (const ServingList& each : _servingLists) {
            RoleReadings& readings = _sides[each.side].readings;
            const Reading* const kept = list.list == each.list ? readings.find(each.role) : nullptr;
            if (kept && kept->message != report.message && useOf(*kept->leaf).list == each.list)
                readings.forget(each.role);
        }
}

void RadioPicture::findCurrent() {
    for (const RadioSide i : _reported)
        if (_sides[i].isReported && !identity(i).isKnown())
            forgetCell(i); // it was withdrawn
    if (_table.isHybrid) {
        const RadioSideState& data = _sides[sideOf(RadioTechnology::EVDO)];
        const RadioSideState& voice = _sides[sideOf(RadioTechnology::CDMA1x)];
        const bool usesData = data.mode == RadioMode::Connected || (data.isReported && !voice.isReported);
        _current = sideOf(usesData ? RadioTechnology::EVDO : RadioTechnology::CDMA1x);
    }
    if (!current().isReported)
        _technology.reset();
    else if (_current != commonSide)
        _technology = current().technology;
}

void RadioPicture::findStrongest() {
    _strongest.forgetAll();
    for (const Neighbour& each : neighbours()) {
        if (_technology && each.technology && each.technology != _technology)
            continue;
        _strongest.keepNeighbour(each);
        return;
    }
}

void RadioPicture::clear() {
    for (RadioSideState& each : _sides)
        each.forgetAll();
    _neighbours.forgetAll();
    _strongest.forgetAll();
    _technology.reset();
    _change.reset();
}

const Reading* RadioPicture::find(Role role) const {
    if (isNeighbour(role))
        return _strongest.find(role);
    const Reading* const own = current().readings.find(role);
    return own ? own : _sides[commonSide].readings.find(role);
}

const Reading* RadioPicture::find(Role role, RadioTechnology technology) const {
    return _sides[sideOf(technology)].readings.find(role);
}

std::optional<RadioMode> RadioPicture::mode() const {
    if (_technology)
        return current().mode ? current().mode : _sides[commonSide].mode;
    if (_sides[commonSide].mode)
        return _sides[commonSide].mode;
    const auto isIn = [this](RadioMode mode) {
        return std::any_of(_sides.begin(), _sides.end(),
                           [mode](const auto& side) { return side.mode == mode; });
    };
    for (const RadioMode each : {RadioMode::Searching, RadioMode::Off})
        if (isIn(each))
            return each;
    return std::nullopt;
}

CellIdentity RadioPicture::serving() const {
    CellIdentity cell = servingCell();
    cell.area = numberOf(find(Role::ServingArea));
    const Reading* const country = find(Role::ServingCountryCode);
    const Reading* const network = find(Role::ServingNetworkCode);
    if (country && network)
        cell.network = country->text + '-' + network->text;
    return cell;
}

} // namespace velmora
