// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Resources.h"
#include "Tools/ListSections/DissectorFields.h"

#include <string>

namespace velmora {

/// What the dissector reads records by, in Lua: everything that the decoders' sections and parsers describe,
/// with the names that the catalogues have for it.
class DissectorTables {
public:
    /// `templates`: the displays' templates.
    explicit DissectorTables(Resources& templates);

    [[nodiscard]] const DissectorFields& fields() const { return _fields; }
    /// The entries of the Lua table of views: by technology and log code, in calling order.
    [[nodiscard]] const std::string& views() const { return _views; }
    /// The entries of the Lua table of fields by path, of the technology whose messages are displays.
    [[nodiscard]] const std::string& paths() const { return _paths; }

private:
    DissectorFields _fields;
    std::string _views;
    std::string _paths;
};

} // namespace velmora
