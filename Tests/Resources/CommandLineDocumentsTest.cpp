// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Role.h"
#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Resources/DissectorSections.h"
#include "Tests/Resources/HelpText.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/ShippedResources.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <set>
#include <string>

/// Man pages and shell completion against what the programs' `--help` says.

namespace velmora {
namespace {

using testing::IsEmpty;
using testing::Not;
using Words = std::set<std::string>;

const char* const programs[] = {"velmora", "velmora-telephonyd", "velmora-log"};

/// What all commands of velmora-log take, but `--version`.
const Words commonOptions = {"--help", "--log", "--log-level", "--verbose"};

Words wordsOf(const std::string& text, const std::string& expression) {
    const std::vector<std::string> found = allMatches(text, expression);
    return {found.begin(), found.end()};
}

std::string manualOf(const std::string& program) {
    const Data page = shippedResource("man/" + program + ".1");
    return {page.bytes().begin(), page.bytes().end()};
}

/// The part of a manual from the line with this beginning to the next heading of that kind.
std::string section(const std::string& manual, const std::string& heading) {
    const std::size_t begin = manual.find("\n" + heading);
    if (begin == std::string::npos)
        return {};
    const std::size_t from = manual.find('\n', begin + 1);
    const std::size_t end = std::min(manual.find("\n.Sh ", from), manual.find("\n.Ss ", from));
    return manual.substr(from, end - from) + "\n";
}

/// The options that a part of a manual explains, including several in one item.
Words explainedOptions(const std::string& text) {
    Words options;
    for (const std::string& item : allMatches(text, "^(\\.It .*Fl Fl .*)$"))
        for (const std::string& name : allMatches(item, "Fl Fl ([a-z-]+)"))
            options.insert("--" + name);
    return options;
}

/// What bash offers at the end of a command line.
Words offered(const std::string& line) {
    const ShellOutcome outcome =
        runShell(shellQuoted(VELMORA_SOURCE_DIR "/Tests/Resources/complete.bash") + " " + shellQuoted(line));
    EXPECT_EQ(outcome.status, 0) << line;
    return wordsOf(outcome.output, "^(.*)$");
}

/// The long ones of the options that bash offers.
Words offeredOptions(const std::string& line) {
    Words options;
    for (const std::string& word : offered(line + " -"))
        if (word.starts_with("--"))
            options.insert(word);
    return options;
}

Words technologies() {
    Words names = {std::string(shortTechnologyName(kVoxLogChannelTechnology_IFX))};
    for (const std::string& name : recordTechnologies())
        names.insert(name);
    return names;
}

Words scenarios() {
    Words names;
    for (const ScenarioKind& kind : scenarioKinds())
        names.insert(std::string(kind.name));
    return names;
}

Words withBefore(const std::string& prefix, const Words& words) {
    Words longer;
    for (const std::string& word : words)
        longer.insert(prefix + word);
    return longer;
}

TEST(Manuals, haveNothingThatMandocDislikes) {
    NEEDS_PROGRAM("mandoc");
    const ShellOutcome outcome =
        runShell("cd " + shellQuoted(VELMORA_SOURCE_DIR "/Resources/man") + " && mandoc -T lint *.1");
    EXPECT_EQ(outcome.output, "");
    EXPECT_EQ(outcome.status, 0);
}

TEST(Manuals, explainTheOptionsOfEachProgram) {
    for (const std::string program : programs) {
        const HelpText help = helpOf(program);
        EXPECT_THAT(help.options, Not(IsEmpty()));
        EXPECT_EQ(explainedOptions(section(manualOf(program), ".Sh DESCRIPTION")), help.options) << program;
    }
}

TEST(Manuals, haveTheDefaultLogLevelOfThePrograms) {
    for (const std::string program : programs) {
        const ShellOutcome help = runShell(shellQuoted(VELMORA_BUILD_DIR "/" + program) + " --help");
        EXPECT_THAT(allMatches(help.output, "--log-level .*(?:=|is )([0-7])$"), testing::ElementsAre("3"))
            << program;
        EXPECT_THAT(manualOf(program), testing::HasSubstr("from 0 to 7; the default is 3.\n"));
    }
}

TEST(Manuals, explainTheCommandsAndTheirOptions) {
    const std::string manual = manualOf("velmora-log");
    const Words commands = helpOf("velmora-log").commands;
    EXPECT_THAT(commands, Not(IsEmpty()));
    EXPECT_EQ(wordsOf(manual, "^\\.Ss ([a-z]+)"), commands);
    for (const std::string& command : commands) {
        Words own = helpOf("velmora-log", command).options;
        own.erase("--help");
        EXPECT_EQ(explainedOptions(section(manual, ".Ss " + command)), own) << command;
    }
}

TEST(Manuals, listTheValuesOfOptions) {
    const std::string manual = manualOf("velmora-log");
    for (const std::string& command : helpOf("velmora-log").commands)
        for (const auto& [option, values] : helpOf("velmora-log", command).values) {
            const std::string text = section(manual, ".Ss " + command);
            const auto items = allMatches(text, "^\\.It Fl Fl " + option.substr(2) + " Cm (.*)$");
            ASSERT_EQ(items.size(), 1U) << command << " " << option;
            EXPECT_EQ(wordsOf(items[0], "([a-z]+)"), values) << command << " " << option;
        }
}

TEST(Manuals, explainTheSources) {
    const std::string sources = section(manualOf("velmora-telephonyd"), ".Sh SOURCES");
    const HelpText help = helpOf("velmora-telephonyd");
    EXPECT_THAT(help.sources, Not(IsEmpty()));
    Words explained = wordsOf(sources, "^\\.It Cm ([a-z0-9]+)");
    for (const auto& [kind, options] : help.sources) {
        EXPECT_EQ(explained.erase(kind), 1U) << kind;
        const auto items = allMatches(sources, "^(\\.It Cm " + kind + " .*)$");
        ASSERT_EQ(items.size(), 1U) << kind;
        EXPECT_EQ(wordsOf(items[0], " , Ns Cm ([a-z]+=?)"), options) << kind;
    }
    EXPECT_EQ(explained, scenarios());
}

class Completion : public testing::Test {
protected:
    void SetUp() override {
        if (!std::filesystem::exists("/usr/share/bash-completion/bash_completion"))
            GTEST_SKIP() << "bash-completion is not installed";
    }
};

TEST_F(Completion, offersTheOptionsOfEachProgram) {
    for (const std::string program : programs)
        EXPECT_EQ(offeredOptions(program), helpOf(program).options) << program;
}

TEST_F(Completion, offersTheCommandsAndTheirOptions) {
    const Words commands = helpOf("velmora-log").commands;
    EXPECT_EQ(offered("velmora-log "), commands);
    EXPECT_EQ(offered("velmora-log --log stderr "), commands);
    for (const std::string& command : commands) {
        Words options = helpOf("velmora-log", command).options;
        options.insert(commonOptions.begin(), commonOptions.end());
        EXPECT_EQ(offeredOptions("velmora-log " + command), options) << command;
    }
}

TEST_F(Completion, offersTheValuesOfOptions) {
    for (const std::string& command : helpOf("velmora-log").commands) {
        const HelpText help = helpOf("velmora-log", command);
        for (const auto& [option, values] : help.values)
            EXPECT_EQ(offered("velmora-log " + command + " " + option + " "), values) << command << option;
        if (help.options.contains("--technology")) {
            Words names = technologies();
            names.insert({"GSM", "CDMA", "LTE", "UTRAN"});
            EXPECT_EQ(offered("velmora-log " + command + " --technology "), names) << command;
        }
    }
    for (const std::string program : programs) {
        EXPECT_EQ(offered(program + " --log "), (Words{"syslog", "stderr"}));
        EXPECT_EQ(offered(program + " --log-level="), (Words{"0", "1", "2", "3", "4", "5", "6", "7"}));
    }
}

TEST_F(Completion, offersRoles) {
    Words roles = {"serving", "neighbour"};
    for (const RoleName& row : roleNames())
        roles.insert(std::string(row.name));
    EXPECT_EQ(offered("velmora-log fields --role "), roles);
    EXPECT_EQ(offered("velmora-log fields --role=radio"), Words{"radio.state"});
}

TEST_F(Completion, offersSources) {
    const std::string line = "velmora-telephonyd --source ";
    const HelpText help = helpOf("velmora-telephonyd");
    Words kinds;
    for (const auto& [kind, options] : help.sources)
        kinds.insert(kind == "modemmanager" ? kind : kind + ":");
    EXPECT_EQ(offered(line), kinds);
    // From the last colon on, which bash takes for the beginning of a word.
    EXPECT_EQ(offered(line + "scenario:"), scenarios());
    EXPECT_EQ(offered("velmora-telephonyd --source=scenario:l"), Words{"lte"});
    for (const auto& [kind, options] : help.sources) {
        // What follows a colon is a word of its own.
        const std::string before = kind == "modemmanager" ? kind + "," : "x,";
        EXPECT_EQ(offered(line + (kind == "modemmanager" ? "" : kind + ":") + before),
                  withBefore(before, options))
            << kind;
    }
    EXPECT_EQ(offered(line + "replay:x,technology="), technologies());
}

TEST_F(Completion, offersThePathsThatTheProgramLists) {
    // In place of velmora-log, one that lists two technologies' fields.
    const TemporaryDirectory directory;
    const std::filesystem::path program = directory / "velmora-log";
    std::ofstream(program) << "#!/bin/sh\n"
                              "[ \"$1\" = fields ] && [ \"$*\" != \"${*%--format csv}\" ] || exit 1\n"
                              "echo technology,path,section,kind\n"
                              "[ \"$3\" = Ostrel_LTE ] || echo 'IFX,/Serving Cell/ARFCN,,number'\n"
                              "echo 'Ostrel_LTE,/Serving Cell/Info/*/Cell ID,Info,number'\n";
    std::filesystem::permissions(program, std::filesystem::perms::owner_all);
    const std::string path = ::getenv("PATH");
    ::setenv("PATH", ((directory / "").string() + ":" + path).c_str(), 1);
    const Words both = {"/Serving Cell/ARFCN", "/Serving Cell/Info/*/Cell ID"};
    const Words lte = {"/Serving Cell/Info/*/Cell ID"};
    EXPECT_EQ(offered("velmora-log decode --select "), both);
    EXPECT_EQ(offered("velmora-log decode --select /Serv"), both);
    EXPECT_EQ(offered("velmora-log decode --select '/Serv"), both);
    EXPECT_EQ(offered("velmora-log decode --select=/Serv"), both);
    EXPECT_EQ(offered("velmora-log decode --select name=/Serv"), both); // the name is a word of its own
    EXPECT_EQ(offered("velmora-log decode --technology Ostrel_LTE --select /Serv"), lte);
    EXPECT_EQ(offered("velmora-log decode --select /Other"), Words{});
    std::ofstream(program) << "#!/bin/sh\necho trouble >&2\nexit 2\n";
    EXPECT_EQ(offered("velmora-log decode --select /Serv"), Words{});
    ::setenv("PATH", path.c_str(), 1);
}

TEST_F(Completion, offersAllFormsThatConvertWrites) {
    const TemporaryDirectory directory;
    for (const char* name : {"new.dlf", "new.geojson", "new.gpx", "new.kml", "new.sqlite", "new.txt"})
        std::ofstream(directory / name) << name;
    const std::string start = directory / "new.";
    EXPECT_EQ(offered("velmora-log convert a.dlf " + start),
              (Words{start + "dlf", start + "geojson", start + "gpx", start + "kml", start + "sqlite"}));
    EXPECT_EQ(offered("velmora-log convert " + start), Words{start + "dlf"}) << "these can be read";
}

TEST_F(Completion, offersFiles) {
    const std::string folder = VELMORA_SOURCE_DIR "/Tests/Recordings/";
    const Words gsm = {folder + "gsm.pcapng"};
    EXPECT_EQ(offered("velmora-log info " + folder + "g"), gsm);
    EXPECT_EQ(offered("velmora-log decode - " + folder + "g"), gsm);
    EXPECT_EQ(offered("velmora-log --log-level 4 convert a.dlf " + folder + "g"), gsm);
    EXPECT_EQ(offered("velmora-log info a.dlf " + folder + "g"), gsm);
    EXPECT_EQ(offered("velmora-log record a.pcapng " + folder + "g"), Words{}) << "it takes one file";
    EXPECT_EQ(offered("velmora-log watch " + folder + "g"), Words{}) << "it takes none";
    EXPECT_EQ(offered("velmora-log fields " + folder + "g"), Words{}) << "it takes none";
    EXPECT_EQ(offered("velmora-log decode --select " + folder + "g"), Words{}) << "no file belongs there";
    EXPECT_EQ(offered("velmora-telephonyd --source replay:" + folder + "gsm.p"), gsm);
    EXPECT_EQ(offered("velmora --sysroot " VELMORA_SOURCE_DIR "/Tests/Recordin"),
              (Words{VELMORA_SOURCE_DIR "/Tests/Recording", VELMORA_SOURCE_DIR "/Tests/Recordings"}));
}

} // namespace
} // namespace velmora
