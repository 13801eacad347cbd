// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"

#include <functional>
#include <string_view>
#include <vector>

namespace velmora {

using CatalogueRows = std::vector<std::reference_wrapper<const CatalogueField>>;

/// Writes rows of catalogues in one of the formats of `velmora-log fields`.
class FieldsWriter {
public:
    virtual ~FieldsWriter() = default;

    /// Called before anything else.
    virtual void begin() {}
    /// The rows of one technology, by its short name; called for each technology once.
    virtual void write(std::string_view technology, const CatalogueRows& rows) = 0;
    /// Called after everything else.
    virtual void end() {}
};

} // namespace velmora
