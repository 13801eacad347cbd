// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/PDPContextList.h"

#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr View contextViews[] = {{ExtraCode::packetDataContexts, std::size_t{0}}};
// As the telephony service reports them.
constexpr List contextList{"", List::Entries::Values, ""};
constexpr Field context{"", computed, plainText()};

} // namespace

std::span<const View> PDPContextList::views() const {
    return contextViews;
}

void PDPContextList::trace() const {
    logLine(LogPriority::Warning, "PDPContextList");
}

void PDPContextList::updateWithData(const Data& data, std::uint32_t) {
    trace();
    const ContextListReader reader(data, _payloads);
    if (reader.contexts().asArray())
        keep(contextViews[0], Record(Bytes()), 1, [this, &reader] { _contexts = reader.contexts(); });
}

void PDPContextList::decode(const View&, const Record&, FieldVisitor& visitor) const {
    visitor.beginList(contextList);
    for (const Value& each : *_contexts.asArray())
        visitor.supplied(context, each);
    visitor.endList();
}

} // namespace velmora
