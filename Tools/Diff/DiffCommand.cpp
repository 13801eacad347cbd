// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/DiffCommand.h"

#include "Recording/OpenMessages.h"
#include "Tools/Decode/Paths/FileTechnologies.h"
#include "Tools/Decode/Paths/KnownCatalogues.h"
#include "Tools/Decode/Paths/PathCheck.h"
#include "Tools/Diff/DiffWriter.h"
#include "Tools/ExitStatus.h"
#include "Tools/Output.h"
#include "Tools/Report.h"
#include "Tools/Stats/StatsOptions.h"

#include <memory>

namespace velmora {

namespace {

/// Standard input, which cannot be read twice, is taken for a recording.
bool isSnapshot(const DiffInput& input) {
    if (input.file == "-")
        return false;
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(input.file);
    return reader && (*reader)->form() == "snapshot";
}

DiffSide::What whatOf(const DiffOptions& options) {
    const bool areDisplays = options.comparesDisplays || options.a.time || options.b.time ||
                             isSnapshot(options.a) || isSnapshot(options.b);
    return areDisplays ? DiffSide::What::Displays : DiffSide::What::Statistics;
}

std::string textOf(const DiffSide& a, const DiffSide& b, DiffSide::What what, const DiffOptions& options) {
    const bool isJson = options.format == DiffOptions::Format::Json;
    if (what == DiffSide::What::Statistics)
        return isJson ? statisticsDiffJson(a, b) : statisticsDiffText(a, b);
    const auto differences = displayDifferences(a, b, leafChoice(options.selection, options.roles));
    return isJson ? displayDiffJson(a, b, differences) : displayDiffText(differences);
}

} // namespace

int runDiff(const DiffOptions& options, DecoderLines& lines, Output& output) {
    FileTechnologies technologies;
    {
        const KnownCatalogues known(options.selection, options.technology, {options.a.file, options.b.file},
                                    technologies);
        if (const auto problem = impossiblePath(options.selection, known.catalogues());
            problem && known.areAll()) {
            report("--select: " + *problem);
            return ExitStatus::Usage;
        }
    }
    const DiffSide::What what = whatOf(options);
    DiffSide a(options.a, options, what);
    DiffSide b(options.b, options, what);
    const bool isWhole = a.read(lines);
    const bool good = b.read(lines) && isWhole;
    // Everything would be added or gone where one of them could not be read.
    if (!good && (!a.hasMessages() || !b.hasMessages()))
        return ExitStatus::BadInput;
    output.put(textOf(a, b, what, options));
    output.flush();
    return good && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora
