// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/PDPContextList.h"

#include "LogMessages/LogMessage.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// As the telephony service reports them: dictionaries whose labels and texts are its own. These are the ones
// that are known; further ones are shown too.
constexpr Field context{"", computed, plainText()};
constexpr Meaning address{.identity = Identity::Address};
constexpr Field knownFields[] = {
    {"Context ID", computed, plainText()},
    {"NSAPI", computed, plainText(), {.clause = "3GPP TS 24.008 10.5.6.2"}},
    {"APN", computed, plainText(), {.clause = "3GPP TS 23.003 9"}},
    {"PDP Type", computed, plainText(), {.clause = "3GPP TS 24.008 10.5.6.4"}},
    {"PDP Address", computed, plainText(), address},
    {"Primary DNS", computed, plainText(), address},
    {"Secondary DNS", computed, plainText(), address},
    {"QoS Traffic Class", computed, plainText(), {.clause = "3GPP TS 24.008 10.5.6.5"}},
    {"Maximum Bit Rate Uplink", computed, plainText(), {.clause = "3GPP TS 24.008 10.5.6.5"}},
    {"Maximum Bit Rate Downlink", computed, plainText(), {.clause = "3GPP TS 24.008 10.5.6.5"}},
};
constexpr Content contextContents[] = {context, knownFields};
constexpr std::string_view contextKeys[] = {"Context ID"};
constexpr List contextList{"", List::Entries::Values, "", contextContents, contextKeys, true};
constexpr Content contents[] = {contextList};
constexpr View contextViews[] = {{ExtraCode::packetDataContexts, 0, contents}};

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
    if (!reader.contexts().asArray())
        observeDamage(Damage::Unreadable);
    else
        keep(contextViews[0], Record(Bytes()), 1, [this, &reader] { _contexts = reader.contexts(); });
}

void PDPContextList::decode(const View&, const Record&, FieldVisitor& visitor) const {
    visitor.beginList(contextList);
    for (const Value& each : *_contexts.asArray())
        visitor.supplied(context, each);
    visitor.endList();
}

} // namespace velmora
