// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Tracks/PositionedReader.h"
#include "LogGenerator/Observations/Observation.h"
#include "Tools/Decode/Samples/LeafTexts.h"
#include "Tools/Decode/Samples/SelectedLeaves.h"
#include "Tools/Text/LineWriter.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// A writer of the values that each message reported, not of the display. Its lines are in the order of the
/// messages.
class SampleWriter : public LineWriter, private ObservationSink {
public:
    void setPositions(const PositionedReader& positions) override { _positions = &positions; }
    void didMakeDecoder(LogGenerator& decoder) override;
    void willConcern(const Decoded& decoded) override;
    void willDecode(const LoggedMessage& message) override;
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    void didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) override;
    void didRefresh(Time, const Decoded&) override {}

protected:
    /// What is kept of a technology of the file: leaves have their numbers in its catalogue alone.
    struct Technology {
        Technology(const DecodeOptions& options, LeafTexts::Form form)
            : selected(options.selection), leaves(options.selection, form, options.guard) {}

        std::string text; ///< the technology, as lines show it; empty where they do not
        SelectedLeaves selected;
        LeafTexts leaves;
        std::vector<std::vector<std::size_t>> columns; ///< by leaf and path
    };

    SampleWriter(Output& output, bool isLive, const DecodeOptions& options, LeafTexts::Form form);

    /// A message's observations.
    virtual void write(const ObservedMessage& message) = 0;
    /// The technology as lines show it.
    [[nodiscard]] virtual std::string textOf(const Decoded& decoded) const = 0;

    [[nodiscard]] const DecodeOptions& options() const { return _options; }
    /// That of the message.
    [[nodiscard]] Technology& technology() { return *_technology; }
    [[nodiscard]] std::uint64_t record() const { return _record; }
    /// Whether there are columns for positions, and the position of the message.
    [[nodiscard]] bool hasPositions() const { return _positions != nullptr; }
    [[nodiscard]] const std::optional<Position>& position() const { return _positions->position(); }
    /// The message's own time stamp as a time; absent where it has none or an invalid one.
    [[nodiscard]] static std::optional<Time> modemTime(const ObservedMessage& message);

private:
    void observed(const ObservedMessage& message) override {
        if (std::exchange(_isWanted, false))
            write(message);
    }

    const DecodeOptions& _options;
    const PositionedReader* _positions = nullptr; ///< null where they are not asked for
    LeafTexts::Form _form;
    std::map<std::string, Technology, std::less<>> _technologies; ///< by their short names
    Technology* _technology = nullptr;
    bool _isLive;
    bool _isWanted = false; ///< the message that is being decoded
    std::uint64_t _record = 0;
};

} // namespace velmora
