// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/GroupStatistics.h"

namespace velmora {

/// Writes statistics in some format, group by group.
class StatsWriter {
public:
    virtual ~StatsWriter() = default;

    virtual void begin() {}
    virtual void write(const GroupStatistics& group) = 0;
};

} // namespace velmora
