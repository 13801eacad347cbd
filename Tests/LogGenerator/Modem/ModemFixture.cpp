// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/ModemFixture.h"

#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/Hex.h"

namespace velmora {

Data modemMessage(std::uint32_t code, const Value& payload) {
    return recordOf(static_cast<std::uint16_t>(code - LogMessage::firstExtraCode),
                    *writeBinaryPropertyList(payload), LogMessage::extraType);
}

Data modemMessage(std::uint32_t code, std::initializer_list<Dictionary::Entry> entries) {
    return modemMessage(code, dictionary(entries));
}

Data cellMessage(std::initializer_list<Value> cells) {
    return modemMessage(LiveModemCode::cells, {{"kVoxModemPresence", 0},
                                               {"kVoxModemState", 8},
                                               {"kVoxModemCellReport", 0},
                                               {"kVoxModemNeighborReport", 0},
                                               {"kVoxCellMonitorCells", list(cells)}});
}

Value list(std::initializer_list<Value> values) {
    return std::make_shared<Array>(Array(values));
}

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(Dictionary(entries));
}

ModemFixture::ModemFixture() : DecoderFixture("Modem", kVoxLogChannelTechnology_Modem) {}

std::string ModemFixture::after(std::string_view section, std::initializer_list<Data> messages) {
    for (const Data& message : messages)
        update(message);
    return sectionNode(section);
}

std::string ModemFixture::sectionNode(std::string_view section) {
    return shown((*generator->display(state).asDictionary())[section]);
}

std::string ModemFixture::text(std::string_view section, std::string_view label) {
    const Value& node = (*generator->display(state).asDictionary())[section];
    const std::string* const found = (*node.asDictionary())[label].asString();
    return found ? *found : "(none)";
}

} // namespace velmora
