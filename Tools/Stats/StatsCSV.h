// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Stats/StatsOptions.h"
#include "Tools/Stats/StatsWriter.h"
#include "Tools/Text/TextBuffer.h"

namespace velmora {

class Output;

/// Comma-separated values: a row for the numbers of each role and field, and one for each value of a state.
class StatsCSV final : public StatsWriter {
public:
    /// All must outlive it.
    StatsCSV(Output& output, const StatsOptions& options) : _output(output), _options(options) {}
    void begin() override;
    void write(const GroupStatistics& group) override;

private:
    struct Place {
        std::string_view technology;
        std::string_view path;
        std::string_view role;
        Unit unit = Unit::None;
    };

    void beginRow(const Place& place);
    void writeNumbers(const Place& place, const ValueCounts& numbers, std::uint64_t absent);
    void writeStates(const Place& place, const LeafStatistics& leaf);
    void appendCell(std::string_view text);
    void appendCell(const std::optional<double>& number);
    void appendCell(std::uint64_t count);

    Output& _output;
    const StatsOptions& _options;
    std::string _group; ///< the cells of the group that is being written
    TextBuffer _rows;
};

} // namespace velmora
