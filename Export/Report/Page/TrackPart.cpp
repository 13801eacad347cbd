// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/TrackPart.h"

#include "Analysis/Tracks/Position.h"
#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace velmora {

namespace {

constexpr double size = 600;
constexpr double margin = 30;
constexpr std::size_t mostPoints = 2000;

/// Where fixes are in the picture: degrees of longitude are as short as they are in the middle of the track.
class Projection {
public:
    explicit Projection(const std::vector<Fix>& fixes) {
        const auto byLatitude = std::minmax_element(
            fixes.begin(), fixes.end(), [](const Fix& a, const Fix& b) { return a.latitude < b.latitude; });
        const auto byLongitude = std::minmax_element(
            fixes.begin(), fixes.end(), [](const Fix& a, const Fix& b) { return a.longitude < b.longitude; });
        _north = byLatitude.second->latitude;
        _west = byLongitude.first->longitude;
        const double middle = (_north + byLatitude.first->latitude) / 2;
        _narrowing = std::max(std::cos(middle * std::numbers::pi / 180), 0.01);
        const double height = _north - byLatitude.first->latitude;
        const double width = (byLongitude.second->longitude - _west) * _narrowing;
        _scale = (size - 2 * margin) / std::max({height, width, 1e-4});
        Fix from{};
        from.latitude = middle;
        from.longitude = _west;
        Fix to = from;
        to.longitude += 0.001;
        _metres = distance_m(from, to) / (0.001 * _narrowing);
    }

    [[nodiscard]] double x(const Fix& fix) const {
        return margin + (fix.longitude - _west) * _narrowing * _scale;
    }
    [[nodiscard]] double y(const Fix& fix) const { return margin + (_north - fix.latitude) * _scale; }
    /// The length of so many metres in the picture.
    [[nodiscard]] double length(double metres) const { return metres / _metres * _scale; }

private:
    double _north = 0;
    double _west = 0;
    double _narrowing = 1;
    double _scale = 1;  ///< of a degree of latitude
    double _metres = 1; ///< in a degree of latitude
};

/// The longest of 1, 2 and 5 times a power of ten that is not too long for a scale bar.
double barLength(const Projection& projection) {
    double best = 1;
    for (double length = 1; length < 1e8; length *= 10)
        for (const double factor : {1.0, 2.0, 5.0})
            if (projection.length(length * factor) < size / 3)
                best = length * factor;
    return best;
}

} // namespace

void writeDistance(Markup& out, double metres) {
    if (metres < 1000)
        out.raw(pageFigure(std::round(metres))).raw(" m");
    else
        out.raw(pageFigure(std::round(metres) / 1000)).raw(" km");
}

void writeTrack(Markup& out, const DriveReport& report) {
    const ReportTrack& track = report.track();
    if (track.isEmpty())
        return;
    const std::vector<Fix>& fixes = track.fixes();
    const Projection projection(fixes);
    out.raw("<section id=\"track\" aria-labelledby=\"track-title\"><h2 id=\"track-title\">Track</h2>\n<p>");
    writeDistance(out, track.length_m());
    out.raw(", north is up.</p>\n<div id=\"live-track\"></div>\n<div id=\"track-picture\">"
            "<svg class=\"track\" viewBox=\"0 0 600 600\" role=\"img\" aria-label=\"the track, north up\">"
            "<path class=\"l-0\" d=\"");
    const std::size_t step = fixes.size() / mostPoints + 1;
    bool isBegin = true;
    for (std::size_t i = 0; i < fixes.size(); ++i) {
        isBegin = isBegin || track.isBegin(i);
        if (i % step != 0)
            continue;
        out.raw(isBegin ? "M" : "L").point(projection.x(fixes[i])).raw(" ").point(projection.y(fixes[i]));
        isBegin = false;
    }
    const double bar = barLength(projection);
    out.raw("\"/><path class=\"scale\" d=\"M10 585V590H").point(10 + projection.length(bar));
    out.raw("V585\"/><text x=\"10\" y=\"580\">");
    writeDistance(out, bar);
    out.raw("</text><path class=\"scale\" d=\"M580 40V12M574 20L580 12L586 20\"/>"
            "<text x=\"575\" y=\"56\">N</text></svg></div></section>\n");
}

void writeTrackData(Markup& out, const DriveReport& report, std::int64_t base_ms) {
    const ReportTrack& track = report.track();
    constexpr double factor = 1e6; // a tenth of a metre
    const auto writeColumn = [&](std::string_view name, auto&& valueOf, std::int64_t first) {
        out.raw("\"").raw(name).raw("\":[");
        std::int64_t before = first;
        for (std::size_t i = 0; i < track.fixes().size(); ++i) {
            const std::int64_t value = valueOf(track.fixes()[i]);
            out.raw(i == 0 ? "" : ",").number(value - before);
            before = value;
        }
        out.raw("]");
    };
    out.raw("{\"metres\":").number(track.length_m()).raw(",");
    writeColumn(
        "timeSteps", [](const Fix& fix) { return millisecondsOf(fix.time); }, base_ms);
    out.raw(",\n");
    writeColumn(
        "latitudeSteps", [](const Fix& fix) { return std::llround(fix.latitude * factor); }, 0);
    out.raw(",\n");
    writeColumn(
        "longitudeSteps", [](const Fix& fix) { return std::llround(fix.longitude * factor); }, 0);
    out.raw(",\n\"begins\":[");
    bool isFirst = true;
    for (std::size_t i = 0; i < track.fixes().size(); ++i)
        if (track.isBegin(i)) {
            out.raw(isFirst ? "" : ",").number(i);
            isFirst = false;
        }
    out.raw("]}");
}

} // namespace velmora
