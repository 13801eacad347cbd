// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogGenerator/Observations/FieldMap.h"

#include <cstdint>
#include <functional>
#include <vector>

namespace velmora {

/// Enters what a section describes into the catalogue and the section's map.
class CatalogueWriter final : public ContentVisitor {
public:
    /// Where a field or list of that label is shown outside of lists; empty for nowhere.
    using Places = std::function<std::vector<Catalogue::Node*>(std::string_view label)>;

    CatalogueWriter(Catalogue& catalogue, FieldMap& map, Places places)
        : _catalogue(catalogue), _map(map), _places(std::move(places)) {}

    /// What follows is read from records of that code.
    void setCode(std::uint32_t code) {
        _code = code;
        _subPacket = 0;
    }

    void subPacket(std::uint8_t id) override { _subPacket = id; }
    void fields(std::span<const Field> fields) override;
    void beginList(const List& list) override;
    void endList() override;

private:
    struct Level {
        const List* list;
        std::vector<Catalogue::Node*> rows;
    };
    void addTo(Catalogue::Node& node, const Field& field);

    Catalogue& _catalogue;
    FieldMap& _map;
    Places _places;
    std::uint32_t _code = 0;
    std::uint8_t _subPacket = 0;
    std::vector<Level> _levels;
};

} // namespace velmora
