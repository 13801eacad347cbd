// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "Model/VelmoraModelNode.h"
#include "PropertyLists/Value.h"

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

class LogGenerator;

/// The parts of a display that a user has selected by the paths of the display tree ("/Serving Cell/ARFCN",
/// "/Neighboring Cells/0", "/Neighboring Cells/*/ARFCN"; see PathPattern). Works on the display dictionary
/// itself, since building the tree would cost more than all else. Where several rows share a path, `find`
/// returns the last; the restricted displays keep them all.
class NodeSelection {
public:
    /// Precondition: each of the texts is one that `isPath`. Without paths everything is selected.
    explicit NodeSelection(const std::vector<std::string>& texts);
    NodeSelection() = default;

    /// Whether the text may be a path, which begins with a slash, or a name, "=" and a path.
    [[nodiscard]] static bool isPath(std::string_view text);

    /// Has the decoder write only what is selected into its displays. To be called before its first message.
    void limit(LogGenerator& decoder) const;

    [[nodiscard]] const std::vector<std::string>& paths() const { return _paths; }
    /// What a column of each path is called: its name, or the path itself.
    [[nodiscard]] const std::vector<std::string>& names() const { return _names; }

    /// The same of a part of a display: the value of that place.
    [[nodiscard]] Value restrictedAt(const CatalogueNode& place, const Value& value) const;

    /// The value of the node at the path; null where there is none. Belongs to the display.
    [[nodiscard]] static const Value* find(const Value& display, std::string_view path);
    /// The values of all nodes at a path with "*", in the display's order.
    static void findAll(const Value& display, std::string_view path, std::vector<const Value*>& found);
    /// The same from a place of the display on, by what is left of a path there, which is not empty.
    [[nodiscard]] static const Value* findBelow(const Value& place, std::string_view rest);
    static void findAllBelow(const Value& place, std::string_view rest, std::vector<const Value*>& found);
    /// Whether the path may be that of several nodes.
    [[nodiscard]] static bool hasWildcard(std::string_view path);

    /// The display reduced to the selected nodes and what leads to them: their keys, "_sorted" markers, and,
    /// before a selected element of an array, none for each element that is not selected. None where nothing
    /// is selected. Shares the selected nodes with the display.
    [[nodiscard]] Value restricted(const Value& display) const;
    /// The same of a tree; null where nothing is selected.
    [[nodiscard]] NodeRef restricted(const NodeRef& root) const;

private:
    [[nodiscard]] bool selectsAll() const;

    std::vector<std::string> _paths;
    std::vector<std::string> _names;
};

} // namespace velmora
