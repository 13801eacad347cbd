// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModelNode.h"
#include "PropertyLists/Value.h"

#include <optional>
#include <string>

namespace velmora {

/// The display tree of a recording's moment, made when it is asked for.
class MomentTree {
public:
    /// The moment is another.
    void clear() {
        _root.reset();
        _paths.reset();
    }
    /// `display` is called where there is no tree. Null where there is no display.
    template <class Display>
    [[nodiscard]] NodeRef root(Display display) {
        if (_root)
            return _root;
        const Value shown = display();
        if (shown.isNone())
            return nullptr;
        PathDictionary paths;
        _root = VelmoraModelNode::makeTreeFromObject(shown, paths);
        _paths = std::move(paths);
        return _root;
    }
    /// Of the tree, or null.
    [[nodiscard]] NodeRef at(const std::string& path) const {
        if (!_paths)
            return nullptr;
        const auto found = _paths->find(path);
        return found == _paths->end() ? nullptr : found->second;
    }

private:
    NodeRef _root;
    std::optional<PathDictionary> _paths;
};

} // namespace velmora
