// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemCellReports.h"
#include "Telephony/Drives/Modem/ModemMessage.h"

#include <algorithm>
#include <memory>

namespace velmora::modemReports {
namespace {

using Radio = ModemCell::Radio;
using namespace records;

DictionaryRef levelsOf(const ModemCell& cell) {
    const auto levels = std::make_shared<Dictionary>();
    switch (cell.radio) {
    case Radio::GSM:
        levels->set(kVoxLinkRSSI, cell.level_dBm);
        levels->set(kVoxLinkErrorRate, cell.level_dBm < -95 ? 1.6 : 0.2);
        break;
    case Radio::UMTS:
        levels->set(kVoxLinkRSSI, cell.rssi_dBm);
        levels->set(kVoxLinkRSCP, cell.level_dBm);
        levels->set(kVoxLinkECIO, cell.quality_dB);
        break;
    case Radio::LTE: levels->set(kVoxLinkRSSI, cell.rssi_dBm); [[fallthrough]];
    case Radio::NR:
        levels->set(kVoxLinkRSRP, cell.level_dBm);
        levels->set(kVoxLinkRSRQ, cell.quality_dB);
        levels->set(kVoxLinkSINR, cell.sinr_dB.value_or(0));
        break;
    }
    return levels;
}

std::string_view linkKeyOf(Radio radio) {
    switch (radio) {
    case Radio::GSM: return kVoxLinkGSM;
    case Radio::UMTS: return kVoxLinkUMTS;
    case Radio::LTE: return kVoxLinkLTE;
    case Radio::NR: return kVoxLinkNR;
    }
    return {};
}

/// MMModemAccessTechnology's bits.
int accessTechnologiesOf(const ModemPhone& phone) {
    constexpr int gsm = 1 << 1, edge = 1 << 4, umts = 1 << 5, hspaPlus = 1 << 9, lte = 1 << 14, nr = 1 << 15;
    switch (phone.radio) {
    case Radio::GSM: return phone.isConnected() ? edge : gsm;
    case Radio::UMTS: return phone.isConnected() ? hspaPlus : umts;
    case Radio::LTE: return phone.secondary ? lte | nr : lte;
    case Radio::NR: return nr;
    }
    return 0;
}

/// Per cent of the way from the least to the best level of the technology.
int signalQualityOf(const ModemCell& cell) {
    const bool isRSRP = cell.radio == Radio::LTE || cell.radio == Radio::NR;
    const double least_dBm = isRSRP ? -125 : -113;
    const double best_dBm = isRSRP ? -75 : -51;
    return static_cast<int>(
        std::clamp(100 * (cell.level_dBm - least_dBm) / (best_dBm - least_dBm), 0.0, 100.0));
}

} // namespace

std::optional<RecordBuilder> link(ModemReportContext& context) {
    const ModemPhone& phone = context.phone;
    const DictionaryRef account = modemAccount(phone);
    if (!phone.isPresent())
        return modemMessage(LiveModemCode::link, account);
    account->set(kVoxLinkAccessTechnologies, phone.serving ? accessTechnologiesOf(phone) : 0);
    account->set(kVoxLinkSignalQuality, phone.serving ? signalQualityOf(*phone.serving) : 0);
    account->set(kVoxLinkIsRecent, phone.serving.has_value());
    for (const auto& cell : {phone.serving, phone.secondary})
        if (cell)
            account->set(linkKeyOf(cell->radio), Value(levelsOf(*cell)));
    return modemMessage(LiveModemCode::link, account);
}

} // namespace velmora::modemReports
