// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/PDPContextList.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "Platform/SystemLog.h"

namespace velmora {

void PDPContextList::updateWithData(const Data& data, std::uint32_t) {
    logLine(LogPriority::Warning, "PDPContextList");
    const ContextListReader reader(data, _payloads);
    if (const Array* contexts = reader.contexts())
        replaceElements(*contexts);
}

} // namespace velmora
