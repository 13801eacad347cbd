// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Playback/PlayedPicture.h"

#include <string_view>

namespace velmora {

/// What is made of the messages while an index reads them. It observes the index's decoder by itself and gets
/// here what no decoder observes.
class IndexPass {
public:
    virtual ~IndexPass() = default;

    /// A message of that time could not be decoded.
    virtual void undecoded(Time arrival) = 0;
    /// The recording has this comment on the latest message.
    virtual void noted(std::string_view text) = 0;
    /// A part of the file before the next message could not be read, or its end.
    virtual void damaged(std::string_view reason) = 0;
    /// There are no more messages.
    virtual void finished() = 0;
    /// What is known of the radio network after the latest message, for a checkpoint.
    [[nodiscard]] virtual PlayedPicture::Memory memory() const = 0;
};

} // namespace velmora
