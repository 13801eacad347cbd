// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/FigureRows.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/Page/Rows.h"

namespace velmora {

void FigureRows::Row::add(const TechnologyReport& technology, const CatalogueField& leaf) {
    for (std::size_t i = 0; i < extremes.size(); ++i) {
        messages[i].add(technology.extremes(i).range(leaf));
        const LeafExtremes::Extremes* const other = technology.extremes(i).find(leaf);
        if (!other)
            continue;
        LeafExtremes::Extremes& known = extremes[i];
        const bool isLess = !known.isKnown || other->minimum < known.minimum ||
                            (other->minimum == known.minimum && other->minimumAt < known.minimumAt);
        const bool isGreater = !known.isKnown || other->maximum > known.maximum ||
                               (other->maximum == known.maximum && other->maximumAt < known.maximumAt);
        if (isLess) {
            known.minimum = other->minimum;
            known.minimumAt = other->minimumAt;
        }
        if (isGreater) {
            known.maximum = other->maximum;
            known.maximumAt = other->maximumAt;
        }
        known.isKnown = true;
    }
}

FigureRows::FigureRows(Markup& out, const DriveReport& report, std::string_view caption)
    : _out(out), _report(report) {
    beginTable(out, caption,
               {"What", "File", "Unit", "#Samples", "#Minimum", "#5 %", "#50 %", "#95 %", "#Maximum", "#Mean",
                "Messages", "Messages of the extremes"});
}

FigureRows::~FigureRows() {
    endTable(_out);
}

void FigureRows::write(const Row& row) {
    for (std::size_t i = 0; i < row.figures.size(); ++i)
        if (row.figures[i] && row.figures[i]->samples != 0)
            writeRow(row, i);
    if (row.figures[0] && row.figures[1] && row.figures[0]->samples != 0 && row.figures[1]->samples != 0)
        writeDifference(row);
}

void FigureRows::writeRow(const Row& row, std::size_t input) {
    const NumberFigures& figures = *row.figures[input];
    _out.raw("<tr>");
    writeCell(_out, row.name);
    writeCell(_out, _report.isComparison()         ? std::string_view(_report.inputs()[input].name)
                    : _report.inputs().size() == 1 ? std::string_view(_report.inputs()[0].name)
                                                   : std::string_view("all"));
    writeCell(_out, nameOf(row.unit));
    writeNumberCell(_out, pageCount(figures.samples));
    for (const auto& each :
         {figures.minimum, figures.p5, figures.p50, figures.p95, figures.maximum, figures.mean})
        writeNumberCell(_out, each ? pageFigure(*each) : "");
    writeRange(_out, _report, row.messages[input]);
    _out.raw("<td>");
    if (const LeafExtremes::Extremes& known = row.extremes[input]; known.isKnown) {
        writeMessage(_out, _report, known.minimumAt);
        _out.raw(" ");
        writeMessage(_out, _report, known.maximumAt);
    }
    _out.raw("</td></tr>\n");
}

void FigureRows::writeDifference(const Row& row) {
    const NumberFigures& a = *row.figures[0];
    const NumberFigures& b = *row.figures[1];
    _out.raw("<tr class=\"difference\">");
    writeCell(_out, row.name);
    writeCell(_out, "difference");
    writeCell(_out, nameOf(row.unit));
    writeNumberCell(_out, pageFigure(static_cast<double>(b.samples) - static_cast<double>(a.samples)));
    const auto writeOne = [this](const std::optional<double>& from, const std::optional<double>& to) {
        writeNumberCell(_out, from && to ? pageFigure(*to - *from) : "");
    };
    writeOne(a.minimum, b.minimum);
    writeOne(a.p5, b.p5);
    writeOne(a.p50, b.p50);
    writeOne(a.p95, b.p95);
    writeOne(a.maximum, b.maximum);
    writeOne(a.mean, b.mean);
    _out.raw("<td></td><td></td></tr>\n");
}

bool hasFigures(Role role) {
    switch (role) {
    case Role::ServingLevel:
    case Role::ServingQuality:
    case Role::NeighbourLevel:
    case Role::NeighbourQuality:
    case Role::BlockErrorRate:
    case Role::DataRate: return true;
    default: return false;
    }
}

bool isIdentifying(const CatalogueField& leaf) {
    return leaf.identity == Identity::Subscriber || leaf.identity == Identity::Equipment ||
           leaf.identity == Identity::Address;
}

} // namespace velmora
