// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/SummaryPart.h"

#include "Export/Report/DriveReport.h"
#include "Export/Report/MessageRange.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/Page/Rows.h"
#include "Export/Report/Page/TrackPart.h"
#include "Platform/TimeSpan.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <optional>

namespace velmora {

namespace {

/// As the style and the table call it.
std::string_view className(std::size_t index) {
    return index == TimeShares::noClass ? "none" : nameOf(levelClasses[index]);
}

void writeInputs(Markup& out, const DriveReport& report) {
    beginTable(out, "Files", {"File", "#Messages", "First", "Last", "#Duration", "#Lost", "Read"});
    for (const ReportInput& input : report.inputs()) {
        out.raw("<tr>");
        writeCell(out, input.name);
        writeNumberCell(out, pageCount(input.messages));
        for (const std::optional<Time>& time : {input.first, input.last}) {
            out.raw("<td>");
            if (time)
                writeTime(out, *time);
            out.raw("</td>");
        }
        writeNumberCell(out, input.first ? pageDuration(*input.last - *input.first) : "");
        writeNumberCell(out, pageCount(input.losses));
        writeCell(out, input.failure.empty() ? (input.losses == 0 ? "whole" : "with losses") : input.failure);
        out.raw("</tr>\n");
    }
    endTable(out);
}

void writeTechnologies(Markup& out, const DriveReport& report) {
    out.raw("<p>Decoded as ");
    bool isFirst = true;
    for (const auto& each : report.technologies()) {
        out.raw(isFirst ? "<b>" : ", <b>").text(each->catalogue().technology()).raw("</b>");
        isFirst = false;
    }
    if (isFirst)
        out.raw("nothing: there is no message that could be decoded");
    out.raw(".");
    if (!report.track().isEmpty()) {
        out.raw(" Distance: ");
        writeDistance(out, report.track().length_m());
        out.raw(".");
    }
    out.raw(report.options().hasIdentities
                ? " This page has the identities of subscriber and phone, and their addresses.</p>\n"
                : " The identities of subscriber and phone, and their addresses, are left out.</p>\n");
}

/// The share as a bar, which needs no style of its own.
void writeBar(Markup& out, std::chrono::nanoseconds part, std::chrono::nanoseconds whole,
              std::string_view name) {
    const double share =
        whole.count() > 0 ? static_cast<double>(part.count()) / static_cast<double>(whole.count()) : 0;
    out.raw("<td><svg class=\"bar\" width=\"120\" height=\"12\" aria-hidden=\"true\"><rect class=\"c-");
    out.raw(name).raw("\" width=\"").point(share * 120).raw("\" height=\"12\"/></svg></td>");
}

void writeShares(Markup& out, const DriveReport& report, const TechnologyReport& technology,
                 std::size_t group, const std::string& of) {
    const TimeShares& shares = technology.shares(group);
    const std::chrono::nanoseconds whole = shares.total();
    if (whole.count() == 0)
        return;
    beginTable(out, "Time by radio technology and level class: " + of,
               {"Radio technology", "Level", "#Time", "#Share", "Bar", "Messages"});
    for (std::size_t row = 0; row <= TimeShares::noTechnology; ++row)
        for (std::size_t i = 0; i <= TimeShares::noClass; ++i) {
            const std::chrono::nanoseconds time = shares.time(row, i);
            if (time.count() == 0)
                continue;
            const bool isKnown = row != TimeShares::noTechnology;
            out.raw("<tr>");
            writeCell(out, isKnown ? nameOf(static_cast<RadioTechnology>(row)) : "not known");
            writeCell(out, i == TimeShares::noClass ? "not classified" : className(i));
            writeNumberCell(out, pageDuration(time));
            writeNumberCell(out, pageShare(time, whole));
            writeBar(out, time, whole, className(i));
            writeRange(out, report, shares.messages(row, i));
            out.raw("</tr>\n");
        }
    endTable(out);
}

void writeSeverities(Markup& out, const DriveReport& report) {
    const ReportEvents& events = report.events();
    beginTable(out, "Events by severity", {"Severity", "#Events"});
    for (const Severity each : {Severity::Critical, Severity::Warning, Severity::Info}) {
        out.raw("<tr class=\"s-").raw(nameOf(each)).raw("\">");
        writeCell(out, nameOf(each));
        writeNumberCell(out, pageCount(events.count(each)));
        out.raw("</tr>\n");
    }
    endTable(out);
}

/// Some of the minute's messages, from the first to the last: those that the charts' buckets lead to.
MessageRange messagesOf(const DriveReport& report, const RoleStatistics& role,
                        std::optional<std::uint32_t> input) {
    MessageRange messages;
    const Time end = timeAfter(role.worst->begin, std::chrono::minutes(1));
    for (const auto& technology : report.technologies())
        for (const ChartedLeaf& each : technology->series()) {
            if (each.leaf->role != role.role || each.input != input ||
                technology->catalogue().technology() != role.worstTechnology)
                continue;
            for (const SeriesBuckets::Bucket& bucket : each.buckets.buckets())
                if (const Time begin(bucket.index * each.buckets.width());
                    begin >= role.worst->begin && begin < end)
                    messages.add({true, std::min(bucket.minimumAt, bucket.maximumAt),
                                  std::max(bucket.minimumAt, bucket.maximumAt)});
        }
    return messages;
}

void writeWorstMinutes(Markup& out, const DriveReport& report) {
    beginTable(out, "Worst minutes", {"What", "Minute", "#Figure", "#Samples", "Decoded as", "Messages"});
    for (std::size_t i = 0; i < report.groups().size(); ++i)
        for (const RoleStatistics& role : rolesOf(*report.groups()[i])) {
            if (!role.worst)
                continue;
            const bool isMedian = role.measure == WorstMinute::Measure::LowestMedian;
            out.raw("<tr><td>").text(isMedian ? "lowest median of " : "highest mean of ");
            out.text(nameOf(role.role));
            if (report.isComparison())
                out.raw(", ").text(report.inputs()[report.groups()[i]->key.input.value_or(0)].name);
            out.raw("</td><td>");
            writeTime(out, role.worst->begin);
            out.raw("</td>");
            writeNumberCell(out, pageFigure(role.worst->figure) + ' ' + std::string(nameOf(role.unit)));
            writeNumberCell(out, pageCount(role.worst->samples));
            writeCell(out, role.worstTechnology);
            const std::uint32_t input = report.groups()[i]->key.input.value_or(0);
            writeRange(out, report,
                       messagesOf(report, role, report.isComparison() ? std::optional(input) : std::nullopt));
            out.raw("</tr>\n");
        }
    endTable(out);
}

void writeLacks(Markup& out, const DriveReport& report) {
    const auto count = [&report](const std::string& kind) {
        const auto found = report.events().kinds().find(kind);
        return found == report.events().kinds().end() ? 0 : found->second;
    };
    out.raw("<h3>What the recording lacks</h3>\n<ul>");
    out.raw("<li>Gaps (no message for more than 30 s): ").raw(pageCount(count("gap"))).raw("</li>");
    out.raw("<li>Clock jumps: ").raw(pageCount(count("clock-jump"))).raw("</li>");
    out.raw("<li>Malformed messages: ").raw(pageCount(count("malformed"))).raw("</li>");
    std::uint64_t losses = 0;
    std::uint64_t bytes = 0;
    for (const ReportInput& input : report.inputs()) {
        losses += input.losses;
        bytes += input.lostBytes;
    }
    out.raw("<li>Records that could not be read: ").raw(pageCount(losses));
    if (bytes != 0)
        out.raw(" (").raw(pageCount(bytes)).raw(" bytes)");
    out.raw("</li></ul>\n");
    if (losses == 0)
        return;
    beginTable(out, "Damage to the files", {"File", "#Record", "#Offset", "Reason"});
    for (const ReportInput& input : report.inputs())
        for (const ReportInput::Loss& loss : input.firstLosses) {
            out.raw("<tr>");
            writeCell(out, input.name);
            writeNumberCell(out, loss.number == 0 ? "" : std::to_string(loss.number));
            writeNumberCell(out, loss.offset ? std::to_string(*loss.offset) : "");
            writeCell(out, loss.reason);
            out.raw("</tr>\n");
        }
    endTable(out);
}

} // namespace

void writeSummary(Markup& out, const DriveReport& report) {
    out.raw(
        "<section id=\"summary\" aria-labelledby=\"summary-title\"><h2 id=\"summary-title\">Summary</h2>\n");
    for (const ReportInput& input : report.inputs())
        if (!input.failure.empty())
            out.raw("<p class=\"problem\" role=\"alert\">Not all of ")
                .text(input.name)
                .raw(" could be read: ")
                .text(input.failure)
                .raw("</p>\n");
    writeTechnologies(out, report);
    writeInputs(out, report);
    out.raw("<h3>Was it good?</h3>\n<div class=\"side\">");
    for (const auto& each : report.technologies())
        for (std::size_t i = 0; i < (report.isComparison() ? 2 : 1); ++i)
            writeShares(out, report, *each, i,
                        report.isComparison() ? report.inputs()[i].name : each->catalogue().technology());
    writeSeverities(out, report);
    writeWorstMinutes(out, report);
    out.raw("</div>\n");
    writeLacks(out, report);
    out.raw("</section>\n");
}

} // namespace velmora
