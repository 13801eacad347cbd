// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"

namespace velmora {

/// One of the UMTS searcher's four cell sets: a list that each record of the searcher replaces. A set that
/// does not override `showCells` is never given a cell: it empties its list, and that is meant.
class SearcherSet : public Base {
public:
    [[nodiscard]] std::vector<std::uint32_t> getLogCodeArray() const final { return {0x417A}; }
    void updateWithData(const Data& data, std::uint32_t logCode) final;

protected:
    /// What the set calls itself in the log.
    [[nodiscard]] virtual std::string_view traceName() const = 0;
    /// Fills the list, which is empty, and tells of entries that the record lacks. Precondition: the record
    /// has its minimum length.
    virtual void showCells(const Record& record, std::uint32_t logCode);
};

} // namespace velmora
