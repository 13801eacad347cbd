// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/VelmoraLog.h"

#include "Platform/Console.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/StandardDescriptors.h"
#include "Tools/Browse/BrowseCommand.h"
#include "Tools/Columns/ColumnsCommand.h"
#include "Tools/CommandLine.h"
#include "Tools/Convert/ConvertCommand.h"
#include "Tools/Decode/DecodeCommand.h"
#include "Tools/Diff/DiffCommand.h"
#include "Tools/Events/EventsCommand.h"
#include "Tools/ExitStatus.h"
#include "Tools/Fields/FieldsCommand.h"
#include "Tools/Info/InfoCommand.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/Log/QuietConsole.h"
#include "Tools/Mask/MaskCommand.h"
#include "Tools/Output.h"
#include "Tools/Record/RecordCommand.h"
#include "Tools/Report.h"
#include "Tools/Report/ReportCommand.h"
#include "Tools/Rules/RulesCommand.h"
#include "Tools/Stats/StatsCommand.h"
#include "Tools/Watch/WatchCommand.h"

#include <csignal>
#include <cstdio>
#include <optional>

#include <unistd.h>

namespace velmora {

namespace {

int say(const CommandLine::Notice& words, Output& output) {
    if (words.status == ExitStatus::Usage) {
        std::fputs(words.text.c_str(), stderr);
        return words.status;
    }
    output.put(words.text);
    output.flush();
    return output.state() == Output::State::Failed ? ExitStatus::BadInput : words.status;
}

int run(const CommandLine& line, DecoderLines& lines, Output& output) {
    if (const auto* decode = std::get_if<DecodeOptions>(&line.command))
        return runDecode(*decode, lines, output);
    if (const auto* watch = std::get_if<WatchOptions>(&line.command))
        return runWatch(*watch, lines, output);
    if (const auto* record = std::get_if<RecordOptions>(&line.command))
        return runRecord(*record, lines);
    if (const auto* events = std::get_if<EventsOptions>(&line.command))
        return runEvents(*events, lines, output);
    if (const auto* stats = std::get_if<StatsOptions>(&line.command))
        return runStats(*stats, lines, output);
    if (const auto* diff = std::get_if<DiffOptions>(&line.command))
        return runDiff(*diff, lines, output);
    if (const auto* page = std::get_if<ReportOptions>(&line.command))
        return runReport(*page, lines);
    if (const auto* browse = std::get_if<BrowseOptions>(&line.command))
        return runBrowse(*browse, output);
    const DecoderLog log(lines);
    if (const auto* info = std::get_if<InfoOptions>(&line.command))
        return runInfo(*info, output);
    if (const auto* fields = std::get_if<FieldsOptions>(&line.command))
        return runFields(*fields, output);
    if (const auto* rules = std::get_if<RulesOptions>(&line.command))
        return runRules(*rules, output);
    if (const auto* mask = std::get_if<MaskCommandOptions>(&line.command))
        return runMask(*mask, output);
    if (const auto* columns = std::get_if<ColumnsOptions>(&line.command))
        return runColumns(*columns, lines, output);
    return runConvert(std::get<ConvertOptions>(line.command));
}

} // namespace

int runVelmoraLog(int count, const char* const* arguments) {
    openClosedStandardDescriptors();
    // Standard output carries the result alone.
    redirectConsole(stderr);
    std::signal(SIGPIPE, SIG_IGN); // the write that meets a closed pipe reports it
    std::signal(SIGXFSZ, SIG_IGN); // and so does one that meets a limit on the file's size
    WorkContext::installTerminateHandler();

    const CommandLine line = parseCommandLine(count, arguments);
    Output output(STDOUT_FILENO);
    if (const auto* words = std::get_if<CommandLine::Notice>(&line.command))
        return say(*words, output);

    const ProgramLog log(line.log, line.logLevel, "velmora-log");
    FileResources files;
    setResources(&files);
    DecoderLines lines(line.verbose);
    const std::optional<QuietConsole> console =
        line.verbose ? std::nullopt : std::make_optional<QuietConsole>();
    const WorkContext context({}, [&lines] { lines.report(); });
    const int status = run(line, lines, output);
    lines.report();
    setResources(nullptr);
    return status;
}

} // namespace velmora
