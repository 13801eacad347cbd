// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoText.h"

#include "Platform/DateText.h"
#include "Platform/PrintableText.h"

#include <chrono>
#include <cinttypes>
#include <cstdio>

namespace velmora {

namespace {

/// UTC, to the millisecond: "2026-11-16 05:00:00.250 UTC".
std::string timeText(Time moment) {
    const auto seconds = std::chrono::floor<std::chrono::seconds>(moment);
    const auto milliseconds = std::chrono::floor<std::chrono::milliseconds>(moment - seconds);
    char fraction[8];
    std::snprintf(fraction, sizeof fraction, ".%03d", static_cast<int>(milliseconds.count()));
    return dateAndTimeText(seconds, " ") + fraction + " UTC";
}

std::string durationText(Time first, Time last) {
    // Unsigned: the span between the two may be more than a signed 64-bit count of nanoseconds holds.
    const std::uint64_t span = static_cast<std::uint64_t>(last.time_since_epoch().count()) -
                               static_cast<std::uint64_t>(first.time_since_epoch().count());
    char text[40];
    std::snprintf(text, sizeof text, "%" PRIu64 ".%03" PRIu64 " s", span / 1'000'000'000,
                  span / 1'000'000 % 1'000);
    return text;
}

/// "A, B", or "-" where there are none.
std::string joined(const std::vector<std::string>& names) {
    std::string text;
    for (const std::string& name : names)
        text += (text.empty() ? "" : ", ") + name;
    return text.empty() ? "-" : text;
}

std::string codeTable(const MessageSummary& summary, const CodeNames& names) {
    std::string text = std::string("\n    code     messages  ") + names.heading + "\n";
    for (const auto& [code, counted] : summary.codes()) {
        char line[64];
        std::snprintf(line, sizeof line, code > 0xFFFF ? "0x%06X" : "  0x%04X", static_cast<unsigned>(code));
        text += line;
        std::snprintf(line, sizeof line, " %12" PRIu64 "  ", counted.messages);
        text += line + joined(names.namesOf ? names.namesOf(code) : std::vector<std::string>()) + "\n";
    }
    return text;
}

std::string countLine(const char* label, const MessageSummary::Count& counted) {
    std::string text = label + std::to_string(counted.messages);
    if (counted.messages != 0)
        text += " (first: record " + std::to_string(counted.firstNumber) + " at offset " +
                std::to_string(counted.firstOffset) + ")";
    return text + "\n";
}

std::string lossLines(const MessageReader& reader) {
    const MessageReader::LossTotals& totals = reader.lossTotals();
    std::string text = "lost:       " + std::to_string(totals.losses);
    if (totals.losses != 0)
        text += " (" + std::to_string(totals.bytes) + " bytes of the file)";
    text += "\n";
    for (const Loss& loss : reader.losses())
        text += "  record " + std::to_string(loss.recordNumber) + " at offset " +
                std::to_string(loss.offset) + ": " + printable(loss.reason) + "\n";
    if (totals.losses > reader.losses().size())
        text += "  and " + std::to_string(totals.losses - reader.losses().size()) + " more\n";
    return text;
}

std::string placeOf(const Comment& comment) {
    const std::string number = std::to_string(comment.number);
    switch (comment.about) {
    case Comment::About::Snapshot: return "snapshot";
    case Comment::About::Section: return "section " + number;
    case Comment::About::Interface: return "interface " + number;
    case Comment::About::Message: break;
    }
    return "record " + number + " at offset " + std::to_string(comment.offset);
}

/// Nothing for a file without comments.
std::string commentLines(const Comments& comments) {
    std::string text;
    std::uint64_t descriptions = 0;
    for (const Comment& comment : comments.first())
        if (comment.about == Comment::About::Snapshot) {
            text += "described:  " + printable(comment.text) + "\n";
            ++descriptions;
        }
    if (comments.count() == descriptions)
        return text;
    text += "comments:   " + std::to_string(comments.count() - descriptions) + "\n";
    for (const Comment& comment : comments.first())
        if (comment.about != Comment::About::Snapshot)
            text += "  " + placeOf(comment) + ": " + printable(comment.text) + "\n";
    if (comments.count() > comments.first().size())
        text += "  and " + std::to_string(comments.count() - comments.first().size()) + " more\n";
    return text;
}

/// Nothing for a file without positions.
std::string positionLines(const FileInfo& info) {
    const PositionInfo& positions = info.positions;
    if (positions.fixes == 0)
        return {};
    std::uint64_t messages = 0;
    for (const TechnologyInfo& technology : info.technologies)
        messages += technology.summary.messages();
    char share[32];
    std::snprintf(share, sizeof share, "%.1f %%",
                  messages == 0
                      ? 0.0
                      : 100.0 * static_cast<double>(positions.messages) / static_cast<double>(messages));
    return "positions:  " + std::to_string(positions.fixes) + " (" + timeText(*positions.first) + " to " +
           timeText(*positions.last) + ")\n" + "positioned: " + std::to_string(positions.messages) + " of " +
           std::to_string(messages) + " messages (" + share + ")\n";
}

std::string technologyLines(const TechnologyInfo& technology) {
    const MessageSummary& summary = technology.summary;
    std::string text =
        "technology: " + (technology.name.empty() ? "not named" : printable(technology.name)) + "\n";
    if (summary.first()) {
        text += "first:      " + timeText(*summary.first()) + "\n";
        text += "last:       " + timeText(*summary.last()) + "\n";
        text += "duration:   " + durationText(*summary.first(), *summary.last()) + "\n";
    }
    text += "messages:   " + std::to_string(summary.messages()) + "\n";
    text += "bytes:      " + std::to_string(summary.bytes()) + "\n";
    if (summary.isBinary()) {
        text += countLine("prefixed:   ", summary.prefixed());
        text += countLine("too short:  ", summary.tooShort());
        text += countLine("wrong type: ", summary.wrongType());
    }
    if (summary.undecoded().messages != 0)
        text += countLine("undecoded:  ", summary.undecoded());
    return text;
}

std::string codeLines(const TechnologyInfo& technology) {
    if (technology.summary.codes().empty())
        return {};
    return codeTable(technology.summary, technology.names);
}

} // namespace

std::string infoText(const FileInfo& info, const MessageReader& reader) {
    std::string text =
        "form:       " + std::string(reader.form()) + (reader.isCompressed() ? ", gzip'd\n" : "\n");
    const std::string damage = positionLines(info) + lossLines(reader) + commentLines(reader.comments());
    if (info.technologies.size() == 1) {
        const TechnologyInfo& only = info.technologies.front();
        return text + technologyLines(only) + damage + codeLines(only);
    }
    text += damage;
    for (const TechnologyInfo& technology : info.technologies)
        text += "\n" + technologyLines(technology) + codeLines(technology);
    return text;
}

} // namespace velmora
