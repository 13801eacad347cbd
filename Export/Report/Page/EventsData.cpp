// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/EventsData.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"

#include <algorithm>
#include <functional>

namespace velmora {

namespace {

using Item = ReportEvents::Item;

void writeColumn(Markup& out, const char* name, const ReportEvents& events,
                 const std::function<void(const Item&)>& write) {
    out.raw(",\n\"").raw(name).raw("\":[");
    bool isFirst = true;
    for (const Item& each : events.items()) {
        if (!isFirst)
            out.raw(",");
        isFirst = false;
        write(each);
    }
    out.raw("]");
}

} // namespace

void writeEventsData(Markup& out, const DriveReport& report, std::int64_t base_ms) {
    const ReportEvents& events = report.events();
    out.raw("{\"names\":[");
    for (std::size_t i = 0; i < events.names().size(); ++i)
        out.raw(i == 0 ? "" : ",").string(events.names()[i]);
    out.raw("]");
    std::int64_t before = base_ms;
    writeColumn(out, "timeSteps", events, [&](const Item& each) {
        out.number(millisecondsOf(each.time) - before);
        before = millisecondsOf(each.time);
    });
    // -1 lasts without an end, and null does not last.
    writeColumn(out, "duration", events, [&](const Item& each) {
        if (each.lasts)
            out.number(each.end
                           ? std::max<std::int64_t>(0, millisecondsOf(*each.end) - millisecondsOf(each.time))
                           : std::int64_t{-1});
        else
            out.raw("null");
    });
    writeColumn(out, "severity", events,
                [&](const Item& each) { out.number(static_cast<int>(each.severity)); });
    writeColumn(out, "kind", events, [&](const Item& each) { out.number(each.kind); });
    writeColumn(out, "technology", events, [&](const Item& each) { out.number(each.technology); });
    writeColumn(out, "text", events, [&](const Item& each) { out.number(each.text); });
    // The numbers of all files' messages: the first as a step from the first of the event before, the others
    // from the one before.
    std::int64_t first = 0;
    writeColumn(out, "messageSteps", events, [&](const Item& each) {
        std::int64_t last = first;
        out.raw("[");
        for (std::size_t i = 0; i < each.evidence.size(); ++i) {
            const auto number = static_cast<std::int64_t>(report.numbersBefore(each.evidence[i].input) +
                                                          each.evidence[i].number);
            out.raw(i == 0 ? "" : ",").number(number - last);
            last = number;
            if (i == 0)
                first = number;
        }
        out.raw("]");
    });
    out.raw("}");
}

} // namespace velmora
