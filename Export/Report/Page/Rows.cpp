// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/Rows.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"

namespace velmora {

void beginTable(Markup& out, std::string_view caption, std::initializer_list<std::string_view> columns) {
    // A wide table scrolls by itself, and by keys.
    out.raw("<div class=\"scroll\" tabindex=\"0\" role=\"region\" aria-label=\"").text(caption);
    out.raw("\"><table><caption>").text(caption).raw("</caption><thead><tr>");
    for (std::string_view each : columns) {
        const bool isNumber = each.starts_with('#');
        out.raw(isNumber ? "<th scope=\"col\" class=\"n\">" : "<th scope=\"col\">");
        out.text(each.substr(isNumber ? 1 : 0)).raw("</th>");
    }
    out.raw("</tr></thead><tbody>\n");
}

void endTable(Markup& out) {
    out.raw("</tbody></table></div>\n");
}

void writeCell(Markup& out, std::string_view text) {
    out.raw("<td>").text(text).raw("</td>");
}

void writeNumberCell(Markup& out, std::string_view text) {
    out.raw("<td class=\"n\">").text(text).raw("</td>");
}

void writeMessage(Markup& out, const DriveReport& report, MessageNumber message) {
    out.raw("<span class=\"m\">#");
    if (report.inputs().size() > 1)
        out.number(message.input + 1).raw(":");
    out.number(message.number).raw("</span>");
}

void writeRange(Markup& out, const DriveReport& report, const MessageRange& messages) {
    out.raw("<td>");
    if (messages.isKnown)
        writeMessage(out, report, messages.first);
    if (messages.isKnown && messages.last != messages.first) {
        out.raw(" – ");
        writeMessage(out, report, messages.last);
    }
    out.raw("</td>");
}

void writeTime(Markup& out, Time time) {
    out.raw("<time datetime=\"").raw(pageStamp(time)).raw("\">").raw(pageTime(time)).raw("</time>");
}

} // namespace velmora
