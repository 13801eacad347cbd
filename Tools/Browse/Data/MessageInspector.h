// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Tools/Browse/Data/BrowsedFile.h"
#include "Tools/Browse/Data/FieldPlaces.h"
#include "Tools/Browse/Data/InspectedMessage.h"
#include "Tools/Browse/Data/MessageCursor.h"
#include "Tools/Browse/Data/PositionedDecoder.h"
#include "Tools/Browse/Data/ProbedPlaces.h"

#include <chrono>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// Takes messages of a file apart: the values that each reports and where they lie in it, and the display
/// after it. Decodes from the index's checkpoint before the message, or on from the one before. Main thread
/// only.
class MessageInspector final : private ObservationSink {
public:
    /// What was last reported longer ago counts as old.
    static constexpr std::chrono::seconds oldAge{10};

    /// The file must outlive it.
    explicit MessageInspector(const BrowsedFile& file)
        : _file(file), _cursor(file), _probed(file.index().technology()), _decoder(file, *this) {}

    /// Null where the message cannot be read (see `failure`). Valid until the next call.
    [[nodiscard]] const InspectedMessage* inspect(std::uint64_t position);
    [[nodiscard]] const std::string& failure() const { return _failure; }

private:
    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    [[nodiscard]] bool begin(std::uint64_t position);
    [[nodiscard]] bool takeNext();
    void addAges();
    /// `places`: of the fields of the message that is being taken apart.
    [[nodiscard]] std::optional<FieldPlace> placeOf(const Observation& observation,
                                                    const FieldPlaces& places) const;

    const BrowsedFile& _file;
    MessageCursor _cursor;
    ProbedPlaces _probed;
    PositionedDecoder _decoder;
    std::vector<Time> _latest; ///< by index of the leaf; the beginning for none since then
    bool _isWanted = false;    ///< the message that is being decoded is the one to be taken apart
    InspectedMessage _inspected;
    bool _hasInspected = false;
    ObservedText _text;
    std::string _failure;
};

} // namespace velmora
