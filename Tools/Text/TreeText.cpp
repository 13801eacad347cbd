// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/TreeText.h"

#include "Platform/PrintableText.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::size_t indentation = 2;
constexpr std::size_t gap = 2;

void appendChildren(std::vector<TreeRow>& rows, const std::vector<NodeRef>& children, std::size_t indent) {
    std::size_t nameWidth = 0;
    for (const NodeRef& child : children)
        if (!child->childNodes())
            nameWidth = std::max(nameWidth, displayWidth(printable(child->displayName())));
    for (const NodeRef& child : children) {
        const std::string name = printable(child->displayName());
        TreeRow row{std::string(indent, ' ') + name, child->childNodes() != nullptr};
        if (!row.isBranch && child->value()) {
            row.text.append(nameWidth - displayWidth(name) + gap, ' ');
            row.text += printable(*child->value());
        }
        row.text.erase(row.text.find_last_not_of(' ') + 1);
        rows.push_back(std::move(row));
        if (const std::vector<NodeRef>* grandchildren = child->childNodes())
            appendChildren(rows, *grandchildren, indent + indentation);
    }
}

} // namespace

std::vector<TreeRow> treeRows(const VelmoraModelNode& root) {
    std::vector<TreeRow> rows;
    if (const std::vector<NodeRef>* children = root.childNodes())
        appendChildren(rows, *children, 0);
    return rows;
}

std::string treeText(const VelmoraModelNode& root) {
    std::string text;
    for (const TreeRow& row : treeRows(root)) {
        text += row.text;
        text += '\n';
    }
    return text;
}

} // namespace velmora
