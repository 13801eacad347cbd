// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemReports.h"

#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/Modem/ModemCellReports.h"
#include "Telephony/Drives/Modem/ModemMessage.h"
#include "Telephony/Drives/Road/RoadPlace.h"

#include <chrono>
#include <cstdio>
#include <memory>

namespace velmora {

using namespace records;

namespace modemReports {
namespace {

Value texts(std::initializer_list<const char*> list) {
    const ArrayRef array = makeArray();
    for (const char* each : list)
        array->append(each);
    return Value(array);
}

const char* codeOf(const PLMN& plmn) {
    return plmn.mnc == 1 ? "00101" : "00102";
}

const char* nameOf(const PLMN& plmn) {
    return plmn.mnc == 1 ? "Test Network" : "Other Test Network";
}

} // namespace

std::optional<RecordBuilder> registration(ModemReportContext& context) {
    const ModemPhone& phone = context.phone;
    const DictionaryRef account = modemAccount(phone);
    if (!phone.isPresent())
        return modemMessage(LiveModemCode::registration, account);
    account->set(kVoxRegistrationState, static_cast<int>(phone.registration));
    if (phone.serving && phone.isRegistered()) {
        account->set(kVoxRegistrationPLMN, codeOf(phone.serving->area.plmn));
        account->set(kVoxRegistrationOperator, nameOf(phone.serving->area.plmn));
    }
    account->set(kVoxRegistrationPacketService, phone.isRegistered() ? 2 : 1); // attached, detached
    return modemMessage(LiveModemCode::registration, account);
}

std::optional<RecordBuilder> modem(ModemReportContext& context) {
    const ModemPhone& phone = context.phone;
    const DictionaryRef account = modemAccount(phone);
    if (!phone.isPresent())
        return modemMessage(LiveModemCode::modem, account);
    account->set(kVoxModemIndex, phone.index);
    account->set(kVoxModemManufacturer, "Test Maker");
    account->set(kVoxModemModel, "TM 5000");
    account->set(kVoxModemRevision, "01.02.03");
    account->set(kVoxModemHardware, "10000");
    account->set(kVoxModemEquipment, phone.identities.equipment);
    account->set(kVoxModemDevice, "/sys/devices/pci0000:00/0000:00:14.0/usb2/2-1");
    account->set(kVoxModemPlugin, "generic");
    account->set(kVoxModemPort, "cdc-wdm0");
    account->set(kVoxModemDrivers, texts({"option", "qmi_wwan"}));
    account->set(kVoxModemPowerState, phone.state >= MM::State::Enabling ? 3 : 2); // on, low
    account->set(kVoxModemCapabilities, 4 | 8 | 64);                               // GSM and UMTS, LTE, 5G
    account->set(kVoxModemManagerVersion, "1.20.4");
    return modemMessage(LiveModemCode::modem, account);
}

std::optional<RecordBuilder> position(ModemReportContext& context) {
    const DictionaryRef account = modemAccount(context.phone);
    if (context.phone.isPresent() && context.phone.state >= MM::State::Searching) {
        const RadioNetwork& radio = context.network.radio();
        account->set(kVoxPositionLatitude, latitudeOf(radio.north_m()));
        account->set(kVoxPositionLongitude, longitudeOf(radio.east_m()));
        account->set(kVoxPositionAltitude, 12.5);
        using namespace std::chrono;
        const auto now =
            DriveScenario::startTime() + duration_cast<Time::duration>(duration<double>(context.now_s));
        const hh_mm_ss time(floor<milliseconds>(now - floor<days>(now)));
        char text[16];
        std::snprintf(text, sizeof text, "%02d%02d%02d.%02d", static_cast<int>(time.hours().count()),
                      static_cast<int>(time.minutes().count()), static_cast<int>(time.seconds().count()),
                      static_cast<int>(time.subseconds().count() / 10));
        account->set(kVoxPositionTime, text);
    }
    return modemMessage(LiveModemCode::position, account);
}

namespace {

constexpr ModemReport absentReports[] = {{4, cells}};

constexpr ModemReport offReports[] = {{4, cells}, {4, link}, {10, modem}};

constexpr ModemReport onReports[] = {{2, cells},     {2, link}, {2, traffic},       {2, position},
                                     {10, contexts}, {30, sim}, {10, registration}, {30, modem}};

constexpr ModemReport everyReport[] = {{0, modem}, {0, sim},      {0, registration}, {0, cells},
                                       {0, link},  {0, contexts}, {0, traffic},      {0, position}};

} // namespace

} // namespace modemReports

std::span<const ModemReport> reportsOf(const ModemPhone& phone) {
    if (!phone.isPresent())
        return modemReports::absentReports;
    if (phone.state < MM::State::Searching)
        return modemReports::offReports;
    return modemReports::onReports;
}

std::span<const ModemReport> allModemReports() {
    return modemReports::everyReport;
}

} // namespace velmora
