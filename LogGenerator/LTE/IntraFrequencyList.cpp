// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/IntraFrequencyList.h"

#include "LogGenerator/Observations/ContentVisitor.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

constexpr View sectionViews[] = {{IntraFrequencyRecord::code, IntraFrequencyRecord::minimumLength}};
constexpr std::string_view cellKeys[] = {"Physical Cell ID"};
constexpr List rows{.keys = cellKeys};

} // namespace

std::span<const View> IntraFrequencyList::views() const {
    return sectionViews;
}

void IntraFrequencyList::check(const View& view, const Record& record) const {
    const IntraFrequencyRecord measurement(record);
    reportMissingEntries((measurement.*_cells)(), view.code);
}

void IntraFrequencyList::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    const IntraFrequencyRecord measurement(record);
    visitor.rows(rows, (measurement.*_cells)(), _cell);
}

void IntraFrequencyList::describe(const View&, ContentVisitor& visitor) const {
    visitor.beginList(rows);
    visitor.fields(_cell.fields);
    visitor.endList();
}

} // namespace velmora
