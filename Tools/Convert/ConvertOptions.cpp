// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/ConvertOptions.h"

#include "Tools/CommandOptions.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Messages/PositionOptions.h"
#include "Tools/Messages/SelectionOptions.h"
#include "Tools/Stats/ChoiceOptions.h"

#include <string>
#include <string_view>

namespace velmora {

namespace {

void checkTogether(const ConvertOptions& options) {
    const FileForm form = *formFromName(options.out);
    if (!options.track.empty() && form != FileForm::Recording)
        throw CLI::ValidationError("--track", "got another output, wanted a .pcapng");
    if ((!options.selection.paths().empty() || !options.roles.isEverything()) && !isTrack(form) &&
        form != FileForm::Database)
        throw CLI::ValidationError("--select",
                                   "got another output, wanted a .gpx, .geojson, .kml or .sqlite");
    if (isTrack(form) && !options.messages.codes.empty())
        throw CLI::ValidationError("--code", "got a track as output, wanted a .pcapng, .velmora or .dlf");
}

} // namespace

CLI::App* addConvert(CLI::App& app, ConvertOptions& options) {
    CLI::App* command =
        app.add_subcommand("convert", "Convert a recording, snapshot or DLF log to another form");
    command->add_option("FILE", options.file, "What to convert; - is standard input")
        ->required()
        ->type_name("");
    command
        ->add_option("OUT", options.out,
                     "The output; its suffix selects the form: .pcapng a recording, .velmora a snapshot, "
                     ".dlf a DLF log; .gpx, .geojson or .kml the track with values and events; .sqlite a "
                     "database")
        ->required()
        ->check(validator([](const std::string& name) { return formFromName(name).has_value(); },
                          std::string("a name that ends in ") + formSuffixes))
        ->type_name("");
    command->add_flag("--force", options.force, "Overwrite OUT if it exists");
    addSelection(*command, options.messages,
                 "; a snapshot's displays start cold: what the others leave is missing");
    addTechnology(*command, options.technology, "Convert as");
    command
        ->add_option(
            "--track", options.track,
            "For a recording: add the positions of this GPX file or of these NMEA sentences, by their "
            "time")
        ->type_name("FILE");
    addChoice(*command, options.selection, options.roles);
    for (const char* const name : {"--select", "--role"})
        command->get_option(name)->description(
            "For a track or database: " +
            std::string(name == std::string_view("--select") ? "the part of the display" : "the role") +
            " whose values it has; by default serving.level and serving.quality, a database all" +
            (name == std::string_view("--select") ? "; may be repeated" : ""));
    addMaximumGap(*command, options.maximumGap);
    command->add_option("--description", options.description, "A snapshot's description; empty by default")
        ->type_name("TEXT");
    command->add_flag("--strict", options.isStrict,
                      "For a snapshot: end at a message that ends the application; by default it is counted, "
                      "reported and left out");
    command->footer(
        "A recording holds all messages with their times, a DLF log all messages; a snapshot is the one\n"
        "that the application would have written after the last message: the last five displays with the\n"
        "messages before each. A track file has a point for each fix, with speed and the values that were\n"
        "reported up to 10 s before, and a point for each event; KML colours the line by the first value.\n"
        "A database has tables of messages, samples, events, positions and the catalogue, and views of "
        "them.\n"
        "OUT is complete or does not exist. Losses in FILE are reported and give\n"
        "exit status 1; the rest is converted.\n\n" +
        std::string(timeHelp) +
        "\nExamples:\n"
        "  velmora-log convert drive.pcapng drive.velmora --description 'gate 4, roof'\n"
        "  velmora-log convert --from +60 --to +120 --code 0x512C drive.pcapng minute.pcapng\n"
        "  velmora-log convert --technology Ostrel_LTE modem.dlf modem.pcapng\n"
        "  velmora-log convert --track drive.gpx drive.pcapng positioned.pcapng\n"
        "  velmora-log convert --role serving.level positioned.pcapng drive.geojson\n"
        "  velmora-log convert drive.pcapng drive.sqlite\n"
        "  velmora-log record - | velmora-log convert - drive.dlf");
    command->callback([&options] { checkTogether(options); });
    return command;
}

} // namespace velmora
