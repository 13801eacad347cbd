// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/RecordingChecks.h"
#include "Analysis/Events/EventSink.h"
#include "Analysis/Picture/PictureMemory.h"
#include "Analysis/Picture/RadioPicture.h"
#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Observation.h"

#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// What the messages before the moment have reported of the radio network, in the parts of a recording
/// between which a player jumps: it continues from a checkpoint as if all messages before that had been
/// observed. Main thread only.
class PlayedPicture final : public ObservationSink, private EventSink {
public:
    /// What a checkpoint keeps of it.
    struct Memory {
        PictureMemory picture;
        std::optional<Time> last;   ///< of the messages
        std::uint64_t messages = 0; ///< that have been observed
    };

    /// Observes the decoder from now on, which must outlive it. `memory`: null at the front.
    PlayedPicture(LogGenerator& decoder, const Memory* memory);
    ~PlayedPicture() override;
    PlayedPicture(const PlayedPicture&) = delete;
    PlayedPicture& operator=(const PlayedPicture&) = delete;

    [[nodiscard]] const RadioPicture& picture() const { return _picture; }

    /// A message of that time could not be decoded.
    void undecoded(Time arrival);
    /// Messages before the next one may be missing.
    void damaged() { _picture.clear(); }

    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _picture.wants(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return false; }

private:
    void happened(const Event& /*event*/) override {}
    void report(const ObservedMessage& message);
    /// A decoder that is new does not know what the display before its first message showed.
    void reportFirst(ObservedMessage message);

    LogGenerator& _decoder;
    RadioPicture _picture;
    RecordingChecks _checks;
    std::uint64_t _messages = 0;
    bool _isContinued;
};

} // namespace velmora
