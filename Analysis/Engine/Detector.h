// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"
#include "Analysis/MessageReport.h"

namespace velmora {

class RadioPicture;

/// Finds events of some kinds in what the messages of one technology report. It goes by the messages' times
/// alone, never by a timer, so that the same messages make the same events live and from a file.
class Detector {
public:
    virtual ~Detector() = default;

    /// Whether it uses what messages report of the leaf, beside the picture: what nothing uses is not in the
    /// reports. The default is that it uses all.
    [[nodiscard]] virtual bool wants(const CatalogueField& /*leaf*/) const { return true; }
    /// Called for every message, in order; `picture` includes it.
    virtual void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) = 0;
    /// What was known is not valid any more: messages are missing after `last`, or the clock jumped. What
    /// lasts ends there, without an end of its own.
    virtual void interrupt(Time last, EventSink& sink) = 0;
    /// The input has ended, with a message of that time. What lasts goes on beyond it. The default is that of
    /// an interruption.
    virtual void finish(Time last, EventSink& sink) { interrupt(last, sink); }
};

} // namespace velmora
