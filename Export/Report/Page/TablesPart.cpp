// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/TablesPart.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/Page/Rows.h"

namespace velmora {

namespace {

void writeFigures(Markup& out, const ValueCounts& values) {
    if (values.count() == 0) {
        out.raw("<td></td><td></td><td></td>");
        return;
    }
    writeNumberCell(out, pageFigure(values.minimum()));
    writeNumberCell(out, pageFigure(percentileOf(values.sorted(), values.count(), 50)));
    writeNumberCell(out, pageFigure(values.maximum()));
}

void writeCells(Markup& out, const DriveReport& report) {
    out.raw("<section id=\"cells\" aria-labelledby=\"cells-title\"><h2 id=\"cells-title\">Cells seen</h2>\n");
    beginTable(out, "Serving cells",
               {"Cell", "Radio technology", "Network", "#Visits", "#Time", "First", "#Samples", "#Level min",
                "#median", "#max dBm", "#Quality min", "#median", "#max dB", "Messages"});
    for (const auto& technology : report.technologies())
        for (std::size_t i = 0; i < technology->cells().size(); ++i) {
            const CellRows::Row& row = technology->cells().row(i);
            const CellIdentity& cell = technology->cells().identity(i);
            out.raw("<tr>");
            writeCell(out, nameOf(cell));
            writeCell(out, cell.technology ? nameOf(*cell.technology) : "");
            writeCell(out, cell.network);
            writeNumberCell(out, pageCount(row.visits));
            writeNumberCell(out, pageDuration(row.time));
            out.raw("<td>");
            writeTime(out, row.first);
            out.raw("</td>");
            writeNumberCell(out, pageCount(row.levels.count()));
            writeFigures(out, row.levels);
            writeFigures(out, row.qualities);
            writeRange(out, report, {true, row.firstMessage, row.lastMessage});
            out.raw("</tr>\n");
        }
    endTable(out);
    out.raw("</section>\n");
}

void writeNeighbours(Markup& out, const DriveReport& report) {
    out.raw("<section id=\"neighbours\" aria-labelledby=\"neighbours-title\">"
            "<h2 id=\"neighbours-title\">Neighbours</h2>\n");
    beginTable(out, "Neighbour cells",
               {"Cell", "Radio technology", "#Reports", "Found by", "First", "#Level min", "#median",
                "#max dBm", "#Quality min", "#median", "#max dB", "Messages"});
    std::uint64_t omitted = 0;
    for (const auto& technology : report.technologies()) {
        omitted += technology->neighbours().omitted();
        for (const auto& [key, row] : technology->neighbours().rows()) {
            CellIdentity cell;
            cell.technology = key.technology;
            cell.channel = key.channel;
            cell.physicalCell = key.physicalCell;
            out.raw("<tr>");
            writeCell(out, nameOf(cell));
            writeCell(out, key.technology ? nameOf(*key.technology) : "");
            writeNumberCell(out, pageCount(row.reports));
            writeCell(out, row.isDetected ? "the phone" : "the network's list");
            out.raw("<td>");
            writeTime(out, row.first);
            out.raw("</td>");
            writeFigures(out, row.levels);
            writeFigures(out, row.qualities);
            writeRange(out, report, {true, row.firstMessage, row.lastMessage});
            out.raw("</tr>\n");
        }
    }
    endTable(out);
    if (omitted != 0)
        out.raw("<p>").raw(pageCount(omitted)).raw(" reports of further neighbours are left out.</p>\n");
    out.raw("</section>\n");
}

bool isOfContext(std::string_view kind) {
    return kind == "context-up" || kind == "context-down" || kind == "address-change";
}

void writeStartContexts(Markup& out, const DriveReport& report) {
    beginTable(out, "Contexts that were active when their first list came",
               {"Time", "Decoded as", "Context", "Message"});
    for (const auto& technology : report.technologies())
        for (const StartContexts& contexts : technology->startContexts())
            for (const StartContexts::Row& row : contexts.rows()) {
                out.raw("<tr><td>");
                writeTime(out, row.time);
                out.raw("</td>");
                writeCell(out, technology->catalogue().technology());
                writeCell(out, row.text);
                out.raw("<td>");
                writeMessage(out, report, row.message);
                out.raw("</td></tr>\n");
            }
    endTable(out);
}

void writeContexts(Markup& out, const DriveReport& report) {
    const ReportEvents& events = report.events();
    constexpr std::size_t most = 200;
    out.raw("<section id=\"contexts\" aria-labelledby=\"contexts-title\">"
            "<h2 id=\"contexts-title\">Packet-data contexts</h2>\n");
    writeStartContexts(out, report);
    beginTable(out, "Changes of contexts", {"Time", "Kind", "Context", "Messages"});
    std::size_t rows = 0;
    for (const auto& each : events.items()) {
        if (!isOfContext(events.name(each.kind)) || ++rows > most)
            continue;
        out.raw("<tr><td>");
        writeTime(out, each.time);
        out.raw("</td>");
        writeCell(out, events.name(each.kind));
        writeCell(out, events.name(each.text));
        out.raw("<td>");
        for (const MessageNumber& message : each.evidence) {
            writeMessage(out, report, message);
            out.raw(" ");
        }
        out.raw("</td></tr>\n");
    }
    endTable(out);
    if (rows > most)
        out.raw("<p>These are the first ")
            .raw(pageCount(most))
            .raw(" of ")
            .raw(pageCount(rows))
            .raw(".</p>\n");
    out.raw("</section>\n");
}

void writeNotes(Markup& out, const DriveReport& report) {
    std::uint64_t notes = 0;
    for (const ReportInput& input : report.inputs())
        notes += input.noteCount;
    if (notes == 0)
        return;
    out.raw("<section id=\"notes\" aria-labelledby=\"notes-title\"><h2 id=\"notes-title\">Notes</h2>\n");
    beginTable(out, "Comments in the files", {"About", "Note"});
    for (std::uint32_t i = 0; i < report.inputs().size(); ++i)
        for (const ReportInput::Note& note : report.inputs()[i].notes) {
            out.raw("<tr><td>");
            if (note.number != 0)
                writeMessage(out, report, {i, note.number});
            else
                out.text(report.inputs()[i].name);
            out.raw("</td>");
            writeCell(out, note.text);
            out.raw("</tr>\n");
        }
    endTable(out);
    out.raw("</section>\n");
}

} // namespace

void writeTables(Markup& out, const DriveReport& report) {
    writeCells(out, report);
    writeNeighbours(out, report);
    writeContexts(out, report);
    writeNotes(out, report);
}

} // namespace velmora
