// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/SearcherSet.h"

#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogGenerator/OstrelGSM/UMTS/SearcherRecord.h"
#include "Platform/SystemLog.h"

namespace velmora {

using OstrelGSM::SearcherRecord;

namespace {

constexpr View sectionViews[] = {{SearcherRecord::code, SearcherRecord::minimumLength, 0}};
constexpr std::string_view cellKeys[] = {"Scrambling Code"};
constexpr List rows{.keys = cellKeys};

} // namespace

std::span<const View> SearcherSet::views() const {
    return sectionViews;
}

void SearcherSet::trace() const {
    logLine(LogPriority::Warning, traceName());
}

void SearcherSet::check(const View&, const Record& record) const {
    checkCells(record);
}

void SearcherSet::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.beginList(rows);
    visitCells(record, visitor);
    visitor.endList();
}

void SearcherSet::describe(const View&, ContentVisitor& visitor) const {
    visitor.beginList(rows);
    visitor.contents(cellContents());
    visitor.endList();
}

void SearcherSet::checkCells(const Record& record) const {
    reportMissingEntries(SearcherRecord(record).cells(), SearcherRecord::code);
}

void SearcherSet::visitCells(const Record&, FieldVisitor&) const {}

} // namespace velmora
