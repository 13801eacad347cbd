// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemMessage.h"
#include "Telephony/Drives/Modem/ModemReports.h"

#include <memory>

namespace velmora::modemReports {

using namespace records;

namespace {

/// What the SIM of a slot is beside its identities: a card, and the profile of an eUICC. Both are of test
/// networks.
struct TestSIM {
    const char* network;
    const char* name;
    int type; ///< MMSimType: physical or eUICC
};
constexpr TestSIM sims[] = {{"00101", "Test Network", 1}, {"00102", "Other Test Network", 2}};

Data group(std::uint8_t number) {
    return Data(std::vector<std::uint8_t>{0xA0, number});
}

void addSIM(Dictionary& account, int slot, const DriveIdentities& identities) {
    const TestSIM& sim = sims[slot - 1];
    const DriveIdentities::SIM& identity = identities.sims[static_cast<std::size_t>(slot - 1)];
    account.set(kSimFile_ICCID, identity.iccid);
    account.set(kVoxSIMIMSI, identity.imsi);
    const ArrayRef numbers = makeArray();
    numbers->append(withoutSpaces(identity.number));
    account.set(kSimFile_MSISDN, Value(numbers));
    if (sim.type == 2)
        account.set(kVoxSIMEID, identities.eid);
    account.set(kVoxSIMOperatorCode, sim.network);
    account.set(kVoxSIMOperatorName, sim.name);
    account.set(kVoxSIMGroup1, group(1));
    account.set(kVoxSIMGroup2, group(2));
    const ArrayRef emergency = makeArray();
    for (const char* each : {"112", "911"})
        emergency->append(each);
    account.set(kVoxSIMEmergencyNumbers, Value(emergency));
    const ArrayRef networks = makeArray();
    for (const TestSIM& each : sims)
        networks->append(std::make_shared<Dictionary>(Dictionary{
            {std::string(kVoxSIMOperatorCode), each.network},
            {std::string(kVoxLinkAccessTechnologies), each.type == 1 ? 1 << 14 | 1 << 5 : 1 << 14},
        }));
    account.set(kVoxSIMPreferredNetworks, Value(networks));
    account.set(kVoxSIMType, sim.type);
}

/// What is known of a slot's SIM is its ICCID, unless it is locked, and of the active one its network.
Value slots(const ModemPhone& phone) {
    const ArrayRef list = makeArray();
    for (int number = 1; number <= 2; ++number) {
        const TestSIM& sim = sims[number - 1];
        const bool isActive = number == phone.slot;
        const bool hasSIM = !(isActive && phone.isSIMMissing);
        const auto slot = std::make_shared<Dictionary>();
        slot->set(kVoxSIMSlotNumber, number);
        slot->set(kVoxSIMSlotIsActive, isActive);
        slot->set(kVoxSIMSlotHasSIM, hasSIM);
        if (hasSIM && !(isActive && phone.isLocked)) {
            slot->set(kSimFile_ICCID, phone.identities.sims[static_cast<std::size_t>(number - 1)].iccid);
            slot->set(kVoxSIMOperatorName, sim.name);
            slot->set(kVoxSIMOperatorCode, sim.network);
        }
        list->append(Value(slot));
    }
    return Value(list);
}

} // namespace

std::optional<RecordBuilder> sim(ModemReportContext& context) {
    const ModemPhone& phone = context.phone;
    const DictionaryRef account = modemAccount(phone);
    if (phone.isPresent()) {
        if (!phone.isLocked && !phone.isSIMMissing)
            addSIM(*account, phone.slot, phone.identities);
        account->set(kVoxSIMSlots, slots(phone));
    }
    return modemMessage(LiveModemCode::sim, account);
}

} // namespace velmora::modemReports
