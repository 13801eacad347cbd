// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/LTE/Records.h"

namespace velmora {

/// A list of cells that connected mode knows on the serving frequency, one row each; each record of the
/// intra-frequency measurement replaces it.
class IntraFrequencyList : public Base {
public:
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const final { return {0xB179}; }
    void updateWithData(const Data& data, std::uint32_t logCode) final;

protected:
    using Cells = const CountedList& (LTE::IntraFrequencyRecord::*)() const;

    /// Which of the record's lists, and the table of its entries, which must be a constant.
    IntraFrequencyList(Cells cells, const Layout& cell) : _cells(cells), _cell(cell) {}

private:
    Cells _cells;
    const Layout& _cell;
};

} // namespace velmora
