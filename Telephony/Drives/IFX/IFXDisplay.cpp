// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/IFX/IFXDisplay.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace velmora {
namespace {

using State = IFXPhone::State;

/// The least level at which a cell may be used, from which its path-loss criterion is counted.
constexpr int accessMinimum_dBm = -105;
constexpr std::size_t neighbourCount = 6;

DictionaryRef dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

std::string digits(int number, std::size_t width) {
    const std::string text = std::to_string(number);
    return text.size() < width ? std::string(width - text.size(), '0') + text : text;
}

std::string textOf(const PLMN& plmn) {
    return digits(plmn.mcc, 3) + "-" + digits(plmn.mnc, 2);
}

std::string decibels(int level_dBm) {
    return std::to_string(level_dBm) + " dBm";
}

const char* textOf(State state) {
    switch (state) {
    case State::Searching: return "Searching";
    case State::Limited: return "Limited Service";
    case State::Registering: return "Registering";
    case State::Idle: return "Idle";
    case State::Call: return "Call";
    case State::PacketSession: return "Packet Transfer";
    }
    return "";
}

bool registered(const IFXPhone& phone) {
    return phone.state >= State::Idle;
}

Value registration(const IFXPhone& phone) {
    // While there is no network the dictionary has one entry, which the decoder folds.
    const DictionaryRef node = dictionary({{"State", textOf(phone.state)}});
    if (!registered(phone))
        return node;
    const CellArea& area = phone.registeredArea;
    node->set("PLMN", textOf(area.plmn));
    node->set("LAC", std::to_string(area.lac));
    node->set("RAC", std::to_string(area.rac));
    // A chain of one-entry dictionaries.
    node->set("Network Name", dictionary({{"Full", dictionary({{"Text", "Test Network"}})}}));
    const ArrayRef equivalents = makeArray();
    equivalents->append(dictionary({{"PLMN", textOf(PLMN{1, area.plmn.mnc == 1 ? 2 : 1})}}));
    if (area.plmn.mnc == 2)
        equivalents->append(dictionary({{"PLMN", textOf(PLMN{111, 11})}}));
    node->set("Equivalent PLMNs", equivalents);
    return node;
}

DictionaryRef cell(const GSMMeasurement& measurement) {
    return dictionary({
        {"ARFCN", std::to_string(measurement.cell->arfcn)},
        {"Band", measurement.cell->arfcn < 512 ? "GSM 900" : "GSM 1800"},
        {"BSIC",
         std::to_string(measurement.cell->bsic / 8) + "-" + std::to_string(measurement.cell->bsic % 8)},
        {"RxLev", decibels(measurement.rssi_dBm)},
        {"C1", std::to_string(measurement.rssi_dBm - accessMinimum_dBm)},
    });
}

Value servingCell(const GSMMeasurement& measurement) {
    const DictionaryRef node = cell(measurement);
    // The 1800 layer is preferred by ten decibels.
    const int preference = measurement.cell->arfcn >= 512 ? 10 : 0;
    node->set("C2", std::to_string(measurement.rssi_dBm - accessMinimum_dBm + preference));
    node->set("Cell ID", std::to_string(measurement.cell->cellId));
    return node;
}

Value neighbours(const IFXPhone& phone, const RadioNetwork& network) {
    const ArrayRef rows = makeArray();
    for (const GSMMeasurement& each : network.gsm())
        if ((!phone.serving || each.cell != phone.serving->cell) && rows->size() < neighbourCount)
            rows->append(cell(each));
    return rows;
}

Value dedicatedChannel(const IFXPhone& phone) {
    if (phone.state != State::Call || !phone.serving)
        return dictionary({{"State", "None"}}); // shows as a text of its own
    const auto rxQual = [&phone](double share) {
        return std::to_string(std::clamp(static_cast<int>(std::lround(7 * phone.loss * share)), 0, 7));
    };
    return dictionary({
        {"Type", "TCH/F"},
        {"Codec", "EFR"},
        {"ARFCN", std::to_string(phone.serving->cell->arfcn)},
        {"Timeslot", std::to_string(1 + phone.serving->cell->cellId % 7)},
        {"RxQual Full", rxQual(1)},
        {"RxQual Sub", rxQual(0.7)},
        {"Duration", dictionary({{"Seconds", std::to_string(phone.callSeconds)}})},
    });
}

Value packetData(const IFXPhone& phone) {
    const ArrayRef contexts = makeArray();
    for (int number = 1; number <= phone.contexts; ++number)
        contexts->append(dictionary({
            {"Context ID", std::to_string(number)},
            {"APN", number == 1 ? "internet.test" : "mms.test"},
            {"Address", (number == 1 ? phone.identities.addresses : phone.identities.addresses6) + "17"},
        }));
    const DictionaryRef node = dictionary({{"Contexts", contexts}});
    if (phone.contexts > 0)
        node->set("Coding Scheme", "CS-" + std::to_string(1 + std::lround(3 * (1 - phone.loss))));
    return node;
}

} // namespace

Value ifxDisplay(const IFXPhone& phone, const RadioNetwork& network) {
    const DictionaryRef root = dictionary({{"Registration", registration(phone)}});
    if (phone.serving)
        root->set("Serving Cell", servingCell(*phone.serving));
    root->set("Neighbor Cells", neighbours(phone, network));
    root->set("Dedicated Channel", dedicatedChannel(phone));
    root->set("Packet Data", packetData(phone));
    root->set("SIM", dictionary({{"ICCID", phone.identities.sims[0].iccid}}));
    return root;
}

} // namespace velmora
