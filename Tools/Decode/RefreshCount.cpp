// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/RefreshCount.h"

#include "Recording/Refreshes/Refreshes.h"

namespace velmora {

std::uint64_t countRefreshes(MessageReader& reader, const MessageSelection& messages,
                             std::optional<std::uint32_t> technology) {
    Refreshes refreshes;
    MessageFilter filter(messages);
    if (technology) {
        reader.setReadsAllTechnologies(true);
        filter.setTechnology(*technology);
    }
    for (;;) {
        const std::optional<LoggedMessage> message = reader.next();
        if (!message)
            break;
        if (!filter.passes(*message)) {
            if (refreshes.afterSkipped(*message))
                refreshes.done();
            continue;
        }
        if (refreshes.before(*message))
            refreshes.done();
        if (refreshes.after(*message))
            refreshes.done();
    }
    if (refreshes.last())
        refreshes.done();
    return refreshes.count();
}

} // namespace velmora
