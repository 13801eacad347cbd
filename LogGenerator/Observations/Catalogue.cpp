// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Catalogue.h"

#include <algorithm>

namespace velmora {

namespace {

void addOnce(std::vector<std::string>& texts, std::string_view text) {
    if (std::find(texts.begin(), texts.end(), text) == texts.end())
        texts.emplace_back(text);
}

} // namespace

std::string_view nameOf(ObservedKind kind) {
    switch (kind) {
    case ObservedKind::Number: return "number";
    case ObservedKind::Enumeration: return "enumeration";
    case ObservedKind::Flag: return "flag";
    case ObservedKind::Text: return "text";
    case ObservedKind::Binary: return "bytes";
    case ObservedKind::Absent: return "absent";
    }
    return {};
}

ObservedKind kindOf(const Field& field) {
    if (field.means.isAbsence)
        return ObservedKind::Absent;
    if (field.means.digits != 0)
        return ObservedKind::Text;
    switch (field.format.kind) {
    case TextFormat::Kind::Integer:
    case TextFormat::Kind::Real:
    case TextFormat::Kind::Hexadecimal: return ObservedKind::Number;
    case TextFormat::Kind::Enumeration: return ObservedKind::Enumeration;
    case TextFormat::Kind::Flag: return ObservedKind::Flag;
    case TextFormat::Kind::Text: break;
    }
    return ObservedKind::Text;
}

Unit unitOf(const Field& field) {
    if (field.means.unit)
        return *field.means.unit;
    if (kindOf(field) != ObservedKind::Number || field.format.kind == TextFormat::Kind::Hexadecimal)
        return Unit::None;
    return unitOfSuffix(field.format.format.suffix).value_or(ShownUnit()).unit;
}

double physicalScale(const Field& field) {
    if (field.means.unit || field.format.kind == TextFormat::Kind::Hexadecimal)
        return field.means.scale;
    return field.means.scale * unitOfSuffix(field.format.format.suffix).value_or(ShownUnit()).scale;
}

CatalogueNode* CatalogueNode::find(std::string_view name) const {
    const auto found = _byName.find(name);
    return found == _byName.end() ? nullptr : found->second;
}

CatalogueNode& CatalogueNode::child(std::string_view name) {
    if (CatalogueNode* const found = find(name))
        return *found;
    CatalogueNode& made = *_children.emplace_back(std::make_unique<CatalogueNode>(name, this));
    _byName.emplace(made._name, &made);
    CatalogueNode* root = this;
    while (root->_parent)
        root = root->_parent;
    ++root->_count;
    return made;
}

std::string CatalogueNode::path() const {
    if (!_parent)
        return "/";
    const std::string parent = _parent->_parent ? _parent->path() : std::string();
    return parent + "/" + _name;
}

CatalogueField& Catalogue::leafAt(Node& node, std::string_view section) {
    if (!node._leaf) {
        CatalogueField& leaf = _fields.emplace_back();
        leaf.index = _fields.size() - 1;
        leaf.node = &node;
        leaf.path = node.path();
        leaf.section = section;
        for (const CatalogueNode* above = &node; above && leaf.keys.empty(); above = above->parent())
            leaf.keys = above->keys();
        node._leaf = &leaf;
    }
    return *node._leaf;
}

CatalogueField& Catalogue::add(Node& node, std::string_view section, const CatalogueSource& source) {
    CatalogueField& leaf = leafAt(node, section);
    const Field& field = *source.field;
    const ObservedKind kind = kindOf(field);
    // A source that only says why there is no value adds its texts to a leaf that others define.
    if (kind != ObservedKind::Absent) {
        leaf.kind = kind;
        leaf.unit = unitOf(field);
        if (leaf.role == Role::None)
            leaf.role = field.means.role;
        if (leaf.identity == Identity::None)
            leaf.identity = field.means.identity;
        if (leaf.clause.empty())
            leaf.clause = field.means.clause;
    }
    if (field.format.hasSpecial)
        addOnce(leaf.absentTexts, field.format.specialText);
    if (field.means.absent)
        addOnce(leaf.absentTexts, *field.means.absent);
    leaf.sources.push_back(source);
    return leaf;
}

} // namespace velmora
