// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KReports.h"

#include <algorithm>
#include <cmath>

namespace velmora {

using namespace records;

namespace {

using Context = C2KReportContext;
using Report = std::optional<RecordBuilder>;

constexpr double activeSetWindow_dB = 8;

double received(const Context& context) {
    const auto& serving = context.phone.serving;
    return (serving ? context.network.received_dBm(serving->sector.sid) : -106) +
           0.5 * context.random.normal();
}

/// Open loop: what is received and what is sent add up to about -76 dBm, within the transmitter's range.
double sent(const Context& context, double received_dBm) {
    return std::clamp(-76 - received_dBm + context.random.normal(), -50.0, 23.0);
}

Report fingers(Context& context) {
    if (context.phone.evdo == EVDOState::Inactive)
        return std::nullopt;
    if (context.phone.evdo == EVDOState::Acquisition)
        return evdoFingers({}); // none assigned yet
    return evdoFingers(context.activeSet(3));
}

Report evdoPilots(Context& context) {
    if (context.phone.evdo < EVDOState::Sync)
        return std::nullopt;
    return evdoActiveSet(context.activeSet(context.phone.onPacketData() ? 3 : 1));
}

Report frame(Context& context) {
    if (!context.phone.inTraffic() || !context.phone.serving)
        return std::nullopt;
    // About one in a hundred at -10 dB, and more the weaker the pilots are.
    double best_dB = -31;
    for (const C2KPilot& pilot : context.activeSet(3))
        best_dB = std::max(best_dB, pilot.ecio_dB);
    context.isFrameErased =
        context.random.chance(std::clamp(0.01 * std::exp(0.7 * (-10 - best_dB)), 0.003, 0.3));
    return trafficFrame(context.isFrameErased);
}

std::int64_t second(const Context& context) {
    return static_cast<std::int64_t>(context.now);
}

Report forwardRate(Context& context) {
    if (context.phone.evdo < EVDOState::Idle)
        return std::nullopt;
    return forwardPackets(second(context), context.forward);
}

Report reverseRate(Context& context) {
    if (context.phone.evdo < EVDOState::Idle)
        return std::nullopt;
    return reversePackets(second(context), context.reverse);
}

/// A record of the modem whose code no client requests.
Report foreignRecord(Context& context) {
    RecordBuilder record(0x1376, 13);
    for (std::size_t i = 0; i < 12; ++i)
        record.u8(13 + i, context.random.between(0, 255));
    return record;
}

constexpr C2KReport reports[] = {
    {0.96, evdoStatusReport}, {0.48, evdoPilots}, {0.48, fingers},    {0.96, oneXStatusReport}, {0.1, frame},
    {5.04, systemReport},     {1.0, forwardRate}, {1.0, reverseRate}, {1.9, foreignRecord},
};

} // namespace

std::vector<C2KPilot> C2KReportContext::activeSet(std::size_t limit) const {
    std::vector<C2KPilot> set;
    if (!phone.serving || limit == 0)
        return set;
    set.push_back(*phone.serving);
    for (const C2KPilot& pilot : network.pilots())
        if (set.size() < limit && pilot.sector.sid == phone.serving->sector.sid &&
            pilot.sector.pnOffset != phone.serving->sector.pnOffset &&
            pilot.level_dBm >= phone.serving->level_dBm - activeSetWindow_dB)
            set.push_back(pilot);
    return set;
}

void C2KReportContext::transferUntil(double at) {
    const double seconds = at - now;
    now = at;
    if (!phone.serving || phone.evdo < EVDOState::Idle)
        return;
    // Idle, a control-channel capsule now and then. Connected, what the C/I allows, up to 2.4 Mbit/s.
    const double ci = std::pow(10.0, phone.serving->ci_dB / 10);
    const bool connected = phone.onPacketData();
    const double forward_bps =
        connected ? std::min(1.2288e6 * 0.5 * std::log2(1 + ci), 2.4576e6) * (0.6 + 0.3 * random.unit())
                  : 2048;
    const double reverse_bps = connected ? 38400 + 115200 * random.unit() : 0;
    forwardRest_bits += isStalled ? 0 : forward_bps * seconds;
    reverseRest_bits += reverse_bps * seconds;
    const auto take = [](double& rest_bits, int size, double share) {
        const auto packets = static_cast<std::int64_t>(rest_bits * share / size);
        rest_bits -= static_cast<double>(packets) * size;
        return packets;
    };
    if (connected && ci > 2)
        forward.of4096 += take(forwardRest_bits, 4096, 0.8);
    if (connected)
        forward.of2048 += take(forwardRest_bits, 2048, 0.5);
    forward.of1024 += take(forwardRest_bits, 1024, 1);
    reverse.of4096 += take(reverseRest_bits, 4096, 0.7);
    reverse.of1024 += take(reverseRest_bits, 1024, 0.8);
    reverse.of256 += take(reverseRest_bits, 256, 1);
}

Report oneXStatusReport(Context& context) {
    const C2KPhone& phone = context.phone;
    OneXStatusReport report;
    report.state = phone.oneX;
    // Between two pages the receiver sleeps.
    if (phone.oneX == OneXState::Paging && !phone.onPacketData() && context.random.chance(0.4))
        report.state = OneXState::SlottedSleep;
    context.receiver = report.state;
    if (phone.serving)
        report.serving = phone.serving->sector;
    report.received_dBm[0] = received(context);
    report.received_dBm[1] = received(context) - 2;
    report.sent_dBm = sent(context, report.received_dBm[0]);
    report.pilots = context.activeSet(phone.inTraffic() ? 3 : 1);
    return oneXStatus(report);
}

Report evdoStatusReport(Context& context) {
    const C2KPhone& phone = context.phone;
    EVDOStatusReport report;
    report.state = phone.evdo;
    report.session = phone.session;
    report.uati = phone.uati;
    if (phone.serving && phone.evdo >= EVDOState::Sync)
        report.serving = phone.serving->sector;
    report.received_dBm[0] = received(context);
    report.received_dBm[1] = received(context) - 3;
    report.sent_dBm = sent(context, report.received_dBm[0]);
    return evdoStatus(report);
}

Report systemReport(Context& context) {
    const C2KPhone& phone = context.phone;
    if (phone.oneX == OneXState::Inactive)
        return std::nullopt;
    if (!phone.serving)
        return systemIdentification(std::nullopt, 0);
    const bool home = phone.serving->sector.sid == C2KNetwork::homeSID;
    return systemIdentification(phone.serving->sector, home ? 0 : 2);
}

UnusualMessageParts c2kUnusualMessageParts(Context& context, std::size_t turn) {
    const auto shortened = [&]() -> RecordBuilder {
        switch (turn % 7) {
        case 0: return systemIdentification(std::nullopt, 0).cutTo(150);
        case 1: return evdoStatusReport(context)->cutTo(49);
        case 2: return evdoFingers({}).cutTo(22);
        case 3: return forwardPackets(second(context), context.forward).cutTo(240);
        case 4: return oneXStatusReport(context)->cutTo(16);
        // Long enough by its least length, but it ends before the base station id.
        case 5: return systemReport(context).value_or(systemIdentification(std::nullopt, 0)).cutTo(180);
        default: return reversePackets(second(context), context.reverse).cutTo(1749);
        }
    };
    const auto inconsistent = [&]() -> Report {
        switch (turn % 4) {
        case 0: return evdoActiveSet(context.activeSet(2)).u8(15, 8); // pilots that are not there
        case 1: return evdoFingers(context.activeSet(3)).u8(22, 7);   // one finger more than there is
        case 2: return oneXStatusReport(context)->u8(14, 3);          // one sub-packet less than is needed
        default: return oneXStatusReport(context)->u16(27, 0x4000);   // a sub-packet of sixteen kilobytes
        }
    };
    return {*evdoStatusReport(context), shortened(), inconsistent(), context.random.between(0, 1 << 20)};
}

std::span<const C2KReport> c2kReports() {
    return reports;
}

} // namespace velmora
