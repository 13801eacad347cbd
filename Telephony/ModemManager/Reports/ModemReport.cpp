// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/Reports/ModemReport.h"

#include "LogMessages/LiveModem.h"
#include "Telephony/ModemManager/Bus/ModemManagerNames.h"
#include "Telephony/ModemManager/Members/MemberTable.h"
#include "Telephony/ModemManager/Reports/ModemState.h"

#include <charconv>
#include <cstdint>

namespace velmora {
namespace {

/// The dictionary of Modem.Signal for a technology, its rows of the table, and the key of its levels.
struct SignalKind {
    std::string_view member;
    MemberOf of;
    std::string_view key;
};
constexpr SignalKind signalKinds[] = {
    {"Gsm", MemberOf::GSMSignal, kVoxLinkGSM},    {"Umts", MemberOf::UMTSSignal, kVoxLinkUMTS},
    {"Lte", MemberOf::LTESignal, kVoxLinkLTE},    {"Nr5g", MemberOf::NRSignal, kVoxLinkNR},
    {"Cdma", MemberOf::CDMASignal, kVoxLinkCDMA}, {"Evdo", MemberOf::EVDOSignal, kVoxLinkEVDO},
};

/// Sets the key to the dictionary unless that is empty.
void setDictionary(Dictionary& target, std::string_view key, const DictionaryRef& dictionary) {
    if (!dictionary->empty())
        target.set(key, dictionary);
}

void setAddresses(Dictionary& context, std::string_view key, MemberOf of, const Value& configuration) {
    const DictionaryRef addresses = makeDictionary();
    setKeys(*addresses, MemberUse::Addresses, of, configuration);
    setDictionary(context, key, addresses);
}

DictionaryRef slotOf(const ModemPart& sim, std::int64_t number, std::int64_t active) {
    DictionaryRef slot = makeDictionary();
    slot->set(kVoxSIMSlotNumber, number);
    slot->set(kVoxSIMSlotIsActive, number == active);
    slot->set(kVoxSIMSlotHasSIM, !sim.path.empty());
    if (sim.properties)
        setKeys(*slot, MemberUse::Slot, MemberOf::SIM, *sim.properties);
    return slot;
}

DictionaryRef contextOf(const ModemPart& bearer) {
    DictionaryRef context = makeDictionary();
    if (Value number = numberOfPath(bearer.path); !number.isNone())
        context->set(kVoxContextBearer, std::move(number));
    if (!bearer.properties)
        return context;
    const Dictionary& properties = *bearer.properties;
    setKeys(*context, MemberUse::Context, MemberOf::Bearer, properties);
    setKeys(*context, MemberUse::Context, MemberOf::BearerProperties, properties["Properties"]);
    // What the statistics and the configuration say of a connection that has ended is of the past.
    if (!(properties["Connected"] == Value(true)))
        return context;
    setKeys(*context, MemberUse::Context, MemberOf::Statistics, properties["Stats"]);
    setAddresses(*context, kVoxContextIPv4, MemberOf::IPv4, properties["Ip4Config"]);
    setAddresses(*context, kVoxContextIPv6, MemberOf::IPv6, properties["Ip6Config"]);
    return context;
}

} // namespace

Value numberOfPath(std::string_view path) {
    path.remove_prefix(path.rfind('/') + 1);
    std::uint32_t number = 0;
    const char* end = path.data() + path.size();
    const auto [stop, error] = std::from_chars(path.data(), end, number);
    return error == std::errc() && stop == end ? Value(number) : Value();
}

DictionaryRef registrationReportOf(const Modem& modem) {
    DictionaryRef root = rootOf(modem);
    setKeys(*root, MemberUse::Registration, MemberOf::Modem3gpp, modem[mm::modem3gpp]);
    setKeys(*root, MemberUse::Registration, MemberOf::ModemCdma, modem[mm::modemCdma]);
    return root;
}

DictionaryRef linkReportOf(const Modem& modem) {
    DictionaryRef root = rootOf(modem);
    setKeys(*root, MemberUse::Link, MemberOf::Modem, modem[mm::modem]);
    for (const SignalKind& kind : signalKinds) {
        const DictionaryRef levels = makeDictionary();
        setKeys(*levels, MemberUse::Levels, kind.of, modem[mm::signal][kind.member]);
        setDictionary(*root, kind.key, levels);
    }
    return root;
}

DictionaryRef modemReportOf(const Modem& modem, const Value& manager) {
    DictionaryRef root = rootOf(modem);
    root->set(kVoxModemIndex, modem.index);
    setKeys(*root, MemberUse::Modem, MemberOf::Modem, modem[mm::modem]);
    setKeys(*root, MemberUse::Modem, MemberOf::Manager, manager);
    return root;
}

DictionaryRef simReportOf(const Modem& modem, const ModemPart& sim, const std::vector<ModemPart>& inSlots,
                          std::string_view reason) {
    DictionaryRef root = rootOf(modem, reason);
    if (sim.properties)
        setKeys(*root, MemberUse::SIM, MemberOf::SIM, *sim.properties);
    if (!sim.path.empty())
        setKeys(*root, MemberUse::SIM, MemberOf::Modem, modem[mm::modem]);
    if (inSlots.size() < 2)
        return root;
    const std::int64_t* active = modem[mm::modem]["PrimarySimSlot"].asInteger();
    const ArrayRef list = makeArray();
    for (std::size_t i = 0; i < inSlots.size(); ++i)
        list->append(slotOf(inSlots[i], static_cast<std::int64_t>(i + 1), active ? *active : 0));
    root->set(kVoxSIMSlots, list);
    return root;
}

DictionaryRef contextReportOf(const Modem& modem, const std::vector<ModemPart>& bearers,
                              std::string_view reason) {
    DictionaryRef root = rootOf(modem, reason);
    const ArrayRef contexts = makeArray();
    for (const ModemPart& each : bearers)
        contexts->append(contextOf(each));
    root->set(kVoxContexts, contexts);
    return root;
}

} // namespace velmora
