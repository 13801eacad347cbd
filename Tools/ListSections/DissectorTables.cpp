// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/DissectorTables.h"

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/Extra/CellSection.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"
#include "Tools/ListSections/LuaText.h"
#include "Tools/ListSections/ViewText.h"

#include <algorithm>
#include <cstdio>
#include <memory>
#include <stdexcept>

namespace velmora {

namespace {

class NoClock final : public Clock {
public:
    [[nodiscard]] Time now() const override { return {}; }
    [[nodiscard]] ZoneState zoneAt(Time) const override { return {}; }
};
const NoClock clock;

std::string codeKey(std::uint32_t code) {
    char text[24];
    std::snprintf(text, sizeof text, "[0x%04X]={", static_cast<unsigned>(code));
    return text;
}

/// Which cells of the cell information array the section shows.
std::string cellsOf(const CellTable& table) {
    std::string text = table.shown == CellTable::Shown::First  ? ",cells=\"first\",kinds={"
                       : table.shown == CellTable::Shown::Last ? ",cells=\"last\",kinds={"
                                                               : ",cells=\"rows\",kinds={";
    for (const CellKind& kind : table.kinds)
        text += "[" +
                luaString(std::string(cellTechnologies[kind.technology]) + " " +
                          std::string(cellTypes[kind.type])) +
                "]=true,";
    return text + "}";
}

/// Describes views of one technology.
struct ViewWriter {
    std::string_view technology;
    const LeafIndex& leaves;
    DissectorFields& fields;

    std::string view(const Base& section, const View& view) const {
        ViewText text(technology, section.getSectionName(), view.code, leaves, fields);
        section.describe(view, text);
        std::string head = "        {section=" + luaString(section.getSectionName()) +
                           ",least=" + std::to_string(view.minimumLength);
        if (const auto* cells = dynamic_cast<const CellSection*>(&section);
            cells && view.code == cellInformation.code)
            head += cellsOf(cells->cellTable());
        return head + "," + text.text() + "},\n";
    }
    std::string sections(const ClassIndex& index) const {
        std::string text;
        for (const std::string& codeText : index.getAllLogCodes()) {
            const auto code = static_cast<std::uint32_t>(std::stoul(codeText));
            text += "      " + codeKey(code) + "\n";
            std::vector<const Base*> done;
            for (const Base* section : *index.getSubscribers(code)) {
                if (std::find(done.begin(), done.end(), section) != done.end())
                    continue; // subscribed twice, shown once
                done.push_back(section);
                for (const View& each : section->views())
                    if (each.code == code) {
                        text += view(*section, each);
                        break;
                    }
            }
            text += "      },\n";
        }
        return text;
    }
    std::string parsers() const {
        std::string text;
        for (const C2K::LogCodeParser* parser : C2K::logCodeParsers()) {
            ViewText described(technology, "", parser->logCode(), leaves, fields);
            parser->describe(described);
            text += "      " + codeKey(parser->logCode()) + "{section=" + luaString(parser->name()) +
                    ",least=0," + described.text() + "}},\n";
        }
        return text;
    }
};

/// The unit that the leaf's texts show.
Unit textUnit(const CatalogueField& leaf) {
    if (leaf.sources.empty())
        return leaf.unit;
    return unitOfSuffix(leaf.sources.front().field->format.format.suffix).value_or(ShownUnit()).unit;
}

/// Fields by the names that lead to them, "*" for a row; with a "#" after it that of the row itself.
std::string pathsOf(std::string_view technology, const Catalogue& catalogue, DissectorFields& fields) {
    std::string text;
    for (const CatalogueField& leaf : catalogue.fields()) {
        for (const CatalogueNode* node = leaf.node; node->parent(); node = node->parent())
            if (node->isRow())
                text += "    [" + luaString(node->path() + "#") +
                        "]=" + std::to_string(fields.addRows(technology, "", *node->parent())) + ",\n";
        text += "    [" + luaString(leaf.path) + "]={" + std::to_string(fields.add(technology, leaf)) +
                (leaf.isReadFromText ? ",\"" + std::string(nameOf(textUnit(leaf))) + "\"" : "") + "},\n";
    }
    return text;
}

} // namespace

DissectorTables::DissectorTables(Resources& templates) {
    Resources* const earlier = setResources(&templates);
    for (const std::string_view constant : voxTechnologies) {
        const std::unique_ptr<LogGenerator> decoder = LogGenerator::generatorFromTechnology(constant, clock);
        if (!decoder)
            throw std::runtime_error("no decoder of " + std::string(constant));
        const std::string_view technology = shortTechnologyName(constant);
        const LeafIndex leaves(decoder->catalogue());
        const ViewWriter writer{technology, leaves, _fields};
        const auto* sections = dynamic_cast<const OstrelLogGenerator2*>(decoder.get());
        if (!sections && constant != kVoxLogChannelTechnology_Ostrel_CDMA) {
            _paths += pathsOf(technology, decoder->catalogue(), _fields);
            continue;
        }
        _views += "    " + std::string(technology) + "={\n" +
                  (sections ? writer.sections(sections->classIndex()) : writer.parsers()) + "    },\n";
    }
    setResources(earlier);
}

} // namespace velmora
