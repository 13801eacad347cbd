// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/EventsPart.h"

#include "Analysis/Events/EventKind.h"
#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/Page/Rows.h"

#include <algorithm>
#include <chrono>

namespace velmora {

namespace {

constexpr std::size_t mostRows = 300;

void writeKinds(Markup& out, const ReportEvents& events) {
    beginTable(out, "Events by kind", {"Kind", "#Events", "Meaning"});
    for (const auto& [kind, count] : events.kinds()) {
        const EventKindRow* const row = eventKindNamed(kind);
        out.raw("<tr>");
        writeCell(out, kind);
        writeNumberCell(out, pageCount(count));
        writeCell(out, row ? row->meaning : "by a rule");
        out.raw("</tr>\n");
    }
    endTable(out);
}

void writeItem(Markup& out, const DriveReport& report, const ReportEvents::Item& item) {
    const ReportEvents& events = report.events();
    out.raw("<tr class=\"s-").raw(nameOf(item.severity)).raw("\"><td>");
    writeTime(out, item.time);
    out.raw("</td>");
    writeNumberCell(out, !item.lasts ? ""
                         : !item.end
                             ? "no end"
                             : pageDuration(std::max(*item.end - item.time, std::chrono::nanoseconds(0))));
    writeCell(out, nameOf(item.severity));
    writeCell(out, events.name(item.kind));
    writeCell(out, events.name(item.text));
    out.raw("<td>");
    for (const MessageNumber& each : item.evidence) {
        if (&each != &item.evidence.front())
            out.raw(" ");
        writeMessage(out, report, each);
    }
    out.raw("</td></tr>\n");
}

} // namespace

void writeEvents(Markup& out, const DriveReport& report) {
    const ReportEvents& events = report.events();
    out.raw("<section id=\"events\" aria-labelledby=\"events-title\"><h2 id=\"events-title\">Events</h2>\n");
    if (events.items().empty()) {
        out.raw("<p>No events.</p></section>\n");
        return;
    }
    // Where not all fit, those that matter more.
    const bool areAll = events.items().size() <= mostRows;
    std::size_t severe = 0;
    for (const auto& each : events.items())
        severe += each.severity != Severity::Info ? 1 : 0;
    const Severity least =
        areAll               ? Severity::Info
        : severe <= mostRows ? Severity::Warning
        : events.count(Severity::Critical) != 0 && events.count(Severity::Critical) <= mostRows
            ? Severity::Critical
            : Severity::Warning;
    out.raw("<div id=\"event-list\">");
    beginTable(out, areAll ? "All events" : "Events of note",
               {"Time", "#Duration", "Severity", "Kind", "What", "Messages"});
    std::size_t rows = 0;
    for (const auto& each : events.items()) {
        if (each.severity < least || rows == mostRows)
            continue;
        ++rows;
        writeItem(out, report, each);
    }
    endTable(out);
    if (!areAll)
        out.raw("<p>These are ")
            .raw(pageCount(rows))
            .raw(" of ")
            .raw(pageCount(events.items().size()))
            .raw(" events. The list beside the charts has all of them where scripts are on.</p>\n");
    out.raw("</div>\n");
    if (events.omitted() != 0)
        out.raw("<p>")
            .raw(pageCount(events.omitted()))
            .raw(" further events are counted below and not listed.</p>\n");
    writeKinds(out, events);
    out.raw("</section>\n");
}

} // namespace velmora
