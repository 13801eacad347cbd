// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventsCommand.h"

#include "Tools/Events/FileEvents.h"
#include "Tools/Events/LiveEvents.h"
#include "Tools/Output.h"
#include "Tools/ServiceClient.h"

namespace velmora {

int runEvents(const EventsOptions& given, DecoderLines& lines, Output& output) {
    EventsOptions options = given;
    if (options.files.empty()) {
        options.isLive = true;
        ServiceClient client;
        return LiveEvents(options, lines, client, output).run();
    }
    return listFileEvents(options, lines, output);
}

} // namespace velmora
