// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/DisplayRows.h"

#include "Model/VelmoraModelNode.h"
#include "Platform/PrintableText.h"

#include <string_view>
#include <unordered_map>

namespace velmora {

namespace {

void append(std::vector<DisplayRow>& rows, const VelmoraModelNode& node, const std::string& path,
            std::size_t depth) {
    for (const NodeRef& child : *node.childNodes()) {
        DisplayRow row;
        row.path = path + "/" + child->displayName();
        row.name = printable(child->displayName());
        row.depth = depth;
        row.isBranch = child->childNodes() != nullptr;
        if (!row.isBranch && child->value())
            row.value = printable(*child->value());
        rows.push_back(row);
        if (row.isBranch)
            append(rows, *child, row.path, depth + 1);
    }
}

} // namespace

std::vector<DisplayRow> displayRows(const Value& display) {
    std::vector<DisplayRow> rows;
    if (display.isNone())
        return rows;
    PathDictionary paths;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(display, paths);
    if (root && root->childNodes())
        append(rows, *root, {}, 0);
    return rows;
}

void markChanges(std::vector<DisplayRow>& rows, const std::vector<DisplayRow>& earlier) {
    std::unordered_map<std::string_view, const DisplayRow*> before;
    for (const DisplayRow& row : earlier)
        before[row.path] = &row;
    for (DisplayRow& row : rows) {
        const auto found = before.find(row.path);
        row.hasChanged = !row.isBranch && (found == before.end() || found->second->value != row.value);
    }
}

const CatalogueField* leafOfPath(const Catalogue& catalogue, const std::string& path) {
    const CatalogueNode* node = &catalogue.root();
    for (std::size_t at = 1; node && at <= path.size();) {
        const std::size_t end = std::min(path.find('/', at), path.size());
        const std::string_view name = std::string_view(path).substr(at, end - at);
        const CatalogueNode* const child = node->find(name);
        node = child ? child : node->find("*");
        at = end + 1;
    }
    return node ? node->leaf() : nullptr;
}

} // namespace velmora
