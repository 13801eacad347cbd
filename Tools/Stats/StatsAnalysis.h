// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/TechnologyStatistics.h"
#include "Tools/Analysed/AnalysisFeed.h"
#include "Tools/Messages/TimeRange.h"

namespace velmora {

/// The statistics of a technology, of the messages in a range of times.
class StatsAnalysis final : public MessageAnalysis {
public:
    /// `feed` is the one that passes the messages, and is used from the first one on. All must outlive it.
    StatsAnalysis(const Catalogue& catalogue, StatisticsGroups& groups, const TimeRange& range,
                  const AnalysisFeed& feed)
        : _statistics(catalogue, groups), _range(range), _feed(feed) {}

    void report(const MessageReport& report) override;
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _statistics.wants(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    void reportLoss(const InputLoss&) override { _statistics.interrupt(); }
    void finish() override { _statistics.finish(); }

private:
    TechnologyStatistics _statistics;
    const TimeRange& _range;
    const AnalysisFeed& _feed;
    bool _hasBegun = false;
};

} // namespace velmora
