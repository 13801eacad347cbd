// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Playback/PlayedDecoder.h"
#include "Tools/Browse/Data/InspectedMessage.h"
#include "Tools/Browse/Data/ListScalars.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <memory>
#include <span>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

namespace velmora {

/// Finds where values lie that no table has a place for: those of property lists, and those that a decoder
/// computes from a record. Each value of the list, or byte of the record, is changed in a copy of the
/// message, and a decoder of its own reports the copy: what it reports otherwise depends on the change. A
/// value lies where a change affects it and least of all else; of several such places, as of a text that is
/// made of several, in the last one. Main thread only.
class ProbedPlaces final : private ObservationSink {
public:
    /// `technology`: its short name.
    explicit ProbedPlaces(std::string technology) : _technology(std::move(technology)) {}
    ~ProbedPlaces() override;
    ProbedPlaces(const ProbedPlaces&) = delete;
    ProbedPlaces& operator=(const ProbedPlaces&) = delete;

    /// Sets the places of the fields that have none. Messages that would take long are left as they are.
    void find(const LoggedMessage& message, std::span<ReportedField> fields);

private:
    /// A value by its place in the display, and what it is.
    struct Reported {
        std::uint64_t place;
        std::uint64_t value;
    };
    /// The smallest effect of a change that affects a value.
    struct Nearest {
        std::size_t effect = 0; ///< more for more values that it affects, 0 for none yet
        std::size_t begin = 0;
        std::size_t end = 0;
    };

    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    [[nodiscard]] bool decode(const LoggedMessage& message);
    void probe(const LoggedMessage& message, const ChangedBytes& change);
    void take(const ChangedBytes& change, std::size_t index, std::size_t effect);

    std::string _technology;
    std::unique_ptr<PlayedDecoder> _decoder;                 ///< null until it is needed
    std::vector<Reported> _reported;                         ///< of the latest message
    bool _isWhole = false;                                   ///< it was not damaged
    std::map<std::string, std::uint64_t>* _paths = nullptr;  ///< gets those of the latest message
    std::unordered_map<std::uint64_t, std::size_t> _indexes; ///< of the unchanged message's, by place
    std::vector<Reported> _unchanged;
    std::vector<Nearest> _nearest; ///< by index
};

} // namespace velmora
