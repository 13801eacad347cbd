// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Stats/StatsOptions.h"
#include "Tools/Stats/StatsWriter.h"

namespace velmora {

class Output;

/// Tables for people, under a heading for each group where there are several.
class StatsText final : public StatsWriter {
public:
    /// All must outlive it.
    StatsText(Output& output, const StatsOptions& options) : _output(output), _options(options) {}
    void write(const GroupStatistics& group) override;

private:
    Output& _output;
    const StatsOptions& _options;
    bool _isFirst = true;
};

} // namespace velmora
