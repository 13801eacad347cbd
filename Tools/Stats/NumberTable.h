// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/ValueCounts.h"
#include "LogGenerator/Fields/Unit.h"
#include "Tools/Text/TextTable.h"

#include <cstdint>
#include <string>

namespace velmora {

/// A table of numbers' figures for people, and their histograms below.
class NumberTable {
public:
    /// `title`: of the first column.
    NumberTable(const std::string& title, bool hasHistograms);

    void add(const std::string& name, Unit unit, const ValueCounts& numbers, std::uint64_t absent);
    [[nodiscard]] bool isEmpty() const { return _isEmpty; }
    [[nodiscard]] std::string text() const;

private:
    TextTable _table;
    bool _hasHistograms;
    bool _isEmpty = true;
    std::string _histograms;
};

} // namespace velmora
