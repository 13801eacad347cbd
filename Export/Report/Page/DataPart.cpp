// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/DataPart.h"

#include "Analysis/Statistics/NumberFigures.h"
#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/EventsData.h"
#include "Export/Report/Page/FigureRows.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/Page/SeriesData.h"
#include "Export/Report/Page/TrackPart.h"
#include "Export/Report/TimeSpans.h"

namespace velmora {

namespace {

void writeFigures(Markup& out, const ValueCounts& values) {
    const NumberFigures figures(values);
    out.raw("{\"samples\":").number(figures.samples);
    const auto writeOne = [&out](std::string_view name, const std::optional<double>& figure) {
        if (figure)
            out.raw(",\"").raw(name).raw("\":").number(*figure);
    };
    writeOne("minimum", figures.minimum);
    writeOne("p5", figures.p5);
    writeOne("p50", figures.p50);
    writeOne("p95", figures.p95);
    writeOne("maximum", figures.maximum);
    writeOne("mean", figures.mean);
    out.raw("}");
}

void writeInputs(Markup& out, const DriveReport& report) {
    out.raw("\"files\":[");
    for (std::uint32_t i = 0; i < report.inputs().size(); ++i) {
        const ReportInput& input = report.inputs()[i];
        out.raw(i == 0 ? "" : ",\n").raw("{\"name\":").string(input.name);
        out.raw(",\"messages\":").number(input.messages);
        out.raw(",\"numbersBefore\":").number(report.numbersBefore(i));
        if (input.first)
            out.raw(",\"first\":")
                .number(millisecondsOf(*input.first))
                .raw(",\"last\":")
                .number(millisecondsOf(*input.last));
        out.raw(",\"losses\":").number(input.losses).raw(",\"failure\":").string(input.failure).raw("}");
    }
    out.raw("]");
}

void writeRoles(Markup& out, const DriveReport& report) {
    out.raw(",\n\"roles\":[");
    bool isFirst = true;
    for (const auto& group : report.groups())
        for (const RoleStatistics& role : rolesOf(*group)) {
            if (!hasFigures(role.role))
                continue;
            out.raw(isFirst ? "" : ",\n").raw("{\"role\":").string(nameOf(role.role));
            isFirst = false;
            if (report.isComparison())
                out.raw(",\"file\":").number(group->key.input.value_or(0));
            out.raw(",\"unit\":").string(nameOf(role.unit)).raw(",\"figures\":");
            writeFigures(out, role.numbers);
            if (role.worst)
                out.raw(",\"worstMinute\":{\"begin\":")
                    .number(millisecondsOf(role.worst->begin))
                    .raw(",\"figure\":")
                    .number(role.worst->figure)
                    .raw(",\"samples\":")
                    .number(role.worst->samples)
                    .raw("}");
            out.raw("}");
        }
    out.raw("]");
}

void writeCells(Markup& out, const DriveReport& report) {
    out.raw(",\n\"cells\":[");
    bool isFirst = true;
    for (const auto& technology : report.technologies())
        for (std::size_t i = 0; i < technology->cells().size(); ++i) {
            const CellRows::Row& row = technology->cells().row(i);
            out.raw(isFirst ? "" : ",\n")
                .raw("{\"technology\":")
                .string(technology->catalogue().technology());
            isFirst = false;
            out.raw(",\"cell\":").string(nameOf(technology->cells().identity(i)));
            out.raw(",\"visits\":").number(row.visits).raw(",\"seconds\":");
            out.number(std::chrono::duration<double>(row.time).count()).raw(",\"level\":");
            writeFigures(out, row.levels);
            out.raw(",\"quality\":");
            writeFigures(out, row.qualities);
            out.raw("}");
        }
    out.raw("]");
}

} // namespace

void writeData(Markup& out, const DriveReport& report, const TimeAxis& axis) {
    const std::int64_t base = axis.spans().empty() ? 0 : millisecondsOf(axis.spans().front().begin);
    out.raw("<script type=\"application/json\" id=\"data\">\n{\"version\":1,");
    writeInputs(out, report);
    out.raw(",\n\"base\":").number(base).raw(",\"spans\":[");
    for (std::size_t i = 0; i < axis.spans().size(); ++i)
        out.raw(i == 0 ? "[" : ",[")
            .number(millisecondsOf(axis.spans()[i].begin) - base)
            .raw(",")
            .number(millisecondsOf(axis.spans()[i].end) - base)
            .raw("]");
    out.raw("]");
    writeRoles(out, report);
    writeCells(out, report);
    out.raw(",\n\"series\":[");
    bool isFirst = true;
    for (const auto& technology : report.technologies())
        for (const ChartedLeaf& each : technology->series()) {
            out.raw(isFirst ? "\n" : ",\n");
            isFirst = false;
            writeSeriesData(out, report, technology->catalogue().technology(), each);
        }
    out.raw("],\n\"bands\":[");
    isFirst = true;
    for (const auto& technology : report.technologies())
        for (const TechnologyReport::ShownBand& band : technology->bands()) {
            out.raw(isFirst ? "\n" : ",\n");
            isFirst = false;
            writeBandData(out, technology->catalogue().technology(), band, base);
        }
    if (!report.track().isEmpty()) {
        out.raw("],\n\"track\":");
        writeTrackData(out, report, base);
        out.raw(",\n\"events\":");
    } else {
        out.raw("],\n\"events\":");
    }
    writeEventsData(out, report, base);
    out.raw("}\n</script>\n");
}

} // namespace velmora
