// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ParsedCommandLine.h"

#include <gmock/gmock.h>

#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

TEST(CommandLineTest, DecodeTakesFilesFormatAndTechnology) {
    const CommandLine line = parse({"decode", "a", "-", "--format", "json", "--technology", "IFX", "b"});
    const auto* decode = std::get_if<DecodeOptions>(&line.command);
    ASSERT_NE(decode, nullptr);
    EXPECT_THAT(decode->files, ElementsAre("a", "-", "b"));
    EXPECT_EQ(decode->format, DecodeOptions::Format::Json);
    EXPECT_EQ(decode->technology, "IFX");
    EXPECT_FALSE(decode->isStrict);
    const CommandLine strictLine = parse({"decode", "--strict", "a"});
    const auto* strict = std::get_if<DecodeOptions>(&strictLine.command);
    ASSERT_NE(strict, nullptr);
    EXPECT_TRUE(strict->isStrict);
}

TEST(CommandLineTest, DecodeTakesWhatLinesAndPartsAreWanted) {
    const CommandLine line = parse({"decode",  "--select", "/A/B",     "--format",    "csv",
                                    "--every", "message",  "a",        "--select=/C", "--jobs",
                                    "3",       "--from",   "+1.5",     "--to",        "1970-01-01T00:01:00Z",
                                    "--code",  "0x512C",   "--code=5", "--warm",      "b"});
    const auto* decode = std::get_if<DecodeOptions>(&line.command);
    ASSERT_NE(decode, nullptr);
    EXPECT_THAT(decode->files, ElementsAre("a", "b"));
    EXPECT_THAT(decode->selection.paths(), ElementsAre("/A/B", "/C"));
    EXPECT_EQ(decode->format, DecodeOptions::Format::Csv);
    EXPECT_EQ(decode->every, DecodeOptions::Every::Message);
    EXPECT_EQ(decode->jobs, 3U);
    EXPECT_EQ(decode->messages.range.from, (TimeBound{std::chrono::milliseconds(1500), true}));
    EXPECT_EQ(decode->messages.range.to, (TimeBound{std::chrono::minutes(1), false}));
    EXPECT_THAT(decode->messages.codes, ElementsAre(0x512C, 5));
    EXPECT_TRUE(decode->messages.isWarm);
    const CommandLine lines = parse({"decode", "--format", "jsonl", "a"});
    const auto* plain = std::get_if<DecodeOptions>(&lines.command);
    ASSERT_NE(plain, nullptr);
    EXPECT_EQ(plain->format, DecodeOptions::Format::JsonLines);
    EXPECT_EQ(plain->every, DecodeOptions::Every::Refresh);
    EXPECT_THAT(plain->selection.paths(), testing::IsEmpty());
    EXPECT_FALSE(plain->jobs);
    EXPECT_FALSE(plain->messages.range.from || plain->messages.range.to);
    EXPECT_THAT(plain->messages.codes, testing::IsEmpty());
    EXPECT_FALSE(plain->messages.isWarm);
}

TEST(CommandLineTest, DecodeTakesWhichSamplesAreWanted) {
    struct Case {
        std::vector<const char*> arguments;
        DecodeOptions::Samples samples;
    };
    const Case cases[] = {
        {{"decode", "--format", "jsonl", "a"}, DecodeOptions::Samples::None},
        {{"decode", "--format", "jsonl", "--samples", "a"}, DecodeOptions::Samples::Long},
        {{"decode", "--format", "csv", "--samples", "a"}, DecodeOptions::Samples::Long},
        {{"decode", "--format", "csv", "--samples", "--wide", "--select", "/A", "a"},
         DecodeOptions::Samples::Wide},
        {{"decode", "--wide", "--format", "csv", "--samples", "--select", "/A", "a"},
         DecodeOptions::Samples::Wide},
    };
    for (const Case& row : cases) {
        const CommandLine line = parse(row.arguments);
        const auto* decode = std::get_if<DecodeOptions>(&line.command);
        ASSERT_NE(decode, nullptr);
        EXPECT_EQ(decode->samples, row.samples);
        EXPECT_EQ(decode->maximumAge, std::nullopt);
    }
}

TEST(CommandLineTest, DecodeTakesNamesOfPathsAndAnAge) {
    const CommandLine line = parse({"decode", "--format", "jsonl", "--every", "message", "--select",
                                    "level=/A/*/B", "--select", "/C=/D", "a"});
    const auto* decode = std::get_if<DecodeOptions>(&line.command);
    ASSERT_NE(decode, nullptr);
    EXPECT_THAT(decode->selection.paths(), ElementsAre("/A/*/B", "/C=/D"));
    EXPECT_THAT(decode->selection.names(), ElementsAre("level", "/C=/D"));
    const CommandLine agedLine =
        parse({"decode", "--format", "csv", "--select", "/A", "--max-age", "2.5", "a"});
    const auto* aged = std::get_if<DecodeOptions>(&agedLine.command);
    ASSERT_NE(aged, nullptr);
    EXPECT_EQ(aged->maximumAge, std::chrono::milliseconds(2500));
}

TEST(CommandLineTest, WithoutOptionsLogLinesOfErrorsGoToStandardError) {
    const CommandLine line = parse({"decode", "a"});
    const auto* decode = std::get_if<DecodeOptions>(&line.command);
    ASSERT_NE(decode, nullptr);
    EXPECT_EQ(decode->format, DecodeOptions::Format::Text);
    EXPECT_EQ(decode->technology, "");
    EXPECT_EQ(line.log, LogKind::Stderr);
    EXPECT_EQ(line.logLevel, 3);
}

TEST(CommandLineTest, LogOptionsMayPrecedeOrFollowTheCommand) {
    for (const auto& arguments :
         {std::vector<const char*>{"--log", "syslog", "--log-level", "6", "watch", "--once"},
          std::vector<const char*>{"watch", "--log", "syslog", "--once", "--log-level=6"}}) {
        const CommandLine line = parse(arguments);
        EXPECT_EQ(line.log, LogKind::Syslog);
        EXPECT_EQ(line.logLevel, 6);
        const auto* watch = std::get_if<WatchOptions>(&line.command);
        ASSERT_NE(watch, nullptr);
        EXPECT_TRUE(watch->once);
    }
}

TEST(CommandLineTest, VerboseMayPrecedeOrFollowTheCommand) {
    for (const auto& arguments :
         {std::vector<const char*>{"-v", "info", "a"}, std::vector<const char*>{"info", "--verbose", "a"}})
        EXPECT_TRUE(parse(arguments).verbose);
    EXPECT_FALSE(parse({"info", "a"}).verbose);
}

TEST(CommandLineTest, RecordTakesItsLimits) {
    const CommandLine line =
        parse({"record", "--duration", "1.5", "--count", "20", "--force", "drive.pcapng"});
    const auto* record = std::get_if<RecordOptions>(&line.command);
    ASSERT_NE(record, nullptr);
    EXPECT_EQ(record->file, "drive.pcapng");
    EXPECT_TRUE(record->force);
    EXPECT_EQ(record->duration_seconds, 1.5);
    EXPECT_EQ(record->count, 20U);
    EXPECT_EQ(record->timeout_seconds, std::nullopt);
}

TEST(CommandLineTest, ConvertTakesWhatTheNewFileIsToBe) {
    const CommandLine line =
        parse({"convert", "-", "a.velmora", "--force", "--technology", "IFX", "--description", "gate 4",
               "--strict", "--from", "+1.5", "--to", "1970-01-01T00:01:00Z", "--code", "0xFF0000"});
    const auto* convert = std::get_if<ConvertOptions>(&line.command);
    ASSERT_NE(convert, nullptr);
    EXPECT_EQ(convert->file, "-");
    EXPECT_EQ(convert->out, "a.velmora");
    EXPECT_TRUE(convert->force);
    EXPECT_TRUE(convert->isStrict);
    EXPECT_EQ(convert->messages.range.from, (TimeBound{std::chrono::milliseconds(1500), true}));
    EXPECT_EQ(convert->messages.range.to, (TimeBound{std::chrono::minutes(1), false}));
    EXPECT_THAT(convert->messages.codes, ElementsAre(0xFF0000));
    EXPECT_EQ(convert->technology, "IFX");
    EXPECT_EQ(convert->description, "gate 4");
    const CommandLine plainLine = parse({"convert", "a.dlf", "a.pcapng"});
    const auto* plain = std::get_if<ConvertOptions>(&plainLine.command);
    ASSERT_NE(plain, nullptr);
    EXPECT_FALSE(plain->force);
    EXPECT_FALSE(plain->isStrict);
    EXPECT_EQ(plain->technology, "");
    EXPECT_EQ(plain->description, "");
}

TEST(CommandLineTest, InfoTakesFilesFormatAndTechnology) {
    const CommandLine line = parse({"info", "a.dlf", "--technology", "Ostrel_LTE", "--format", "json", "-"});
    const auto* info = std::get_if<InfoOptions>(&line.command);
    ASSERT_NE(info, nullptr);
    EXPECT_THAT(info->files, ElementsAre("a.dlf", "-"));
    EXPECT_EQ(info->technology, "Ostrel_LTE");
    EXPECT_EQ(info->format, InfoOptions::Format::Json);
    const CommandLine plainLine = parse({"info", "a.dlf"});
    const auto* plain = std::get_if<InfoOptions>(&plainLine.command);
    ASSERT_NE(plain, nullptr);
    EXPECT_EQ(plain->format, InfoOptions::Format::Text);
}

TEST(CommandLineTest, TechnologiesHaveShortFormsInAnyCase) {
    const std::pair<const char*, const char*> rows[] = {
        {"LTE", "Ostrel_LTE"},
        {"lte", "Ostrel_LTE"},
        {"Gsm", "Ostrel_GSM"},
        {"UTRAN", "Ostrel_UTRAN2"},
        {"cdma", "Ostrel_CDMA"},
        {"ifx", "IFX"},
        {"modem", "Modem"},
        {"ostrel_utran2", "Ostrel_UTRAN2"},
        {"KVOXLOGCHANNELTECHNOLOGY_OSTREL_LTE", "Ostrel_LTE"},
        // These are taken as they are.
        {"Ostrel_LTE", "Ostrel_LTE"},
        {"kVoxLogChannelTechnology_Ostrel_LTE", "kVoxLogChannelTechnology_Ostrel_LTE"},
    };
    for (const auto& [text, technology] : rows) {
        EXPECT_EQ(std::get<DecodeOptions>(parse({"decode", "a", "--technology", text}).command).technology,
                  technology);
        EXPECT_EQ(std::get<InfoOptions>(parse({"info", "a", "--technology", text}).command).technology,
                  technology);
        EXPECT_EQ(std::get<ConvertOptions>(parse({"convert", "a", "b.dlf", "--technology", text}).command)
                      .technology,
                  technology);
    }
}

TEST(CommandLineTest, FieldsTakesATechnologyARoleAndAFormat) {
    const CommandLine line =
        parse({"fields", "--technology", "Ostrel_LTE", "--role", "serving", "--format", "csv"});
    const auto* fields = std::get_if<FieldsOptions>(&line.command);
    ASSERT_NE(fields, nullptr);
    EXPECT_EQ(fields->technology, "Ostrel_LTE");
    EXPECT_TRUE(fields->roles.contains(Role::ServingLevel));
    EXPECT_FALSE(fields->roles.contains(Role::NeighbourLevel));
    EXPECT_EQ(fields->format, FieldsOptions::Format::Csv);
    const CommandLine plainLine = parse({"fields"});
    const auto* plain = std::get_if<FieldsOptions>(&plainLine.command);
    ASSERT_NE(plain, nullptr);
    EXPECT_EQ(plain->technology, "");
    EXPECT_TRUE(plain->roles.isEverything());
    EXPECT_EQ(plain->format, FieldsOptions::Format::Text);
}

} // namespace
} // namespace velmora
