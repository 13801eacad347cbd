// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/SeriesData.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"

#include <cmath>
#include <functional>
#include <optional>

namespace velmora {

namespace {

using Bucket = SeriesBuckets::Bucket;

/// How many decimals make whole numbers of all values; absent where none of a few do.
std::optional<int> decimalsOf(const SeriesBuckets& series) {
    constexpr double largest = 1e12; // of which differences are exact
    const auto fits = [&series](double factor) {
        for (const Bucket& each : series.buckets())
            for (const double value : {each.minimum, each.maximum}) {
                const double whole = std::round(value * factor);
                if (std::abs(whole) > largest || whole / factor != value)
                    return false;
            }
        return true;
    };
    double factor = 1;
    for (int decimals = 0; decimals <= 6; ++decimals, factor *= 10)
        if (fits(factor))
            return decimals;
    return std::nullopt;
}

void writeColumn(Markup& out, std::string_view name, const SeriesBuckets& series,
                 const std::function<void(const Bucket&)>& write) {
    out.raw(",\n\"").raw(name).raw("\":[");
    bool isFirst = true;
    for (const Bucket& each : series.buckets()) {
        if (!isFirst)
            out.raw(",");
        isFirst = false;
        write(each);
    }
    out.raw("]");
}

void writeIndexes(Markup& out, const SeriesBuckets& series) {
    out.raw(",\n\"runs\":[");
    const auto& buckets = series.buckets();
    std::int64_t end = 0;
    for (std::size_t i = 0; i < buckets.size();) {
        std::size_t next = i + 1;
        while (next < buckets.size() && buckets[next].index == buckets[next - 1].index + 1)
            ++next;
        out.raw(i == 0 ? "" : ",").number(buckets[i].index - end).raw(",").number(next - i);
        end = buckets[next - 1].index + 1;
        i = next;
    }
    out.raw("]");
}

void writeValues(Markup& out, const SeriesBuckets& series) {
    const std::optional<int> decimals = decimalsOf(series);
    if (!decimals) {
        writeColumn(out, "minimum", series, [&](const Bucket& each) { out.number(each.minimum); });
        writeColumn(out, "maximum", series, [&](const Bucket& each) { out.number(each.maximum); });
        return;
    }
    const double factor = std::pow(10.0, *decimals);
    const auto whole = [factor](double value) { return std::llround(value * factor); };
    out.raw(",\"decimals\":").number(*decimals);
    long long before = 0;
    writeColumn(out, "minimumSteps", series, [&](const Bucket& each) {
        out.number(whole(each.minimum) - before);
        before = whole(each.minimum);
    });
    writeColumn(out, "spread", series,
                [&](const Bucket& each) { out.number(whole(each.maximum) - whole(each.minimum)); });
}

/// Of a comparison: whose data it is.
void writeInput(Markup& out, std::optional<std::uint32_t> input) {
    if (input)
        out.raw(",\"file\":").number(*input);
}

} // namespace

void writeSeriesData(Markup& out, const DriveReport& report, std::string_view technology,
                     const ChartedLeaf& series) {
    const auto numberOf = [&report](MessageNumber message) {
        return static_cast<std::int64_t>(report.numbersBefore(message.input) + message.number);
    };
    out.raw("{\"technology\":").string(technology).raw(",\"chart\":").string(nameOf(series.chart));
    writeInput(out, series.input);
    out.raw(",\"path\":").string(series.leaf->path).raw(",\"role\":").string(nameOf(series.leaf->role));
    out.raw(",\"unit\":").string(nameOf(series.leaf->unit));
    out.raw(",\"best\":").raw(series.isNeighbour ? "true" : "false").raw(",\"width\":");
    out.number(std::chrono::duration_cast<std::chrono::milliseconds>(series.buckets.width()).count());
    writeIndexes(out, series.buckets);
    writeValues(out, series.buckets);
    writeColumn(out, "count", series.buckets, [&](const Bucket& each) { out.number(each.count); });
    std::int64_t before = 0;
    writeColumn(out, "minimumAtSteps", series.buckets, [&](const Bucket& each) {
        out.number(numberOf(each.minimumAt) - before);
        before = numberOf(each.minimumAt);
    });
    writeColumn(out, "maximumAtOffset", series.buckets,
                [&](const Bucket& each) { out.number(numberOf(each.maximumAt) - numberOf(each.minimumAt)); });
    out.raw("}");
}

void writeBandData(Markup& out, std::string_view technology, const TechnologyReport::ShownBand& shown,
                   std::int64_t base_ms) {
    const StateBand& band = *shown.band;
    out.raw("{\"technology\":").string(technology).raw(",\"name\":").string(band.name());
    writeInput(out, shown.input);
    out.raw(",\"values\":[");
    for (std::size_t i = 0; i < band.values().size(); ++i)
        out.raw(i == 0 ? "" : ",").string(band.values()[i]);
    out.raw("],\n\"steps\":[");
    std::int64_t before = base_ms;
    for (const StateBand::Step& each : band.steps()) {
        const std::int64_t since = millisecondsOf(each.since);
        out.raw(&each == &band.steps().front() ? "" : ",").number(since - before).raw(",").number(each.value);
        before = since;
    }
    out.raw("]}");
}

} // namespace velmora
