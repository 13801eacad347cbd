// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Fix.h"
#include "Recording/Positions/NMEASentence.h"
#include "Recording/Positions/PositionSentence.h"

#include <chrono>
#include <cstdint>
#include <optional>

namespace velmora {

/// Makes fixes of NMEA sentences. A receiver reports one fix in several sentences, which have the same time
/// of day: position and altitude in GGA or GNS, position, speed and course in RMC, position in GLL, the
/// error's estimate in GST, the dilution in GGA, GNS and GSA, speed and course in VTG. The talker does not
/// matter.
///
/// A fix has the arrival time of the first of its sentences with a position. There is none where any of them
/// says that the receiver had no fix, where none has a position, and where a checksum is wrong that sentence
/// does not count.
class FixAssembler {
public:
    /// The latest that a fix is complete after its first sentence.
    static constexpr std::chrono::milliseconds longestEpoch{900};

    /// Takes the next sentence. Returns the fix that is complete now, which is that of earlier sentences.
    [[nodiscard]] std::optional<Fix> add(const PositionSentence& sentence);
    /// Returns the fix of the sentences so far if it is complete at that time, by which no more of its
    /// sentences can come.
    [[nodiscard]] std::optional<Fix> completeAt(Time now);
    /// Returns the fix of the sentences so far.
    [[nodiscard]] std::optional<Fix> finish();
    /// The time of the fix that is being made; absent where no sentence with a position has come yet.
    [[nodiscard]] std::optional<Time> pending() const;

    /// How many times sentences that belong together have ended so far, with or without a fix.
    [[nodiscard]] std::uint64_t epochs() const { return _epochs; }
    /// Sentences so far, and those among them that were damaged.
    [[nodiscard]] std::uint64_t sentences() const { return _sentences; }
    [[nodiscard]] std::uint64_t damaged() const { return _damaged; }

private:
    /// The sentences of one fix.
    struct Epoch {
        Time first{}; ///< the arrival of its first sentence
        std::optional<std::chrono::nanoseconds> timeOfDay;
        Fix fix;
        bool isBegun = false;
        bool hasPosition = false;
        bool isOfBest = false; ///< the position is of GGA or GNS
        bool isInvalid = false;
    };

    void addGGA(const NMEASentence& sentence, Time time);
    void addGNS(const NMEASentence& sentence, Time time);
    void addRMC(const NMEASentence& sentence, Time time);
    void addGLL(const NMEASentence& sentence, Time time);
    void addGST(const NMEASentence& sentence);
    void addVTG(const NMEASentence& sentence);
    void addGSA(const NMEASentence& sentence);
    void addPosition(const NMEASentence& sentence, std::size_t at, Time time, bool isBest);

    Epoch _epoch;
    std::uint64_t _epochs = 0;
    std::uint64_t _sentences = 0;
    std::uint64_t _damaged = 0;
};

} // namespace velmora
