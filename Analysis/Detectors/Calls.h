// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/Technologies/DetectorTable.h"

#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// Reports circuit-switched connections: that one is active, that it ended, or was lost, and that the phone
/// tries to re-establish it.
class CallsDetector final : public Detector {
public:
    CallsDetector(const Catalogue& catalogue, const DetectorTable& table);

    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    void interrupt(Time last, EventSink& sink) override;

private:
    enum class State : std::uint8_t { Unknown, None, Active, Reestablishing };
    /// A leaf that states whether there is a connection.
    struct Source {
        std::string_view path;
        bool isActive = false;
        bool isReestablishing = false;
        bool isKnown = false;
    };

    void update(const Observation& observation);
    [[nodiscard]] State stateOfAll() const;
    void change(State state, const MessageReport& report, const RadioPicture& picture, EventSink& sink);
    void end(const MessageReport& report, const RadioPicture& picture, EventSink& sink, bool isLost);

    std::span<const CallRow> _rows;
    std::vector<Source> _sources;
    LeafRows _leaves;
    State _state = State::Unknown;
    bool _hasLostRadio = false; ///< since the connection became active
    std::optional<Time> _since; ///< the connection has been active; absent where that was not seen
    MessageNumber _message;     ///< that reported the connection first
};

} // namespace velmora
