// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/PlaybackNotice.h"

#include "Platform/PrintableText.h"
#include "Platform/TelephonyService.h"

#include <algorithm>
#include <filesystem>
#include <vector>

namespace velmora {

namespace {

std::string place(std::uint64_t record, std::uint64_t offset) {
    return "record " + std::to_string(record) + " at offset " + std::to_string(offset);
}

std::string lossText(const MessageReader& reader) {
    const MessageReader::LossTotals& totals = reader.lossTotals();
    if (totals.losses == 0)
        return {};
    const Loss& first = reader.losses().front();
    std::string text =
        first.isTruncation && totals.losses == 1
            ? " is cut off in "
            : " is damaged: " + std::to_string(totals.bytes) + " bytes in " + std::to_string(totals.losses) +
                  (totals.losses == 1 ? " place were skipped, " : " places were skipped, first ");
    return text + place(first.recordNumber, first.offset) + " (" + first.reason + ").";
}

std::string undecodedText(const RecordingIndex::Undecoded& undecoded) {
    if (undecoded.messages == 0)
        return {};
    return " has " + std::to_string(undecoded.messages) +
           (undecoded.messages == 1 ? " message" : " messages") + " that could not be decoded, first " +
           place(undecoded.number, undecoded.offset) + " (" + undecoded.reason + ").";
}

std::string technologiesText(const std::vector<std::string>& names, const std::string& shown) {
    std::string text = " holds ";
    for (const std::string& name : names)
        text += (&name == &names.front()  ? ""
                 : &name == &names.back() ? " and "
                                          : ", ") +
                technologyTitle(name);
    return text + "; " + technologyTitle(shown) + " is shown.";
}

std::vector<std::string> known(const MessageReader& reader) {
    std::vector<std::string> names = reader.technologies();
    std::erase_if(names, [](const std::string& name) { return !isTechnology(name); });
    return names;
}

} // namespace

std::string playbackNotice(const PlayedFile& file, const RecordingIndex& index, const Player& player,
                           const std::string& change) {
    const std::string name = std::filesystem::path(file.path()).filename().string();
    std::string text;
    const auto say = [&text, &name](const std::string& what) {
        if (!what.empty())
            text += (text.empty() ? "" : " ") + name + what;
    };
    if (const std::vector<std::string> names = known(file.reader()); names.size() > 1)
        say(technologiesText(names, index.technology()));
    say(lossText(file.reader()));
    if (const std::string failure = file.failure(); !failure.empty())
        say(" could be read up to here only: " + failure + ".");
    say(undecodedText(index.undecoded()));
    if (index.isComplete() && index.messages() == 0)
        say(" holds no message of " + technologyTitle(index.technology()) + ".");
    if (change == "has grown")
        say(" has grown since it was opened; open it again to see the rest.");
    else if (!change.empty())
        say(" " + change + " since it was opened; open it again.");
    if (!player.failure().empty())
        say(": " + player.failure() + ".");
    return printable(text);
}

std::string otherTechnology(const PlayedFile& file, const RecordingIndex& index) {
    const std::vector<std::string> names = known(file.reader());
    const auto shown = std::find(names.begin(), names.end(), index.technology());
    if (names.size() < 2 || shown == names.end())
        return {};
    return shown + 1 == names.end() ? names.front() : *(shown + 1);
}

} // namespace velmora
