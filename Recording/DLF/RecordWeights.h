// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>

namespace velmora {

/// The evidence of each trait that a record begins at an offset, in bits: log2 of how much more often a
/// record has the trait than other bytes have it. The thresholds are sums of these.
/// Documentation/record-chain.md derives the values and says how to measure their error rates.
struct RecordWeights {
    int type = 7;           ///< a type byte of either stream
    int prefix = 8;         ///< the first byte of a prefix
    int wantedCode = 8;     ///< a log code that some decoder subscribes to
    int versionReport = 30; ///< code and length of a DLF log's version report
    int nearTimestamp = 20; ///< a time stamp within a day of a neighbouring record's
    int zeroAmongZeros =
        10;                 ///< a time stamp of 0 where the neighbours' are 0, or where there is no neighbour
    int zeroAmongTimes = 0; ///< a time stamp of 0 where the neighbours have times
    int farTimestamp = -4;  ///< a valid time stamp more than a day from a neighbouring record's
    int badTimestamp = -4;  ///< an invalid time stamp
    int endOfInput = 12;    ///< a record that ends where the input ends

    int goodFollower = 4; ///< least score at a record's end for the two to be linked
    int expected = 8;     ///< least score for a record where one is expected
    int sure = 20;        ///< least score, both ends together, for a record in the midst of damage

    /// The most that what follows a record can score. A version report has no framing that scores.
    [[nodiscard]] constexpr int mostOfFollower() const {
        const int time = std::max({nearTimestamp, zeroAmongZeros, zeroAmongTimes, 0});
        return std::max({type + prefix + time + wantedCode, time + versionReport, endOfInput});
    }
};

} // namespace velmora
