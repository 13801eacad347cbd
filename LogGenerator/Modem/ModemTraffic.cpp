// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemTraffic.h"

#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View trafficViews[] = {{LiveModemCode::traffic, std::size_t{0}}};

constexpr Range counter{0, 1.9e19}; // 64 bits
constexpr Range seconds{0, 1e10};
constexpr Range rate{0, 1e15}; // bit/s
constexpr double bitsPerKilobit = 1000;
constexpr Meaning rateMeaning{.role = Role::DataRate};

constexpr ValueRow trafficRows[] = {
    {kVoxTrafficBearer, {"Bearer", computed, integer("%d")}, {0, 0x7FFFFFFE}},
    {kVoxTrafficInterface, {"Interface", computed, plainText()}},
    {kVoxTrafficDownlinkRate,
     {"Downlink Rate", computed, real("%.1f kbit/s"), rateMeaning},
     rate,
     bitsPerKilobit},
    {kVoxTrafficUplinkRate,
     {"Uplink Rate", computed, real("%.1f kbit/s"), rateMeaning},
     rate,
     bitsPerKilobit},
    {kVoxTrafficInterval, {"Rates Are Over", computed, real("%.1f s")}, seconds},
    {kVoxTrafficReceived, {"Received", computed, real("%.0f bytes")}, counter},
    {kVoxTrafficSent, {"Sent", computed, real("%.0f bytes")}, counter},
    {kVoxTrafficDuration, {"Duration", computed, real("%.0f s")}, seconds},
};
constexpr std::string_view rowKeys[] = {"Bearer"};
constexpr List bearerList{.label = "Bearers", .keys = rowKeys};

} // namespace

std::span<const View> ModemTraffic::views() const {
    return trafficViews;
}

std::string ModemTraffic::stateOf(const Dictionary& message) const {
    return arrayIn(message, kVoxTraffic).empty() ? "None" : workingState(message);
}

void ModemTraffic::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitor.beginList(bearerList);
    for (const Value& each : arrayIn(message, kVoxTraffic)) {
        visitor.beginRow();
        visitValues(dictionaryOf(each), trafficRows, visitor);
        visitor.endRow();
    }
    visitor.endList();
}

void ModemTraffic::describeShown(ContentVisitor& visitor) const {
    visitor.beginList(bearerList);
    describeValues(trafficRows, visitor);
    visitor.endList();
}

} // namespace velmora
