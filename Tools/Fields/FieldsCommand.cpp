// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/FieldsCommand.h"

#include "Platform/Linux/MachineClock.h"
#include "Platform/TelephonyService.h"
#include "Tools/ExitStatus.h"
#include "Tools/Fields/CSVFields.h"
#include "Tools/Fields/JSONFields.h"
#include "Tools/Fields/TextFields.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <memory>
#include <string>
#include <vector>

namespace velmora {

namespace {

std::unique_ptr<FieldsWriter> makeWriter(const FieldsOptions& options, Output& output) {
    switch (options.format) {
    case FieldsOptions::Format::Json: return std::make_unique<JSONFields>(output);
    case FieldsOptions::Format::Csv: return std::make_unique<CSVFields>(output, options.guard);
    case FieldsOptions::Format::Text: break;
    }
    return std::make_unique<TextFields>(output);
}

CatalogueRows selected(const Catalogue& catalogue, const RoleSelection& roles) {
    CatalogueRows rows;
    for (const CatalogueField& field : catalogue.fields())
        if (roles.contains(field.role))
            rows.emplace_back(field);
    return rows;
}

/// Whether the technology has a catalogue.
bool writeTechnology(const std::string& technology, const RoleSelection& roles, FieldsWriter& writer) {
    const MachineClock clock;
    const Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(technology, clock);
    if (!decoder) {
        report(decoder.reason());
        return false;
    }
    const Catalogue& catalogue = (*decoder)->catalogue();
    if (catalogue.fields().empty()) {
        report(catalogue.technology() + " has no fields, since its display template cannot be read");
        return false;
    }
    writer.write(catalogue.technology(), selected(catalogue, roles));
    return true;
}

} // namespace

int runFields(const FieldsOptions& options, Output& output) {
    std::vector<std::string> technologies;
    if (options.technology.empty())
        technologies.assign(voxTechnologies.begin(), voxTechnologies.end());
    else
        technologies.push_back(options.technology);
    const std::unique_ptr<FieldsWriter> writer = makeWriter(options, output);
    bool complete = true;
    writer->begin();
    for (const std::string& technology : technologies)
        complete = writeTechnology(technology, options.roles, *writer) && complete;
    writer->end();
    output.flush();
    return complete && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora
