// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Drive/DriveSamples.h"
#include "Toolkit/Charts/ChartPanel.h"
#include "Toolkit/Charts/SampleStore.h"

#include <array>
#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

namespace velmora {

/// The samples of a drive in bounded memory, as charts draw them.
class DriveHistory final : public DriveSamples {
public:
    /// A value that is not reported again counts for so long; that of a pinned row, which may change seldom,
    /// for longer.
    static constexpr std::chrono::seconds valueLifetime{10};
    static constexpr std::chrono::seconds pinnedLifetime{60};
    /// The oldest bands of more are forgotten.
    static constexpr std::size_t mostBands = 2000;

    DriveHistory();

    void sample(std::size_t series, Time time, double value) override;
    void changed(Time time, std::optional<RadioTechnology> technology,
                 std::optional<RadioMode> mode) override;
    void forgetAll() override;
    void pinned(const DriveSeries& series) override;
    void unpinned(std::size_t series) override;

    [[nodiscard]] std::size_t count() const { return _series.size(); }
    /// The samples of a series. Precondition: there is one of that number.
    [[nodiscard]] const std::shared_ptr<SampleRing>& ring(std::size_t series) const {
        return _series[series].ring;
    }
    /// How many decimals its values have so far, at most two.
    [[nodiscard]] int decimals(std::size_t series) const { return _series[series].decimals; }
    /// Of radio technologies, and of states.
    [[nodiscard]] std::vector<ChartBand> bands() const;
    /// Changes with the bands.
    [[nodiscard]] std::uint64_t bandsRevision() const { return _bandsRevision; }

private:
    struct Series {
        std::shared_ptr<SampleRing> ring;
        int decimals = 0;
    };

    void changeBand(std::size_t lane, std::int64_t time_ns, std::string_view label, ChartColor color);

    SampleStore _store;
    std::vector<Series> _series;
    std::array<std::vector<ChartBand>, 2> _bands;
    std::uint64_t _bandsRevision = 0;
};

[[nodiscard]] inline std::int64_t nanosecondsOf(Time time) {
    return time.time_since_epoch().count();
}

} // namespace velmora
