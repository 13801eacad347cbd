// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Export/Masking/MessageMask.h"
#include "Tools/Events/EventListing.h"
#include "Tools/Events/EventsOptions.h"
#include "Tools/Log/DecoderLines.h"
#include "Tools/Output.h"
#include "Tools/Record/ServiceLink.h"
#include "Tools/ServiceClient.h"

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// Lists the events of what the telephony service sends until a signal, a limit or the reader ends it. Main
/// thread only.
class LiveEvents {
public:
    /// `mask` may be null, for messages as they are. All must outlive it.
    LiveEvents(const EventsOptions& options, const RuleSet& rules, DecoderLines& lines, ServiceClient& client,
               Output& output, MessageMask* mask);

    /// Runs the client's event loop. Returns the exit status.
    int run();

private:
    bool learn(std::string_view technology, bool hasDecoder);
    void take(const Data& message);
    void endWithSource();
    void check();
    void interrupt();
    void giveUp();
    void end(bool good);

    const EventsOptions& _options;
    DecoderLines& _lines;
    ServiceClient& _client;
    Output& _output;
    MessageMask* _mask;
    EventListing _listing;
    ServiceLink _link;
    TechnologyFeed* _technology = nullptr; ///< the service's; null before it has named one
    std::uint64_t _messages = 0;
    bool _isGood = true;
    bool _ended = false;
};

} // namespace velmora
