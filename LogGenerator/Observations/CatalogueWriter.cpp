// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/CatalogueWriter.h"

namespace velmora {

void CatalogueWriter::fields(std::span<const Field> fields) {
    for (const Field& field : fields) {
        if (_levels.empty()) {
            for (Catalogue::Node* const node : _places(field.label))
                addTo(*node, field);
            continue;
        }
        for (Catalogue::Node* const row : _levels.back().rows)
            addTo(field.label.empty() ? *row : row->child(field.label), field);
    }
}

void CatalogueWriter::addTo(Catalogue::Node& node, const Field& field) {
    const List* const list = _levels.empty() ? nullptr : _levels.back().list;
    const bool isFirst = !node.leaf() || node.leaf()->sources.empty();
    CatalogueField& leaf = _catalogue.add(node, _map.section(), {_code, &field, list, _subPacket});
    // A second place for the same value of the same record: a role is that of the first.
    const CatalogueField& first = *_catalogue.firstOf(list, field, leaf);
    if (&first != &leaf && isFirst) {
        leaf.sameAs = first.path;
        leaf.role = Role::None;
    }
    _map.add(FieldMap::Entry{list, &field, &node, &leaf.sources.back(), kindOf(field), physicalScale(field),
                             field.means.offset});
    _map.sort();
}

void CatalogueWriter::beginList(const List& list) {
    std::vector<Catalogue::Node*> lists;
    if (_levels.empty())
        lists = _places(list.label);
    else
        for (Catalogue::Node* const row : _levels.back().rows)
            lists.push_back(&row->child(list.label));
    const List* const outer = _levels.empty() ? nullptr : _levels.back().list;
    Level level{&list, {}};
    // A list of several codes has been entered with the first.
    const bool isNew = _map.findList(outer, list).empty();
    for (Catalogue::Node* const node : lists) {
        level.rows.push_back(&node->rows());
        node->rows().setKeys(list.keys);
        if (list.isOpen)
            node->rows().setOpen();
        if (!isNew)
            continue;
        _map.add(FieldMap::ListEntry{outer, &list, node});
        if (list.whenEmpty.empty())
            continue;
        CatalogueField& leaf = _catalogue.leafAt(*node, _map.section());
        leaf.kind = ObservedKind::Absent;
        leaf.absentTexts.emplace_back(list.whenEmpty);
    }
    _levels.push_back(std::move(level));
}

void CatalogueWriter::endList() {
    _levels.pop_back();
}

} // namespace velmora
