// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/LTE/Records.h"

namespace velmora {

/// A list of cells that connected mode reports on the serving frequency, one row each; each record of the
/// intra-frequency measurement replaces it.
class IntraFrequencyList : public Base {
public:
    [[nodiscard]] std::span<const View> views() const final;
    void decode(const View& view, const Record& record, FieldVisitor& visitor) const final;
    void describe(const View& view, ContentVisitor& visitor) const final;

protected:
    using Cells = const CountedList& (LTE::IntraFrequencyRecord::*)() const;

    /// Which of the record's lists, and the table of its entries, which must be a constant.
    IntraFrequencyList(Cells cells, const Layout& cell) : _cells(cells), _cell(cell) {}

private:
    void check(const View& view, const Record& record) const final;

    Cells _cells;
    const Layout& _cell;
};

} // namespace velmora
