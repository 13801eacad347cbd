// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/Modem/ModemMessage.h"
#include "Telephony/Drives/Modem/ModemReports.h"

#include <chrono>
#include <memory>

namespace velmora::modemReports {

using namespace records;

namespace {

constexpr int staticMethod = 2; ///< MM_BEARER_IP_METHOD_STATIC
constexpr double leastInterval_s = 1;

const char* interfaceOf(const ModemBearer& bearer) {
    return bearer.isIPv6 ? "qmimux1" : "qmimux0";
}

Value addresses(bool isIPv6, int bearer, const DriveIdentities& identities) {
    const ArrayRef servers = makeArray();
    for (const char* each : {"53", "54"})
        servers->append((isIPv6 ? identities.addresses6 : identities.addresses) + each);
    const std::string& begin = isIPv6 ? identities.bearerAddresses6 : identities.bearerAddresses;
    const std::string number = std::to_string(16 + bearer);
    return Value(std::make_shared<Dictionary>(Dictionary{
        {std::string(kVoxContextMethod), staticMethod},
        {std::string(kVoxContextAddress), begin + number},
        {std::string(kVoxContextPrefix), isIPv6 ? 64 : 29},
        {std::string(kVoxContextGateway), begin + (isIPv6 ? "1" : "22")},
        {std::string(kVoxContextDNS), Value(servers)},
        {std::string(kVoxContextMTU), isIPv6 ? 1400 : 1500},
    }));
}

Value contextOf(const ModemBearer& bearer, const DriveIdentities& identities) {
    const auto context = std::make_shared<Dictionary>();
    context->set(kVoxContextBearer, bearer.number);
    context->set(kVoxContextIsConnected, bearer.isConnected);
    context->set(kVoxContextIsSuspended, bearer.isSuspended);
    context->set(kVoxContextType, 1); // MM_BEARER_TYPE_DEFAULT
    context->set(kVoxContextProfile, bearer.isIPv6 ? 2 : 1);
    context->set(kVoxContextAPN, bearer.isIPv6 ? "mms.test" : "internet.test");
    context->set(kVoxContextIPFamily, bearer.isIPv6 ? 2 : 4); // IPv6, both
    if (!bearer.error.empty())
        context->set(kVoxContextError, bearer.error);
    if (!bearer.isConnected)
        return Value(context);
    context->set(kVoxContextInterface, interfaceOf(bearer));
    context->set(kVoxContextUplinkSpeed, 50'000'000);
    context->set(kVoxContextDownlinkSpeed, 150'000'000);
    using namespace std::chrono;
    context->set(kVoxContextStart, Value(floor<seconds>(DriveScenario::startTime()) +
                                         seconds(static_cast<std::int64_t>(bearer.start_s))));
    if (!bearer.isIPv6)
        context->set(kVoxContextIPv4, addresses(false, bearer.number, identities));
    context->set(kVoxContextIPv6, addresses(true, bearer.number, identities));
    return Value(context);
}

Value trafficOf(ModemBearer& bearer, double now_s) {
    const ModemBearer::Answer answer{now_s, static_cast<std::int64_t>(bearer.received),
                                     static_cast<std::int64_t>(bearer.sent)};
    const auto row = std::make_shared<Dictionary>();
    row->set(kVoxTrafficBearer, bearer.number);
    row->set(kVoxTrafficInterface, interfaceOf(bearer));
    row->set(kVoxTrafficReceived, answer.received);
    row->set(kVoxTrafficSent, answer.sent);
    row->set(kVoxTrafficDuration, static_cast<std::int64_t>(now_s - bearer.start_s));
    if (!bearer.last) {
        bearer.last = answer;
        return Value(row);
    }
    // Two answers in a row say little of the rate.
    if (const double interval_s = now_s - bearer.last->at_s; interval_s >= leastInterval_s) {
        row->set(kVoxTrafficDownlinkRate,
                 8 * static_cast<double>(answer.received - bearer.last->received) / interval_s);
        row->set(kVoxTrafficUplinkRate,
                 8 * static_cast<double>(answer.sent - bearer.last->sent) / interval_s);
        row->set(kVoxTrafficInterval, interval_s);
        bearer.last = answer;
    }
    return Value(row);
}

} // namespace

std::optional<RecordBuilder> contexts(ModemReportContext& context) {
    const DictionaryRef account = modemAccount(context.phone);
    const ArrayRef list = makeArray();
    for (const ModemBearer& each : context.phone.bearers)
        list->append(contextOf(each, context.phone.identities));
    if (context.phone.isPresent())
        account->set(kVoxContexts, Value(list));
    return modemMessage(LiveModemCode::contexts, account);
}

std::optional<RecordBuilder> traffic(ModemReportContext& context) {
    const DictionaryRef account = modemAccount(context.phone);
    const ArrayRef list = makeArray();
    for (ModemBearer& each : context.phone.bearers)
        if (each.isConnected)
            list->append(trafficOf(each, context.now_s));
    if (context.phone.isPresent())
        account->set(kVoxTraffic, Value(list));
    return modemMessage(LiveModemCode::traffic, account);
}

} // namespace velmora::modemReports
