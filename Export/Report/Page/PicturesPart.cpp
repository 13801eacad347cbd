// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/PicturesPart.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/TimeSpans.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

namespace {

constexpr double width = 1000;
constexpr double height = 140;
constexpr double margin = 60; ///< left of the plot, for the scale
constexpr double bandHeight = 16;
constexpr std::size_t columns = 400;

struct Column {
    double minimum = std::numeric_limits<double>::infinity();
    double maximum = -std::numeric_limits<double>::infinity();
};

/// The least and the greatest value in each column of the picture.
std::vector<Column> columnsOf(const SeriesBuckets& series, const TimeAxis& axis) {
    std::vector<Column> result(columns);
    for (const SeriesBuckets::Bucket& bucket : series.buckets()) {
        const Time begin(bucket.index * series.width());
        const auto index = static_cast<std::size_t>(axis.place(begin + series.width() / 2) * columns);
        Column& column = result[std::min(index, columns - 1)];
        column.minimum = std::min(column.minimum, bucket.minimum);
        column.maximum = std::max(column.maximum, bucket.maximum);
    }
    return result;
}

/// "before.pcapng: " of a comparison.
std::string fileText(const DriveReport& report, std::optional<std::uint32_t> input) {
    return input ? report.inputs()[*input].name + ": " : std::string();
}

void writeSeries(Markup& out, const ChartedLeaf& series, std::size_t colour, const TimeAxis& axis,
                 double least, double greatest) {
    const double range = greatest > least ? greatest - least : 1;
    const auto y = [&](double value) { return 4 + (greatest - value) / range * (height - 8); };
    out.raw("<path class=\"l-").number(colour).raw("\" d=\"");
    const std::vector<Column> values = columnsOf(series.buckets, axis);
    for (std::size_t i = 0; i < values.size(); ++i) {
        if (values[i].maximum < values[i].minimum)
            continue;
        const double x = margin + (static_cast<double>(i) + 0.5) / columns * (width - margin);
        out.raw("M").point(x).raw(" ").point(y(values[i].minimum) + 0.75);
        out.raw("V").point(y(values[i].maximum) - 0.75);
    }
    out.raw("\"/>");
}

void writeScale(Markup& out, double least, double greatest, std::string_view unit) {
    out.raw("<text x=\"0\" y=\"14\">").text(pageFigure(greatest)).raw(" ").text(unit).raw("</text>");
    out.raw("<text x=\"0\" y=\"").point(height - 4).raw("\">").text(pageFigure(least)).raw("</text>");
}

void writeChart(Markup& out, const DriveReport& report, ReportChart chart, const TimeAxis& axis) {
    std::vector<const ChartedLeaf*> series;
    double least = std::numeric_limits<double>::infinity();
    double greatest = -least;
    for (const auto& technology : report.technologies())
        for (const ChartedLeaf& each : technology->series())
            if (each.chart == chart) {
                series.push_back(&each);
                least = std::min(least, each.buckets.total().minimum);
                greatest = std::max(greatest, each.buckets.total().maximum);
            }
    if (series.empty())
        return;
    out.raw("<figure class=\"chart\"><figcaption>").text(nameOf(chart)).raw(" (");
    out.text(nameOf(series.front()->leaf->unit)).raw(")<ul class=\"legend\">");
    for (std::size_t i = 0; i < series.size(); ++i) {
        out.raw("<li><svg width=\"14\" height=\"10\" aria-hidden=\"true\"><path class=\"l-").number(i % 8);
        out.raw("\" d=\"M0 5H14\"/></svg> ")
            .text(fileText(report, series[i]->input))
            .text(series[i]->leaf->path);
        out.raw(series[i]->isNeighbour ? " (best)</li>" : "</li>");
    }
    out.raw("</ul></figcaption>\n<svg class=\"plot\" viewBox=\"0 0 1000 140\" role=\"img\" aria-label=\"");
    out.text(nameOf(chart)).raw(" over time: from ").text(pageFigure(least)).raw(" to ");
    out.text(pageFigure(greatest)).raw(" ").text(nameOf(series.front()->leaf->unit)).raw("\">");
    writeScale(out, least, greatest, nameOf(series.front()->leaf->unit));
    for (std::size_t i = 0; i < series.size(); ++i)
        writeSeries(out, *series[i], i % 8, axis, least, greatest);
    out.raw("</svg></figure>\n");
}

/// The style's class of a band's value: classes of levels have colours of their own.
void writeBandClass(Markup& out, const StateBand& band, std::uint32_t value) {
    out.raw("class=\"");
    if (band.name() == "level class" && value != StateBand::several)
        out.raw("c-").text(band.values()[value]);
    else
        out.raw("b-").number(value == StateBand::several ? 1 : 2 + (value - 2) % 8);
    out.raw("\"");
}

/// Of a band of few values; of many the colours repeat.
void writeBandLegend(Markup& out, const StateBand& band) {
    constexpr std::size_t most = 10;
    if (band.values().size() > most)
        return;
    out.raw("<ul class=\"legend\">");
    for (std::uint32_t value = 2; value < band.values().size(); ++value) {
        out.raw("<li><svg width=\"14\" height=\"10\" aria-hidden=\"true\"><rect ");
        writeBandClass(out, band, value);
        out.raw(" width=\"14\" height=\"10\"/></svg> ").text(band.values()[value]).raw("</li>");
    }
    out.raw("</ul>");
}

/// The band in columns, each with the value in its middle; neighbours of one value are one rectangle.
void writeBand(Markup& out, const StateBand& band, const std::string& file, const TimeAxis& axis) {
    out.raw("<figure class=\"band\"><figcaption>").text(file).text(band.name());
    writeBandLegend(out, band);
    out.raw("</figcaption><svg class=\"plot\" viewBox=\"0 0 1000 16\" role=\"img\" aria-label=\"");
    out.text(file).text(band.name()).raw(" over time\">");
    std::size_t step = 0;
    const auto& steps = band.steps();
    double begin = margin;
    std::uint32_t value = StateBand::unknown;
    const auto writeOne = [&](double end) {
        if (value == StateBand::unknown || end <= begin)
            return;
        out.raw("<rect ");
        writeBandClass(out, band, value);
        out.raw(" x=\"").point(begin).raw("\" width=\"");
        out.point(end - begin).raw("\" height=\"").point(bandHeight).raw("\"><title>");
        out.text(band.values()[value]).raw("</title></rect>");
    };
    for (std::size_t i = 0; i < columns; ++i) {
        const double place = (static_cast<double>(i) + 0.5) / columns;
        while (step < steps.size() && axis.place(steps[step].since) <= place)
            ++step;
        const std::uint32_t here = step == 0 ? StateBand::unknown : steps[step - 1].value;
        const double x = margin + static_cast<double>(i) / columns * (width - margin);
        if (here != value) {
            writeOne(x);
            begin = x;
            value = here;
        }
    }
    writeOne(width);
    out.raw("</svg></figure>\n");
}

/// Of each column the most severe event.
void writeTicks(Markup& out, const DriveReport& report, const TimeAxis& axis) {
    std::array<int, columns> severities;
    severities.fill(-1);
    for (const ReportEvents::Item& each : report.events().items()) {
        const auto index = std::min(static_cast<std::size_t>(axis.place(each.time) * columns), columns - 1);
        severities[index] = std::max(severities[index], static_cast<int>(each.severity));
    }
    out.raw("<figure class=\"band\"><figcaption>events</figcaption><svg class=\"plot\" "
            "viewBox=\"0 0 1000 16\" role=\"img\" aria-label=\"events over time, by severity\">");
    for (std::size_t i = 0; i < columns; ++i) {
        if (severities[i] < 0)
            continue;
        const double x = margin + (static_cast<double>(i) + 0.5) / columns * (width - margin);
        out.raw("<path class=\"e-").raw(nameOf(static_cast<Severity>(severities[i]))).raw("\" d=\"M");
        out.point(x).raw(" 0V16\"/>");
    }
    out.raw("</svg></figure>\n");
}

void writeAxis(Markup& out, const TimeAxis& axis) {
    if (axis.spans().empty())
        return;
    out.raw("<p class=\"axis\">From ").raw(pageTime(axis.spans().front().begin)).raw(" to ");
    out.raw(pageTime(axis.spans().back().end));
    if (axis.spans().size() > 1)
        out.raw("; silences of more than 10 min are left out");
    out.raw("</p>\n");
}

} // namespace

void writePictures(Markup& out, const DriveReport& report, const TimeAxis& axis) {
    out.raw("<section id=\"charts\" aria-labelledby=\"charts-title\"><h2 id=\"charts-title\">Charts</h2>\n");
    out.raw("<div id=\"live\"></div>\n<div id=\"pictures\">");
    writeAxis(out, axis);
    for (const ReportChart each :
         {ReportChart::Level, ReportChart::Quality, ReportChart::DataRate, ReportChart::ErrorRate})
        writeChart(out, report, each, axis);
    for (const auto& technology : report.technologies()) {
        if (report.technologies().size() > 1)
            out.raw("<h3>").text(technology->catalogue().technology()).raw("</h3>\n");
        for (const TechnologyReport::ShownBand& shown : technology->bands())
            writeBand(out, *shown.band, fileText(report, shown.input), axis);
    }
    writeTicks(out, report, axis);
    out.raw("</div></section>\n");
}

} // namespace velmora
