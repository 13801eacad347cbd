// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/IntraFrequencyList.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

constexpr View sectionViews[] = {{IntraFrequencyRecord::code, IntraFrequencyRecord::minimumLength}};
constexpr List rows{};

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

} // namespace velmora
