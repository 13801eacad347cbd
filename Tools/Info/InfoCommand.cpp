// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoCommand.h"

#include "Platform/PrintableText.h"
#include "Recording/OpenMessages.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/ExitStatus.h"
#include "Tools/Info/InfoCollector.h"
#include "Tools/Info/InfoJSON.h"
#include "Tools/Info/InfoText.h"
#include "Tools/Output.h"
#include "Tools/Report.h"

#include <cstddef>
#include <memory>

namespace velmora {

namespace {

/// Returns whether all of the file was read and understood.
bool showFile(std::size_t index, const InfoOptions& options, Output& output) {
    const std::string& path = options.files[index];
    const std::string title = fileTitle(path);
    std::vector<std::string> technologies;
    if (!options.technology.empty())
        technologies = technologiesOf(path);
    const Result<std::unique_ptr<MessageReader>> opened = openMessages(path);
    if (!opened) {
        report(title + ": " + opened.reason());
        return false;
    }
    MessageReader& reader = **opened;
    InfoCollector collector(reader, technologies);
    if (const Result<Done> collected = collector.collect(options.technology); !collected) {
        report(title + ": " + collected.reason());
        return false;
    }
    if (options.format == InfoOptions::Format::Json) {
        output.put(infoJson(path, collector.info(), reader));
    } else {
        if (options.files.size() > 1)
            output.put((index > 0 ? "\n== " : "== ") + printable(title) + " ==\n");
        output.put(infoText(collector.info(), reader));
    }
    output.flush();

    for (const std::string& reason : collector.missingDecoders())
        report(title + ": " + reason);
    const bool allDecoded = collector.info().undecoded.report(title);
    const bool whole = reportLosses(reader, title);
    return whole && allDecoded && collector.missingDecoders().empty();
}

} // namespace

int runInfo(const InfoOptions& options, Output& output) {
    bool good = true;
    for (std::size_t index = 0; index < options.files.size() && output.isOpen(); ++index)
        good = showFile(index, options, output) && good;
    return good && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

} // namespace velmora
