// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/MessageSummary.h"

#include "LogMessages/LogMessage.h"
#include "Platform/DateText.h"
#include "Tools/Text/PrintableText.h"

#include <algorithm>
#include <cinttypes>
#include <cstdio>

namespace velmora {

namespace {

void count(MessageSummary::Count& counted, const LoggedMessage& message) {
    if (counted.messages++ == 0) {
        counted.firstNumber = message.number;
        counted.firstOffset = message.offset;
    }
}

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

std::string codeTable(const MessageSummary& summary, const CodeNames& names) {
    std::string text = std::string("\n    code     messages  ") + names.heading + "\n";
    for (const auto& [code, counted] : summary.codes()) {
        char line[64];
        std::snprintf(line, sizeof line, code > 0xFFFF ? "0x%06X" : "  0x%04X", static_cast<unsigned>(code));
        text += line;
        std::snprintf(line, sizeof line, " %12" PRIu64 "  ", counted.messages);
        const std::string name = names.nameOf ? names.nameOf(code) : std::string();
        text += line + (name.empty() ? "-" : name) + "\n";
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
                std::to_string(loss.offset) + ": " + loss.reason + "\n";
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

} // namespace

void MessageSummary::add(const LoggedMessage& message) {
    ++_messages;
    _bytes += message.message.size();
    _first = _first ? std::min(*_first, message.time) : message.time;
    _last = _last ? std::max(*_last, message.time) : message.time;
    if (!_binary)
        return;
    const std::optional<LogMessage> header = LogMessage::parse(message.message.bytes());
    if (!header) {
        count(_tooShort, message);
        return;
    }
    if (header->prefixed)
        count(_prefixed, message);
    if (header->type == LogMessage::basebandType || header->type == LogMessage::extraType)
        count(_codes[header->logCode()], message);
    else
        count(_wrongType, message);
}

std::string summaryText(const MessageSummary& summary, const std::string& technology, const CodeNames& names,
                        const MessageReader& reader) {
    std::string text =
        "form:       " + std::string(reader.form()) + (reader.isCompressed() ? ", gzip'd\n" : "\n");
    text += "technology: " + (technology.empty() ? "not named" : printable(technology)) + "\n";
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
    text += lossLines(reader);
    text += commentLines(reader.comments());
    if (!summary.codes().empty())
        text += codeTable(summary, names);
    return text;
}

} // namespace velmora
