// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/NumberTable.h"

#include "Analysis/Statistics/Histogram.h"
#include "Analysis/Statistics/NumberFigures.h"
#include "Platform/PrintableText.h"
#include "Tools/Stats/FigureText.h"
#include "Tools/Text/CountText.h"

#include <algorithm>

namespace velmora {

namespace {

using Align = TextTable::Align;

/// A percentile, marked where it is not exact.
std::string percentileText(const std::optional<double>& figure, const NumberFigures& figures) {
    return (figure && figures.relativeError > 0 ? "~" : "") + figureText(figure);
}

std::string histogramText(const std::string& name, Unit unit, const ValueCounts& numbers) {
    constexpr std::uint64_t widest = 40;
    const Histogram histogram = histogramOf(numbers.sorted(), unit);
    std::uint64_t most = histogram.others;
    for (const HistogramBin& each : histogram.bins)
        most = std::max(most, each.count);
    const auto bar = [most](std::uint64_t count) {
        // At least a mark for what is not empty.
        return std::string(std::max<std::uint64_t>(1, count * widest / most), '#');
    };
    TextTable table({Align::Right, Align::Left, Align::Right, Align::Left});
    for (const HistogramBin& each : histogram.bins)
        table.add({figureText(each.from), each.from == each.to ? "" : "to " + figureText(each.to),
                   countText(each.count), bar(each.count)});
    if (histogram.others != 0)
        table.add({"others", "", countText(histogram.others), bar(histogram.others)});
    const std::string_view unitName = nameOf(unit);
    return "\n  " + printable(name) + (unitName.empty() ? "" : " (" + std::string(unitName) + ")") + "\n" +
           table.text(4);
}

} // namespace

NumberTable::NumberTable(const std::string& title, bool hasHistograms)
    : _table({Align::Left, Align::Left, Align::Right, Align::Right, Align::Right, Align::Right, Align::Right,
              Align::Right, Align::Right, Align::Right}),
      _hasHistograms(hasHistograms) {
    _table.add({title, "unit", "samples", "absent", "minimum", "5 %", "50 %", "95 %", "maximum", "mean"});
}

void NumberTable::add(const std::string& name, Unit unit, const ValueCounts& numbers, std::uint64_t absent) {
    const NumberFigures figures(numbers);
    _isEmpty = false;
    _table.add({name, std::string(nameOf(unit)), countText(figures.samples), countText(absent),
                figureText(figures.minimum), percentileText(figures.p5, figures),
                percentileText(figures.p50, figures), percentileText(figures.p95, figures),
                figureText(figures.maximum), figureText(figures.mean)});
    if (_hasHistograms && figures.samples != 0)
        _histograms += histogramText(name, unit, numbers);
}

std::string NumberTable::text() const {
    return _table.text(2) + _histograms;
}

} // namespace velmora
