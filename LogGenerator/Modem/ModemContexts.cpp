// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemContexts.h"

#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/Enumerations.h"
#include "LogGenerator/Modem/Values/Masks.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View contextViews[] = {{LiveModemCode::contexts, std::size_t{0}}};

constexpr Range number{0, 0x7FFFFFFE};
constexpr Range known{1, 0x7FFFFFFE}; // 0: unknown
constexpr double bitsPerKilobit = 1000;
constexpr Range speed{1, 1e15};
constexpr Meaning address{.identity = Identity::Address};

constexpr ValueRow contextRows[] = {
    {kVoxContextBearer, {"Bearer", computed, integer("%d")}, number},
    {kVoxContextIsConnected, {"Connected", computed, flag("Yes", "No")}},
    {kVoxContextIsSuspended, {"Suspended", computed, flag("Yes", "No")}},
    {kVoxContextError, {"Error", computed, plainText()}},
    {kVoxContextType, {"Type", computed, text(bearerTypes)}, known},
    {kVoxContextProfile, {"Profile", computed, integer("%d")}, number},
    {kVoxContextAPN, {"APN", computed, plainText(), {.clause = "3GPP TS 23.003 9"}}},
    {.key = kVoxContextIPFamily, .field = {"IP Family", computed, plainText()}, .toText = addressFamilies},
    {kVoxContextInterface, {"Interface", computed, plainText()}},
    {kVoxContextDownlinkSpeed, {"Downlink Speed", computed, real("%.0f kbit/s")}, speed, bitsPerKilobit},
    {kVoxContextUplinkSpeed, {"Uplink Speed", computed, real("%.0f kbit/s")}, speed, bitsPerKilobit},
    {kVoxContextStart, {"Since (UTC)", computed, plainText()}},
};
constexpr ValueRow ipv4Rows[] = {
    {kVoxContextMethod, {"IPv4 Method", computed, text(addressMethods)}, known},
    {kVoxContextAddress, {"IPv4 Address", computed, plainText(), address}},
    {kVoxContextPrefix, {"IPv4 Prefix", computed, integer("%d")}, {0, 32}},
    {kVoxContextGateway, {"IPv4 Gateway", computed, plainText(), address}},
    {kVoxContextDNS, {"IPv4 DNS", computed, plainText(), address}},
    {kVoxContextMTU, {"IPv4 MTU", computed, integer("%d bytes")}, known},
};
constexpr ValueRow ipv6Rows[] = {
    {kVoxContextMethod, {"IPv6 Method", computed, text(addressMethods)}, known},
    {kVoxContextAddress, {"IPv6 Address", computed, plainText(), address}},
    {kVoxContextPrefix, {"IPv6 Prefix", computed, integer("%d")}, {0, 128}},
    {kVoxContextGateway, {"IPv6 Gateway", computed, plainText(), address}},
    {kVoxContextDNS, {"IPv6 DNS", computed, plainText(), address}},
    {kVoxContextMTU, {"IPv6 MTU", computed, integer("%d bytes")}, known},
};
constexpr std::string_view rowKeys[] = {"Bearer"};
constexpr List contextList{.label = "Contexts", .keys = rowKeys};

} // namespace

std::span<const View> ModemContexts::views() const {
    return contextViews;
}

std::string ModemContexts::stateOf(const Dictionary& message) const {
    return arrayIn(message, kVoxContexts).empty() ? "None" : workingState(message);
}

void ModemContexts::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitor.beginList(contextList);
    for (const Value& each : arrayIn(message, kVoxContexts)) {
        const Dictionary& context = dictionaryOf(each);
        visitor.beginRow();
        visitValues(context, contextRows, visitor);
        visitValues(dictionaryOf(context[kVoxContextIPv4]), ipv4Rows, visitor);
        visitValues(dictionaryOf(context[kVoxContextIPv6]), ipv6Rows, visitor);
        visitor.endRow();
    }
    visitor.endList();
}

void ModemContexts::describeShown(ContentVisitor& visitor) const {
    visitor.beginList(contextList);
    describeValues(contextRows, visitor);
    describeValues(ipv4Rows, visitor);
    describeValues(ipv6Rows, visitor);
    visitor.endList();
}

} // namespace velmora
