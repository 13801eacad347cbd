// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Stats/StatsOptions.h"
#include "Tools/Stats/StatsWriter.h"

namespace velmora {

class Output;

/// An object for each group, which conforms to velmora-log-stats.schema.json, indented and with a line feed
/// at its end.
class StatsJSON final : public StatsWriter {
public:
    /// All must outlive it.
    StatsJSON(Output& output, const StatsOptions& options) : _output(output), _options(options) {}
    void write(const GroupStatistics& group) override;

private:
    Output& _output;
    const StatsOptions& _options;
};

} // namespace velmora
