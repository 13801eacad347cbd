// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ParsedCommandLine.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

const std::string technologies =
    "IFX, GSM (Ostrel_GSM), CDMA (Ostrel_CDMA), LTE (Ostrel_LTE), UTRAN (Ostrel_UTRAN2), Modem";

TEST(CommandLineErrorsTest, UsageErrorsGiveTheFoundAndTheExpectedValue) {
    struct Case {
        std::vector<const char*> arguments;
        std::string message;
    };
    const Case cases[] = {
        {{},
         "no command, wanted decode, browse, watch, record, convert, info, fields, events, rules, stats, "
         "diff, report, mask or columns"},
        {{"bogus"},
         "got bogus, wanted one of the commands decode, browse, watch, record, convert, info, fields, "
         "events, "
         "rules, stats, diff, report, mask and columns"},
        {{"decode"}, "FILE is required"},
        {{"mask"}, "FILE is required"},
        {{"mask", "a.pcapng"}, "OUT is required"},
        {{"mask", "a.pcapng", "b.txt"},
         "OUT: got b.txt, wanted a name that ends in .pcapng, .velmora or .dlf"},
        {{"mask", "--level", "none", "a.pcapng", "b.pcapng"},
         "--level: got none, wanted identity or location or all"},
        {{"mask", "--check", "a.pcapng", "b.pcapng"}, "--check excludes OUT"},
        {{"mask", "--new-key", "k", "a.pcapng"}, "--new-key excludes FILE"},
        {{"mask", "--known", "k", "a.pcapng", "b.pcapng"}, "--known requires --check"},
        {{"decode", "--format", "xml", "a"}, "--format: got xml, wanted text or json or jsonl or csv"},
        {{"decode", "--every", "day", "a"}, "--every: got day, wanted refresh or message"},
        {{"decode", "--select", "GSM", "a"}, "--select: got GSM, wanted a path that begins with a slash"},
        {{"decode", "--jobs", "0", "a"}, "--jobs: got 0, wanted a number from 1 to 1000"},
        {{"decode", "--jobs", "-1", "a"}, "--jobs: got -1, wanted a number from 1 to 1000"},
        {{"decode", "--jobs", "1001", "a"}, "--jobs: got 1001, wanted a number from 1 to 1000"},
        {{"decode", "--jobs", "+3", "a"}, "--jobs: got +3, wanted a number from 1 to 1000"},
        {{"decode", "--jobs", "010", "a"}, "--jobs: got 010, wanted a number from 1 to 1000"},
        {{"decode", "--jobs", "0x10", "a"}, "--jobs: got 0x10, wanted a number from 1 to 1000"},
        {{"decode", "--from", "noon", "a"},
         "--from: got noon, wanted a time such as 2026-11-16T05:00:00Z, seconds since 1970, or +SECONDS "
         "after the first message"},
        {{"decode", "--to", "-1", "a"},
         "--to: got -1, wanted a time such as 2026-11-16T05:00:00Z, seconds since 1970, or +SECONDS after "
         "the first message"},
        {{"decode", "--warm", "a"}, "--warm: got no --from, wanted the time from which on to write"},
        {{"decode", "--code", "512C", "a"}, "--code: got 512C, wanted a log code such as 0x512C or 0xFF0000"},
        {{"convert", "--from", "noon", "a", "b.dlf"},
         "--from: got noon, wanted a time such as 2026-11-16T05:00:00Z, seconds since 1970, or +SECONDS "
         "after the first message"},
        {{"decode", "--format", "csv", "a"}, "--format csv: got no --select, wanted one for each column"},
        {{"decode", "--every", "message", "a"},
         "--every message: got another format, wanted --format jsonl or csv"},
        {{"decode", "--every", "message", "--format", "json", "a"},
         "--every message: got another format, wanted --format jsonl or csv"},
        {{"decode", "--select", "=/GSM", "a"}, "--select: got =/GSM, wanted a path that begins with a slash"},
        {{"decode", "--samples", "a"}, "--samples: got another format, wanted --format jsonl or csv"},
        {{"decode", "--samples", "--format", "csv", "--every", "message", "a"},
         "--samples: got --every message too, wanted one of the two"},
        {{"decode", "--wide", "--format", "csv", "--select", "/A", "a"}, "--wide requires --samples"},
        {{"decode", "--samples", "--wide", "--format", "csv", "a"},
         "--wide: got no --select, wanted one for each column"},
        {{"decode", "--samples", "--wide", "--format", "jsonl", "--select", "/A", "a"},
         "--wide: got another format, wanted --format csv"},
        {{"decode", "--safe", "a"}, "--safe: got another format, wanted --format csv"},
        {{"decode", "--samples", "--safe", "--format", "jsonl", "a"},
         "--safe: got another format, wanted --format csv"},
        {{"fields", "--safe", "--format", "json"}, "--safe: got another format, wanted --format csv"},
        {{"decode", "--max-age", "0", "--format", "jsonl", "a"},
         "--max-age: got 0, wanted seconds from 0.001 to 2000000"},
        {{"decode", "--max-age", "5", "a"},
         "--max-age: got another output, wanted --every refresh with --format jsonl or csv"},
        {{"decode", "--max-age", "5", "--format", "jsonl", "--every", "message", "a"},
         "--max-age: got another output, wanted --every refresh with --format jsonl or csv"},
        {{"decode", "--max-age", "5", "--format", "jsonl", "--samples", "a"},
         "--max-age: got another output, wanted --every refresh with --format jsonl or csv"},
        {{"decode", "--bogus", "a"}, "The following argument was not expected: --bogus"},
        {{"record", "a", "--count", "0"}, "--count: got 0, wanted a number from 1 to 1000000000000"},
        {{"record", "a", "--count", "-1"}, "--count: got -1, wanted a number from 1 to 1000000000000"},
        {{"record", "a", "--count", "99999999999999999999999"},
         "--count: got 99999999999999999999999, wanted a number from 1 to 1000000000000"},
        {{"record", "a", "--count", "1e3"}, "--count: got 1e3, wanted a number from 1 to 1000000000000"},
        {{"record", "a", "--duration", "0"}, "--duration: got 0, wanted seconds from 0.001 to 2000000"},
        {{"record", "a", "--duration", "1e99"}, "--duration: got 1e99, wanted seconds from 0.001 to 2000000"},
        {{"record", "a", "--timeout", "0"}, "--timeout: got 0, wanted seconds from 0.001 to 2000000"},
        {{"watch", "--once", "--timeout", "x"}, "--timeout: got x, wanted seconds from 0.001 to 2000000"},
        {{"watch", "--timeout", "1"}, "--timeout requires --once"},
        {{"convert", "a"}, "OUT is required"},
        {{"convert", "a", "-"},
         "OUT: got -, wanted a name that ends in .pcapng, .velmora, .dlf, .gpx, .geojson, .kml or .sqlite"},
        {{"decode", "--technology", "5G", "a"}, "--technology: got 5G, wanted one of " + technologies},
        {{"convert", "--technology", "Ostrel_XYZ", "a", "b.dlf"},
         "--technology: got Ostrel_XYZ, wanted one of " + technologies},
        {{"info", "--technology", "", "a"}, "--technology: got , wanted one of " + technologies},
        {{"info"}, "FILE is required"},
        {{"info", "--format", "jsonl", "a"}, "--format: got jsonl, wanted text or json"},
        {{"fields", "a"}, "The following argument was not expected: a"},
        {{"fields", "--format", "jsonl"}, "--format: got jsonl, wanted text or json or csv"},
        {{"fields", "--technology", "5G"}, "--technology: got 5G, wanted one of " + technologies},
        {{"fields", "--role", "level"},
         "--role: got level, wanted one of serving.mcc, serving.mnc, serving.area, serving.cell, "
         "serving.channel, serving.physical-cell, serving.level, serving.quality, neighbour.channel, "
         "neighbour.physical-cell, neighbour.level, neighbour.quality, registration.state, radio.state, "
         "block-error-rate, data-rate, or the part before a dot"},
        {{"watch", "--log-level", "8"}, "--log-level: got 8, wanted a number from 0 to 7"},
        {{"--log", "file", "watch"}, "--log: got file, wanted syslog or stderr"},
    };
    for (const Case& row : cases) {
        const CommandLine line = parse(row.arguments);
        const auto* words = std::get_if<CommandLine::Notice>(&line.command);
        ASSERT_NE(words, nullptr) << row.message;
        EXPECT_EQ(words->status, 2);
        EXPECT_EQ(words->text,
                  std::string("velmora-log: ") + row.message + "\nvelmora-log --help tells more\n");
    }
}

class CommandLineProgramTest : public ToolTest {};

TEST_F(CommandLineProgramTest, EveryHelpTextShowsAnExampleOnStandardOutput) {
    const std::vector<std::pair<std::vector<std::string>, std::string>> cases = {
        {{"--help"}, "\n  velmora-log watch\n"},
        {{"decode", "--help"}, "\n  velmora-log decode drive.pcapng\n"},
        {{"watch", "--help"}, "\n  velmora-log watch\n"},
        {{"record", "--help"}, "\n  velmora-log record drive.pcapng\n"},
        {{"convert", "--help"}, "\n  velmora-log record - | velmora-log convert - drive.dlf\n"},
        {{"info", "--help"}, "\n  velmora-log info drive.pcapng\n"},
        {{"fields", "--help"}, "\n  velmora-log fields --role serving\n"},
    };
    for (const auto& [arguments, example] : cases) {
        ToolProcess process(tool(arguments));
        EXPECT_EQ(process.exitStatus(), 0);
        EXPECT_THAT(process.output(), HasSubstr(example));
        EXPECT_EQ(process.errors(), "");
    }
}

TEST_F(CommandLineProgramTest, VersionIsALineOfStandardOutput) {
    ToolProcess process(tool({"--version"}));
    EXPECT_EQ(process.exitStatus(), 0);
    EXPECT_THAT(process.output(), testing::MatchesRegex("velmora-log [0-9]+\\.[0-9]+\\.[0-9]+\n"));
}

TEST_F(CommandLineProgramTest, UsageErrorEndsWithTwo) {
    ToolProcess process(tool({"decode"}));
    EXPECT_EQ(process.exitStatus(), 2);
    EXPECT_EQ(process.output(), "");
    EXPECT_EQ(process.errors(), "velmora-log: FILE is required\nvelmora-log --help tells more\n");
}

TEST_F(CommandLineProgramTest, HelpToAFullDiskIsReported) {
    ToolProcess::Setup setup = tool({"--help"});
    setup.outputFile = "/dev/full";
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 1);
    EXPECT_EQ(process.errors(), "velmora-log: cannot write standard output: No space left on device\n");
}

} // namespace
} // namespace velmora
