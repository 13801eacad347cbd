// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/ProgramLog.h"
#include "Platform/SystemLog.h"
#include "Tools/Browse/BrowseOptions.h"
#include "Tools/Columns/ColumnsOptions.h"
#include "Tools/Convert/ConvertOptions.h"
#include "Tools/Decode/DecodeOptions.h"
#include "Tools/Diff/DiffOptions.h"
#include "Tools/Events/EventsOptions.h"
#include "Tools/Fields/FieldsOptions.h"
#include "Tools/Info/InfoOptions.h"
#include "Tools/Mask/MaskCommandOptions.h"
#include "Tools/Record/RecordOptions.h"
#include "Tools/Report/ReportOptions.h"
#include "Tools/Rules/RulesOptions.h"
#include "Tools/Stats/StatsOptions.h"
#include "Tools/Watch/WatchOptions.h"

#include <string>
#include <variant>

namespace velmora {

/// The parsed command line.
struct CommandLine {
    /// The program prints a text and ends: help, its version, a usage error.
    struct Notice {
        int status; ///< exit status; a usage error goes to standard error, the others to standard output
        std::string text; ///< complete lines
    };

    LogKind log = LogKind::Stderr;
    int logLevel = LogPriority::Error;
    bool verbose =
        false; ///< decoder lines as they arise, not summed up; those of objects made and destroyed too
    std::variant<Notice, DecodeOptions, WatchOptions, RecordOptions, ConvertOptions, InfoOptions,
                 FieldsOptions, EventsOptions, RulesOptions, StatsOptions, DiffOptions, MaskCommandOptions,
                 ColumnsOptions, ReportOptions, BrowseOptions>
        command;
};

/// Parses the arguments, the program's name first. Never ends the program.
[[nodiscard]] CommandLine parseCommandLine(int count, const char* const* arguments);

} // namespace velmora
