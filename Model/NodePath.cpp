// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/NodePath.h"

namespace velmora {

std::string appendingPathComponent(std::string_view path, std::string_view name) {
    std::string joined;
    joined.reserve(path.size() + 1 + name.size());
    joined += path;
    if (path != rootNodePath || name.empty())
        joined += '/';
    joined += name;
    return joined;
}

} // namespace velmora
