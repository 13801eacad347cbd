// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/MessageSelection.h"

#include "LogMessages/LogMessage.h"

#include <algorithm>

namespace velmora {

bool MessageFilter::hasCode(const LoggedMessage& message) const {
    const std::optional<LogMessage> parsed = LogMessage::parse(message.message.bytes());
    if (!parsed || (parsed->type != LogMessage::basebandType && parsed->type != LogMessage::extraType))
        return false;
    const std::vector<std::uint32_t>& codes = _selection.codes;
    return std::find(codes.begin(), codes.end(), parsed->logCode()) != codes.end();
}

} // namespace velmora
